#pragma once

#include "registers/weekly_reports.h"

namespace kindrel::registers {

/// A report's figures as they are shown.
struct WeeklyTable
{
    enum class RowKind : quint8 { figures, section, summary };
    struct Row
    {
        QStringList texts; ///< A section has its heading alone.
        RowKind kind = RowKind::figures;
    };

    QStringList columns; ///< The first heads the names of the rows.
    int plain = 0;       ///< How many come before those that stand for all of them together.
    std::vector<Row> rows;
};

/// Each date's figure with a column for each category, then total, average, highest and lowest; or months or years with
/// a row for each category, head counts and money in sections of their own.
[[nodiscard]] WeeklyTable weekly_table(const WeeklyPlan& plan);

} // namespace kindrel::registers
