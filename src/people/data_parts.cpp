#include "people/data_parts.h"

namespace kindrel::people {

namespace {

using core::Area;

constexpr auto details = "tbl_personal_details";
constexpr auto address = "tbl_address";
constexpr auto residential = "a.[res_hidden]";
constexpr auto postal = "a.[post_hidden]";

constexpr DataPart detail(const char* name, const char* column, const char* hidden)
{
    return {.name = name, .owner = DataOwner::person, .table = details, .columns = {{{column}}}, .hidden = hidden};
}

constexpr DataPart of_family(const char* name, const char* column, const char* hidden)
{
    return {.name = name, .owner = DataOwner::family, .table = address, .columns = {{{column}}}, .hidden = hidden};
}

constexpr DataPart files(const char* name, DataOwner owner, DataFiles kind, std::optional<Area> right = {})
{
    return {.name = name, .owner = owner, .right = right, .files = kind};
}

/// A suburb of the family with the postcode that holds; `only` says which one.
constexpr DataPart suburb(const char* name, const char* only, const char* hidden)
{
    return {.name = name,
            .owner = DataOwner::family,
            .table = "Qry_suburb_load",
            .columns = {{{"suburb"}, {"postcode_used"}}},
            .hidden = hidden,
            .only = only,
            .joint = " "};
}

constexpr std::array parts{
    detail("Title", "Title", "d.[Title_hidden]"),
    DataPart{.name = "Birth Date",
             .owner = DataOwner::person,
             .table = details,
             .columns = {{{"birthdate", DataForm::date}}},
             .hidden = "d.[birthdate_hidden]",
             .right = Area::birth_dates},
    DataPart{.name = "Preferred Given Name",
             .owner = DataOwner::person,
             .table = "tbl_people",
             .columns = {{{"preferred_name"}}},
             .hidden = "p.[Preferred_Name_hidden]"},
    detail("Middle Name", "middle_name", "d.[middle_hidden]"),
    detail("Other Surname", "other_surname", "d.[surname_hidden]"),
    DataPart{.name = "School Year",
             .owner = DataOwner::person,
             .table = details,
             .columns = {{{"school_year", DataForm::number}}}},
    detail("Personal Mobile Phone", "mobile_phone", "d.[mobile_hidden]"),
    detail("Personal E-mail", "Personal_email", "d.[email_hidden]"),
    detail("Business Phone", "business_phone", "d.[bussiness_phone_hidden]+d.[Bussiness_hidden]"),
    detail("Business Fax", "business_fax", "d.[Bussiness_fax_hidden]+d.[Bussiness_hidden]"),
    detail("Business E-mail", "business_email", "d.[bussiness_email_hidden]+d.[Bussiness_hidden]"),
    DataPart{.name = "Occupation",
             .owner = DataOwner::person,
             .table = "qry_occupation_load",
             .columns = {{{"occupation"}}},
             .hidden = "d.[Bussiness_hidden]",
             .order = "position"},
    DataPart{.name = "Status",
             .owner = DataOwner::person,
             .table = "qry_status_load",
             .columns = {{{"status"}}},
             .order = "s_position"},
    DataPart{.name = "Groups",
             .owner = DataOwner::person,
             .table = "qry_group_load",
             .columns = {{{"group"}}},
             .order = "g_position"},
    DataPart{.name = "Group History",
             .owner = DataOwner::person,
             .table = "qry_group_history",
             .columns = {{{"group"}, {"date_in", DataForm::date}, {"date_out", DataForm::date}}},
             .order = "history_id",
             .joint = " \u2013 "},
    DataPart{.name = "Ministries",
             .owner = DataOwner::person,
             .table = "qry_ministry_load",
             .columns = {{{"ministry_type", DataForm::ministry_state}, {"ministry"}}},
             .order = "m_position",
             .joint = ""},
    DataPart{.name = "Personal Dates",
             .owner = DataOwner::person,
             .table = "qry_individual_date_load",
             .columns = {{{"date_description"}, {"in_date", DataForm::date}}},
             .order = "position"},
    DataPart{.name = "Flexi Fields",
             .owner = DataOwner::person,
             .table = "qry_flexi_load",
             .columns = {{{"flexi"}, {"flexi_field"}}},
             .order = "position"},
    DataPart{.name = "P.I.N.",
             .owner = DataOwner::person,
             .table = "tbl_pin",
             .columns = {{{"personal_pin"}}},
             .right = Area::pin_financial_only},
    files("Portraits", DataOwner::person, DataFiles::portraits),
    files("Personal Notes", DataOwner::person, DataFiles::notebook, Area::personal_notes_in_notebook),
    of_family("Residential Street", "res_street", residential),
    of_family("Residential Street, Second Line", "res_street2", residential),
    suburb("Residential Suburb", "v.[Type]=1", residential),
    of_family("Residential State", "res_state", residential),
    of_family("Residential Country", "res_country", residential),
    DataPart{.name = "Map",
             .owner = DataOwner::family,
             .table = address,
             .columns = {{{"res_map"}, {"res_ref"}}},
             .hidden = residential,
             .joint = " "},
    of_family("Postal Street", "post_street", postal),
    of_family("Postal Street, Second Line", "post_street2", postal),
    suburb("Postal Suburb", "v.[Type]=2", postal),
    of_family("Postal State", "post_state", postal),
    of_family("Postal Country", "post_country", postal),
    of_family("Family Phone", "phone", "a.[phone_hidden]"),
    of_family("Family Fax", "family_fax", "a.[family_fax_hidden]"),
    of_family("Family Mobile Phone", "family_mobile", "a.[family_mobile_hidden]"),
    DataPart{.name = "Family E-mail",
             .owner = DataOwner::family,
             .table = address,
             .columns = {{{"family_email"}, {"family_email_description"}}},
             .hidden = "a.[family_email_hidden]",
             .joint = ", "},
    DataPart{.name = "Other Contacts",
             .owner = DataOwner::family,
             .table = "tbl_other_contact",
             .columns = {{{"contact"}, {"phone"}}},
             .order = "position"},
    DataPart{.name = "Family Groups",
             .owner = DataOwner::family,
             .table = "qry_family_group_load",
             .columns = {{{"family_group"}}},
             .order = "f_position"},
    DataPart{.name = "Family Dates",
             .owner = DataOwner::family,
             .table = "qry_family_date_load",
             .columns = {{{"date_description"}, {"family_date", DataForm::date}}},
             .order = "position"},
    DataPart{.name = "Events",
             .owner = DataOwner::family,
             .table = "Qry_events_load",
             .columns = {{{"event_date", DataForm::date}, {"event"}}},
             .order = "e_position"},
    DataPart{.name = "Visitation",
             .owner = DataOwner::family,
             .table = "tbl_visitation",
             .columns = {{{"date", DataForm::date}, {"visitor"}, {"comments"}}},
             .order = "date",
             .right = Area::visitation_tab},
    DataPart{.name = "Audio Note", .owner = DataOwner::family, .table = address, .columns = {{{"audio_note"}}}},
    DataPart{.name = "Booked Out",
             .owner = DataOwner::family,
             .table = "tbl_surname",
             .columns = {{{"booked_out_person"}, {"booked_out_date", DataForm::date}}},
             .only = "v.[booked_out]<>0"},
    files("Family Notes", DataOwner::family, DataFiles::notebook, Area::family_file_notebook),
    files("Family Portraits", DataOwner::family, DataFiles::portraits),
};

} // namespace

std::span<const DataPart> data_parts()
{
    return parts;
}

} // namespace kindrel::people
