#include "people/setup_lists.h"

#include "people/setup_rows.h"

#include <QHash>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

using core::Entity;
using enum SetupKind;

constexpr std::array<SetupList, setup_list_count> all{{
    {status,
     u"Status",
     "tbl_status_setup",
     "status_id",
     "status",
     nullptr,
     "Qry_status_list",
     Entity::status,
     {"tbl_status", "person_id", "status_id", false}},
    {groups,
     u"Groups",
     "tbl_group_setup",
     "group_id",
     "group",
     "not_active",
     "Qry_group_setup",
     Entity::group,
     {"tbl_group", "person_id", "group_id", false}},
    {ministries,
     u"Ministries",
     "tbl_ministry_setup",
     "ministry_id",
     "ministry",
     nullptr,
     "Qry_ministry_list",
     Entity::ministry,
     {"tbl_ministry", "person_id", "ministry_id", false}},
    {personal_dates,
     u"Personal Dates",
     "tbl_individual_date_setup",
     "in_date_id",
     "date_description",
     nullptr,
     "Qry_individual_date_list",
     Entity::individual_date,
     {"tbl_individual_date", "person_id", "in_date_id", false}},
    {flexi_fields,
     u"Flexi Fields",
     "tbl_flexi_setup",
     "flexi_id",
     "flexi",
     nullptr,
     "Qry_flexi_list",
     Entity::flexi,
     {"tbl_flexi", "person_id", "flexi_id", false}},
    {family_groups,
     u"Family Groups",
     "tbl_family_group_setup",
     "family_group_id",
     "family_group",
     nullptr,
     "Qry_family_group_list",
     Entity::family_group,
     {"tbl_family_group", "surname_id", "family_group_id", false}},
    {family_dates,
     u"Family Dates",
     "tbl_family_date_setup",
     "fam_date_id",
     "date_description",
     nullptr,
     "Qry_family_date_list",
     Entity::family_date,
     {"tbl_family_date", "surname_id", "family_date_id", false}},
    {titles,
     u"Titles",
     "tbl_title",
     "title_id",
     "Title",
     nullptr,
     "Qry_title_list",
     Entity::title,
     {"tbl_personal_details", "person_id", "Title", true}},
    {occupations,
     u"Occupations",
     "tbl_occupation_setup",
     "occupation_id",
     "occupation",
     nullptr,
     "Qry_occupation_list",
     Entity::occupation,
     {"tbl_occupation", "person_id", "occupation_id", false}},
    {suburbs,
     u"Suburbs",
     "tbl_suburb_setup",
     "suburb_id",
     "suburb",
     "postcode",
     "Qry_suburb_list",
     Entity::suburb,
     {"tbl_suburb", "surname_id", "suburb_id", false}},
}};

/// How many people or families carry each item, by what the carriers store of it.
QHash<QString, int> count_users(core::Session& session, const Carriers& carriers)
{
    auto rows =
        session.select(u"SELECT [%1],COUNT(DISTINCT [%2]) FROM [%3] WHERE [%1] IS NOT NULL GROUP BY [%1];"_s.arg(
            QString::fromLatin1(carriers.item), QString::fromLatin1(carriers.owner),
            QString::fromLatin1(carriers.table)));
    QHash<QString, int> users;
    for (const core::Row& row : rows)
        users.insert(row.text(core::Column{0}), row.integer(core::Column{1}));
    return users;
}

} // namespace

bool SetupList::of_families() const
{
    return QLatin1StringView(carriers.owner) == "surname_id"_L1;
}

std::span<const SetupList> setup_lists()
{
    return all;
}

const SetupList& setup_list(SetupKind kind)
{
    return all[static_cast<std::size_t>(kind)];
}

std::vector<SetupItem> read_setup_items(core::Session& session, SetupKind kind)
{
    std::vector<SetupItem> items;
    for (auto& row : read_setup_rows(session, setup_list(kind)))
        items.push_back(std::move(row.item));
    return items;
}

std::vector<SetupItem> read_setup_items_with_users(core::Session& session, SetupKind kind)
{
    const auto& carriers = setup_list(kind).carriers;
    auto items = read_setup_items(session, kind);
    const auto users = count_users(session, carriers);
    for (auto& item : items)
        item.users = users.value(carriers.by_text ? item.text : QString::number(item.key));
    return items;
}

QString tidy(const QString& text)
{
    return text.normalized(QString::NormalizationForm_C).trimmed();
}

int faulty_field(SetupKind kind, const QString& text, const QString& postcode)
{
    const auto fits = [](const QString& typed) {
        const auto size = tidy(typed).size();
        return size > 0 && size <= longest_setup_text;
    };
    return kind == SetupKind::suburbs && fits(text) && !fits(postcode) ? 1 : 0;
}

QString sameness(const QString& text, const QString& postcode)
{
    return tidy(text).toUpper() + u'\n' + tidy(postcode).toUpper();
}

} // namespace kindrel::people
