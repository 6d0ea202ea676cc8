#pragma once

#include "output/custom/custom_layout.h"
#include "output/list_reader.h"
#include "people/setup_lists.h"

#include <span>
#include <variant>

namespace kindrel::output {

/// What a giver gave in the period of a receipt, in words, as the room that keeps the giving shows amounts and days.
struct ReceiptFacts
{
    QString project, from, to, total;
    int gifts = 0;
    QStringList gift_list = {}; ///< A line for each gift.
};

/// What a run knows beside the register.
struct RunFacts
{
    QDate today;
    QString shown_today, church_name, title, filters;
    QString group = {};   ///< The heading of the present group.
    int number = 0;       ///< Of the entry, counted from 1 in each group.
    int family_count = 0; ///< Of the group at its end, of the whole report at the end.
    int person_count = 0; ///< Likewise.
    int page = 0;         ///< In headers and footers.
};

/// Where the values of fields come from; null where a section has nothing of the kind.
struct FieldSource
{
    const RunFacts& run;
    const people::DisclosedFamily* family = nullptr;
    const people::Household* household = nullptr;
    const people::Person* person = nullptr;
    const ReceiptFacts* receipt = nullptr;
};

/// One value of a field. Lists have several.
struct FieldValue
{
    QString text;
    QString item = {};                  ///< Of a list's value: what it stands under.
    QString bare = {};                  ///< What stands there, without the item.
    int place = 0;                      ///< Orders groups by value: the item's key, or a number.
    std::optional<core::Date> day = {}; ///< Orders groups of one place.
};
using FieldValues = std::vector<FieldValue>;

/// What a field is about, and so in which sections it can stand.
enum class FieldScope { run, group, totals, page, family, person, receipt };

/// A name that a layout may print. Stored fields bear their stored names.
struct CustomField
{
    /// What is stored, or a function where that is not all.
    using Reader =
        std::variant<QString RunFacts::*, int RunFacts::*, QString ReceiptFacts::*, int ReceiptFacts::*,
                     QStringList ReceiptFacts::*, QString people::Family::*,
                     std::optional<core::Date> people::Family::*, QString people::Address::*, QString people::Person::*,
                     int people::Person::*, bool people::Person::*, std::optional<core::Date> people::Person::*,
                     std::vector<people::LinkRow> people::Person::*, std::vector<people::LinkRow> people::FamilyFile::*,
                     FieldValues (*)(const FieldSource&)>;
    const char* name;
    const char* words; ///< What it is, for the person who lays out.
    FieldScope scope;
    people::Extent extent;
    Reader read;
    bool items = false;                         ///< Whether one item of the list can be asked for.
    std::optional<people::SetupKind> list = {}; ///< Orders the groups by this list.
    bool with_and = false;                      ///< Several values are joined as "Cid, Dot & Eve".
};

[[nodiscard]] std::span<const CustomField> custom_fields();
/// Without regard to case. The merge fields of letters are found by their names too. Null when there is none.
[[nodiscard]] const CustomField* find_custom_field(const QString& name);
[[nodiscard]] QStringList custom_field_names();

/// The values that the field has here; empty texts are none.
[[nodiscard]] FieldValues values_of(const CustomField& field, const QString& item, const FieldSource& source);
/// All the field's values in one text; empty for a field that there is none of.
[[nodiscard]] QString text_of(const LayoutField& field, const FieldSource& source);

} // namespace kindrel::output
