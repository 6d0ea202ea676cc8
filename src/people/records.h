#pragma once

#include "core/date.h"

#include <QString>

#include <optional>
#include <vector>

namespace kindrel::people {

enum class FileStatus { active = 0, privacy = 1, prospect = 2, archive = 3 };
enum class SuburbType { residential = 1, postal = 2 };
enum class MinistryState { active = 1, potential = 2 };

inline constexpr int most_people = 17;

/// One row of `tbl_surname`. Plain data: no rules, no database.
struct Family
{
    int Surname_ID = 0; ///< 0 until the first save.
    QString surname;
    QString Primary_name; ///< Given name at position 1, never with a marker.
    FileStatus Condition = FileStatus::active;
    std::optional<core::Date> created; ///< Unset on files older than the field.
    std::optional<core::Date> last_edit;
    bool booked_out = false;
    std::optional<core::Date> booked_out_date;
    QString booked_out_person;
    bool active_in_book = false;

    friend bool operator==(const Family&, const Family&) = default;
};

/// One row of `tbl_address`, without its key.
struct Address
{
    QString res_street, res_street2, res_state, res_country, res_map, res_ref;
    QString post_street, post_street2, post_state, post_country;
    QString phone, family_fax, family_mobile, family_email, family_email_description;
    bool res_hidden = false, post_hidden = false, phone_hidden = false;
    bool family_fax_hidden = false, family_email_hidden = false, family_mobile_hidden = false;
    bool transfer_exists = false;
    QString audio_note;

    friend bool operator==(const Address&, const Address&) = default;
};

/// A family's suburb. The texts are read from the suburb list; only key, type and `postcode_var` are stored.
struct Suburb
{
    int suburb_id = 0;
    SuburbType Type = SuburbType::residential;
    QString postcode_var; ///< A postcode that differs from the suburb's own.
    QString suburb;
    QString postcode;

    /// The postcode that is shown and printed.
    [[nodiscard]] QString shown_postcode() const { return postcode_var.isEmpty() ? postcode : postcode_var; }
    friend bool operator==(const Suburb&, const Suburb&) = default;
};

struct OtherContact
{
    QString contact; ///< The contact method.
    QString phone;
    friend bool operator==(const OtherContact&, const OtherContact&) = default;
};

struct Event
{
    std::optional<core::Date> event_date;
    QString event;
    friend bool operator==(const Event&, const Event&) = default;
};

struct Visit
{
    std::optional<core::Date> date;
    QString visitor;
    QString comments;
    friend bool operator==(const Visit&, const Visit&) = default;
};

/// One item that a person or a family carries. Which of the values a kind uses stands in its link table's row.
struct LinkRow
{
    int item = 0;                   ///< Key of the setup item.
    QString text;                   ///< The item's text, joined in; never stored.
    int type = 0;                   ///< Ministries: a MinistryState.
    std::optional<core::Date> date; ///< Dates.
    QString field;                  ///< Flexi fields: the value.
    bool tagged = false;            ///< Dates and flexi fields: marked for filters and reports.
    friend bool operator==(const LinkRow&, const LinkRow&) = default;
};

/// `tbl_people` and `tbl_personal_details` of one person, with everything the person carries. The place in the
/// family's list is the person's `position`.
struct Person
{
    int person_id = 0; ///< 0 until the first save.
    int Surname_ID = 0;
    QString Name;
    int position = 0; ///< As read; rewritten without gaps on save.
    int Marital = 0;  ///< Adults 1 to 4 and 8 to 15, children 5 to 7.
    QString preferred_name;
    bool Preferred_Name_hidden = false;
    bool Active = false, Decease = false, Privacy = false, Prospect = false, archive = false, contact = false;

    QString Title;
    std::optional<core::Date> birthdate;
    std::optional<int> school_year; ///< Never 0: 1 upwards for school years, -1 the year before, -2 kinder.
    QString middle_name, other_surname;
    QString mobile_phone, Personal_email;
    QString business_phone, business_fax, business_email;
    bool Title_hidden = false, birthdate_hidden = false, middle_hidden = false, surname_hidden = false;
    bool mobile_hidden = false, email_hidden = false;
    bool bussiness_phone_hidden = false, Bussiness_fax_hidden = false, bussiness_email_hidden = false;
    bool Bussiness_hidden = false;
    QString personal_pin;

    std::vector<LinkRow> status, groups, ministries, flexi, dates, occupations;

    friend bool operator==(const Person&, const Person&) = default;
};

/// `tbl_record_access`: which sections of a family's record are open. A missing row means that all are.
struct RecordAccess
{
    bool Address = true, Details = true, status = true, groups = true, ministry = true, date = true, flexi = true;
    bool contact = true, visitation = true, family_group = true, family_date = true, occupation = true;
    bool events = true, pin = true;
    friend bool operator==(const RecordAccess&, const RecordAccess&) = default;
};

/// A family with everything that hangs on it: what the editor holds and a save writes.
struct FamilyFile
{
    Family family;
    Address address;
    std::optional<Suburb> residential, postal;
    std::vector<OtherContact> other_contacts;
    std::vector<Event> events;
    std::vector<Visit> visits;
    std::vector<LinkRow> family_groups, family_dates;
    RecordAccess access;
    std::vector<Person> people; ///< In order of position.

    friend bool operator==(const FamilyFile&, const FamilyFile&) = default;
};

} // namespace kindrel::people
