#pragma once

#include <QMarginsF>
#include <QSizeF>

#include <optional>

namespace kindrel::pages {

enum class Paper { a4, letter };
enum class Orientation { portrait, landscape };
enum class ColumnRule { none, hairline };

/// The sheet and how it is divided. All measures of this room are points, 1/72 inch.
struct PageSetup
{
    Paper paper = Paper::a4;
    Orientation orientation = Orientation::portrait;
    QMarginsF margins{42, 36, 42, 36};
    int columns = 1; ///< 1 to 4.
    qreal column_gap = 18;
    ColumnRule column_rule = ColumnRule::none;
    std::optional<QSizeF> sheet = {}; ///< The exact size as it lies, whatever paper and orientation say.

    [[nodiscard]] QSizeF size() const;
    [[nodiscard]] qreal body_width() const { return size().width() - margins.left() - margins.right(); }
    [[nodiscard]] qreal column_width() const { return (body_width() - (columns - 1) * column_gap) / columns; }

    bool operator==(const PageSetup&) const = default;
};

} // namespace kindrel::pages
