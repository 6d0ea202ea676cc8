#include "sample/setup_lists.h"

#include "sample/word_list.h"

#include <QHash>

#include <algorithm>
#include <stdexcept>

namespace kindrel::sample {

using namespace Qt::StringLiterals;

namespace {

using core::to_value;

struct AudienceAge
{
    QStringView name;
    int youngest, oldest;
};

constexpr int everybody = 130;
constexpr std::array audience_ages{
    AudienceAge{u"all", 0, everybody},     AudienceAge{u"infants", 0, 4},        AudienceAge{u"children", 5, 12},
    AudienceAge{u"youth", 13, 18},         AudienceAge{u"young adults", 19, 30}, AudienceAge{u"adults", 19, everybody},
    AudienceAge{u"women", 25, everybody},  AudienceAge{u"men", 25, everybody},   AudienceAge{u"seniors", 66, everybody},
    AudienceAge{u"couples", 0, everybody},
};

Audience audience_of(const QString& name)
{
    const auto found = std::ranges::find(audience_ages, name, &AudienceAge::name);
    if (found == audience_ages.end())
        throw std::logic_error("unknown audience " + name.toStdString());
    return static_cast<Audience>(found - audience_ages.begin());
}

/// One list: its file, its table and what is stored beside key and position.
struct ListTable
{
    const char *file, *table, *key, *text;
    core::Entity entity;
    const char* extra;
    core::Value (*extra_of)(const SetupItem& item);
    bool has_audience;
};

using core::Entity;

const std::array list_tables{
    ListTable{"statuses", "tbl_status_setup", "status_id", "status", Entity::status, nullptr, nullptr, true},
    ListTable{"groups", "tbl_group_setup", "group_id", "group", Entity::group, "not_active",
              [](const SetupItem& item) { return to_value(!SetupLists::meets(item)); }, true},
    ListTable{"ministries", "tbl_ministry_setup", "ministry_id", "ministry", Entity::ministry, nullptr, nullptr, true},
    ListTable{"personal_dates", "tbl_individual_date_setup", "in_date_id", "date_description", Entity::individual_date,
              nullptr, nullptr, true},
    ListTable{"flexi_fields", "tbl_flexi_setup", "flexi_id", "flexi", Entity::flexi, nullptr, nullptr, true},
    ListTable{"family_groups", "tbl_family_group_setup", "family_group_id", "family_group", Entity::family_group,
              nullptr, nullptr, true},
    ListTable{"family_dates", "tbl_family_date_setup", "fam_date_id", "date_description", Entity::family_date, nullptr,
              nullptr, true},
    ListTable{"titles", "tbl_title", "title_id", "Title", Entity::title, nullptr, nullptr, false},
    ListTable{"occupations", "tbl_occupation_setup", "occupation_id", "occupation", Entity::occupation, nullptr,
              nullptr, false},
    ListTable{"suburbs", "tbl_suburb_setup", "suburb_id", "suburb", Entity::suburb, "postcode",
              [](const SetupItem& item) { return to_value(item.more[0]); }, false},
};
static_assert(list_tables.size() == setup_list_count);

SetupItem item_from(const QStringList& columns, bool has_audience)
{
    if (!has_audience)
        return {.text = columns[0], .more = columns.mid(1)};
    return {
        .text = columns[0], .audience = audience_of(columns[1]), .share = columns[2].toInt(), .more = columns.mid(3)};
}

/// The keys of what the list holds already: a new church comes with titles.
QHash<QString, int> stored_items(core::Session& session, const ListTable& list)
{
    auto rows = session.select(u"SELECT [%1],[%2] FROM [%3];"_s.arg(
        QString::fromLatin1(list.key), QString::fromLatin1(list.text), QString::fromLatin1(list.table)));
    QHash<QString, int> stored;
    for (const core::Row& row : rows)
        stored.insert(row.text(core::Column{1}), row.integer(core::Column{0}));
    return stored;
}

std::vector<SetupItem> write_list(core::Session& session, const ListTable& list)
{
    std::vector<SetupItem> items;
    for (const auto& columns : read_list(QString::fromLatin1(list.file)))
        items.push_back(item_from(columns, list.has_audience));
    QStringList fields{QString::fromLatin1(list.key), QString::fromLatin1(list.text), u"position"_s};
    if (list.extra)
        fields += QString::fromLatin1(list.extra);
    const auto stored = stored_items(session, list);
    const auto is_stored = [&](const SetupItem& item) {
        return stored.contains(item.text);
    };
    const auto fresh = items.size() - static_cast<std::size_t>(std::ranges::count_if(items, is_stored));
    int key = fresh > 0 ? session.allocate(list.entity, static_cast<int>(fresh)) : 0;
    std::vector<std::vector<core::Value>> rows;
    for (auto& item : items) {
        item.key = is_stored(item) ? stored[item.text] : key++;
        if (is_stored(item))
            continue;
        rows.push_back({to_value(item.key), to_value(item.text), to_value(stored.size() + qsizetype(rows.size()) + 1)});
        if (list.extra)
            rows.back().push_back(list.extra_of(item));
    }
    session.insert(QString::fromLatin1(list.table), fields, rows);
    return items;
}

} // namespace

bool is_for(Audience audience, int age, bool female)
{
    const auto& ages = audience_ages[static_cast<std::size_t>(audience)];
    const bool wrong_sex = (audience == Audience::women && !female) || (audience == Audience::men && female);
    return !wrong_sex && age >= ages.youngest && age <= ages.oldest;
}

SetupLists::SetupLists(core::Session& session)
{
    std::ranges::transform(list_tables, m_items.begin(),
                           [&](const ListTable& list) { return write_list(session, list); });
}

void write_titles(core::Session& session)
{
    write_list(session, list_tables[static_cast<std::size_t>(SetupList::titles)]);
}

} // namespace kindrel::sample
