#include "registers/weekly_register.h"

#include <QHash>

#include <algorithm>

namespace kindrel::registers {

using namespace Qt::StringLiterals;

namespace {

using core::to_value;
using Figures = QHash<int, core::Amount>;

/// Of a date, by category.
Figures read_figures(core::Session& session, int date_key)
{
    auto rows = session.select(u"SELECT * FROM [tbl_weekly_amount] WHERE [date_id]=?;"_s, date_key);
    const auto category = rows.column(u"group_id");
    const auto amount = rows.column(u"amount");
    Figures figures;
    for (const core::Row& row : rows)
        figures.insert(row.integer(category), row.amount(amount));
    return figures;
}

std::optional<core::Amount> figure_of(const Figures& figures, int category)
{
    const auto found = figures.find(category);
    return found == figures.end() ? std::nullopt : std::optional(*found);
}

} // namespace

std::vector<Category> read_categories(core::Session& session, int project)
{
    auto rows = session.select(u"SELECT [group_id],[group],[group_type] FROM [qry_weekly_load_groups] "
                               "WHERE [weekly_project_id]=? ORDER BY [group_type],[position],[group_id];"_s,
                               project);
    std::vector<Category> categories;
    for (const core::Row& row : rows)
        categories.push_back({row.integer(core::Column{0}), row.text(core::Column{1}),
                              static_cast<FigureKind>(row.integer(core::Column{2}))});
    return categories;
}

std::optional<core::Date> WeeklyRegister::last_date() const
{
    const auto* before = date_before();
    return before ? std::optional(before->date) : std::nullopt;
}

const RegisterDate* WeeklyRegister::date_before() const
{
    if (!open_date())
        return nullptr;
    const auto found =
        std::ranges::find_if(dates(), [this](const RegisterDate& each) { return each.date < open_date()->date; });
    return found == dates().end() ? nullptr : &*found;
}

bool WeeklyRegister::enter_figure(int row, const QString& typed)
{
    auto& line = m_rows.at(static_cast<std::size_t>(row));
    const auto read = read_figure(typed, line.category.kind);
    if (!read.refusal.isEmpty())
        return refuse(read.refusal);
    line.figure = read.figure;
    return true;
}

core::Amount WeeklyRegister::total(FigureKind kind) const
{
    core::Amount total;
    for (const auto& row : m_rows) {
        if (row.category.kind == kind && row.figure)
            total.ten_thousandths += row.figure->ten_thousandths;
    }
    return total;
}

bool WeeklyRegister::altered() const
{
    return !std::ranges::equal(m_rows, m_stored, {}, &WeeklyRow::figure, &WeeklyRow::figure);
}

void WeeklyRegister::load_rows()
{
    const auto figures = read_figures(session(), open_date()->key);
    std::vector<WeeklyRow> rows;
    for (auto& category : read_categories(session(), project())) {
        const auto figure = figure_of(figures, category.key);
        rows.push_back({std::move(category), figure, {}});
    }
    m_rows = std::move(rows);
    load_last();
    m_stored = m_rows;
}

void WeeklyRegister::load_last()
{
    const auto* before = date_before();
    const auto figures = before ? read_figures(session(), before->key) : Figures();
    for (auto& row : m_rows)
        row.last = figure_of(figures, row.category.key);
}

void WeeklyRegister::save_rows()
{
    const int date_key = open_date()->key;
    std::vector<std::vector<core::Value>> changed, written;
    for (std::size_t i = 0; i < m_rows.size(); ++i) {
        const auto& row = m_rows[i];
        if (row.figure == m_stored[i].figure)
            continue;
        changed.push_back({to_value(row.category.key)});
        if (row.figure)
            written.push_back({to_value(date_key), to_value(row.category.key), to_value(*row.figure)});
    }
    session().fill_temporary(u"work_weekly"_s, {u"group_id"_s}, changed);
    session().execute(u"DELETE FROM [tbl_weekly_amount] WHERE [date_id]=? AND [group_id] IN "
                      "(SELECT [group_id] FROM [work_weekly]);"_s,
                      date_key);
    session().insert(u"tbl_weekly_amount"_s, {u"date_id"_s, u"group_id"_s, u"amount"_s}, written);
}

void WeeklyRegister::clear_rows()
{
    m_rows.clear();
    m_stored.clear();
}

bool WeeklyRegister::setup_unchanged()
{
    return std::ranges::equal(read_categories(session(), project()), m_rows, {}, &Category::key,
                              [](const WeeklyRow& row) { return row.category.key; });
}

} // namespace kindrel::registers
