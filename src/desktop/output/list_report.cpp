#include "desktop/output/list_report.h"

#include "core/entry.h"
#include "core/progress_run.h"
#include "desktop/output/preview_window.h"
#include "output/decoration.h"
#include "pages/table.h"

#include <QAbstractItemModel>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int rows_per_step = 50;

std::vector<pages::TableColumn> columns_of(const QAbstractItemModel& model)
{
    std::vector<pages::TableColumn> columns;
    for (int column = 0; column < model.columnCount(); ++column)
        columns.push_back({.heading = model.headerData(column, Qt::Horizontal).toString()});
    return columns;
}

/// The list as it stood when it was asked for: it may be narrowed while the pages are made.
std::vector<QStringList> rows_of(const QAbstractItemModel& model)
{
    std::vector<QStringList> rows(std::size_t(model.rowCount()));
    for (int row = 0; row < model.rowCount(); ++row)
        for (int column = 0; column < model.columnCount(); ++column)
            rows[std::size_t(row)] << model.index(row, column).data().toString();
    return rows;
}

bool write_rows(pages::Table& table, const std::vector<QStringList>& rows, core::Progress& progress)
{
    int written = 0;
    for (const QStringList& row : rows) {
        table.row(row);
        if (++written % rows_per_step == 0 && !progress.step())
            return false;
    }
    return true;
}

} // namespace

void print_list(Desk& desk, const QString& title, const QAbstractItemModel& model)
{
    if (!core::permitted(desk.office, core::Area::report_outputs))
        return;
    const auto write = [&office = desk.office, title, columns = columns_of(model),
                        rows = rows_of(model)](core::Progress& progress, pages::PageSpool& spool) {
        pages::Flow flow(spool, {});
        output::decorate(flow, title, {office, people::WorkingList{}});
        const core::ProgressRun run(progress, title, int(rows.size()) / rows_per_step,
                                    u"Are you sure that you wish to cancel this report?"_s);
        {
            pages::Table table(flow, columns);
            if (!write_rows(table, rows, progress))
                return false;
        }
        flow.finish();
        return true;
    };
    open_preview(desk, title, write);
}

} // namespace kindrel::desktop
