#include "sample/registers.h"

#include "sample/chance.h"
#include "sample/word_list.h"

namespace kindrel::sample {

using namespace Qt::StringLiterals;

namespace {

using core::Entity;
using core::to_value;
using RowList = std::vector<std::vector<core::Value>>;

constexpr int weeks = 104;
constexpr int note_every = 13;
constexpr quint64 stream_of_registers = 0x5245474953544552; ///< No family has so high a number.

/// One register's table of projects.
struct ProjectTable
{
    const char16_t *name, *table, *key, *text;
    Entity entity;
};
constexpr std::array project_tables{
    ProjectTable{u"roll", u"tbl_roll_project", u"roll_project_id", u"roll_project", Entity::roll_project},
    ProjectTable{u"finance", u"tbl_finance_project", u"finance_project_id", u"finance_project",
                 Entity::finance_project},
    ProjectTable{u"weekly", u"tbl_weekly_project", u"weekly_project_id", u"weekly_project", Entity::weekly_project},
};

QStringList parts_of(const QStringList& columns, int column)
{
    QStringList parts = columns.value(column).split(u',', Qt::SkipEmptyParts);
    for (auto& part : parts)
        part = part.trimmed();
    return parts;
}

void write_roll_setup(core::Session& session, int project, const QStringList& columns)
{
    QStringList fields{u"roll_project_id"_s};
    std::vector<core::Value> row{to_value(project)};
    const auto services = parts_of(columns, 2);
    for (int i = 0; i < services.size(); ++i) {
        fields += u"service%1"_s.arg(i + 1);
        row.push_back(to_value(services[i]));
    }
    const auto absences = parts_of(columns, 3);
    for (int i = 0; i < absences.size(); ++i) {
        const bool counts = absences[i].startsWith(u'+');
        fields += {u"absent%1"_s.arg(i + 1), u"include%1"_s.arg(i + 1)};
        row.push_back(to_value(absences[i].mid(counts)));
        row.push_back(to_value(counts));
    }
    session.insert(u"tbl_roll_setup"_s, fields, std::array{row});
}

/// The key of the last project of the register.
int write_projects(core::Session& session, const ProjectTable& table)
{
    RowList rows;
    int key = 0;
    for (const auto& columns : read_list(u"projects"_s)) {
        if (columns[0] != QStringView(table.name))
            continue;
        key = session.allocate(table.entity);
        rows.push_back({to_value(key), to_value(columns[1]), to_value(rows.size() + 1)});
        if (table.entity == Entity::roll_project)
            write_roll_setup(session, key, columns);
    }
    session.insert(QString::fromUtf16(table.table),
                   {QString::fromUtf16(table.key), QString::fromUtf16(table.text), u"position"_s}, rows);
    return key;
}

/// What is counted each week, and how much of it.
struct WeeklyCategory
{
    int key;
    bool money;
    int usual, spread, share;
};

std::vector<WeeklyCategory> write_categories(core::Session& session, int project)
{
    const auto lines = read_list(u"weekly_categories"_s);
    int key = session.allocate(Entity::weekly_group, static_cast<int>(lines.size()));
    std::vector<WeeklyCategory> categories;
    RowList rows;
    std::array<int, 2> positions{};
    for (const auto& columns : lines) {
        const bool money = columns[0] == u"money";
        categories.push_back({key, money, columns[2].toInt(), columns[3].toInt(), columns[4].toInt()});
        rows.push_back({to_value(key++), to_value(columns[1]), to_value(++positions[money]), to_value(money ? 2 : 1),
                        to_value(project)});
    }
    session.insert(u"tbl_weekly_group"_s,
                   {u"group_id"_s, u"group"_s, u"position"_s, u"group_type"_s, u"weekly_project_id"_s}, rows);
    return categories;
}

/// Fuller around Easter and Christmas, thinner in the summer holidays.
int season(const QDate& day)
{
    constexpr std::array percents{80, 92, 104, 112, 103, 100, 97, 99, 101, 102, 103, 118};
    return percents[static_cast<std::size_t>(day.month() - 1)];
}

core::Amount figure(const WeeklyCategory& category, const QDate& day, Chance& chance)
{
    const int steps = category.money ? 100 : 1;
    const qint64 number = category.usual * steps + chance.between(-category.spread * steps, category.spread * steps);
    return {number * season(day) / 100 * (category.money ? 100 : 10000)};
}

void write_weeks(core::Session& session, int project, const QDate& today, Chance& chance)
{
    const auto categories = write_categories(session, project);
    const auto notes = read_words(u"weekly_notes"_s);
    const int first_key = session.allocate(Entity::weekly_date, weeks);
    const QDate last = today.addDays(-(today.dayOfWeek() % 7));
    RowList dates, figures, memos;
    for (int week = 0; week < weeks; ++week) {
        const int key = first_key + week;
        const QDate day = last.addDays(-7 * (weeks - 1 - week));
        dates.push_back({to_value(key), to_value(core::Date::from(day)), to_value(project)});
        for (const auto& category : categories) {
            const auto amount = figure(category, day, chance);
            const bool counted = chance.percent(category.share);
            if (counted && amount > core::Amount{})
                figures.push_back({to_value(key), to_value(category.key), to_value(amount)});
        }
        if (week % note_every == note_every - 1)
            memos.push_back({to_value(key), to_value(chance.pick(notes))});
    }
    session.insert(u"tbl_weekly_date"_s, {u"weekly_date_id"_s, u"weekly_date"_s, u"weekly_project_id"_s}, dates);
    session.insert(u"tbl_weekly_amount"_s, {u"date_id"_s, u"group_id"_s, u"amount"_s}, figures);
    session.insert(u"tbl_weekly_memo"_s, {u"weekly_date_id"_s, u"Notes"_s}, memos);
}

} // namespace

void write_registers(core::Session& session, const QDate& today, quint32 seed)
{
    int project = 0;
    for (const auto& table : project_tables)
        project = write_projects(session, table);
    Chance chance(seed, stream_of_registers);
    write_weeks(session, project, today, chance);
}

} // namespace kindrel::sample
