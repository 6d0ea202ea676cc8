#pragma once

#include "core/office.h"
#include "pages/page_setup.h"
#include "pages/style.h"

#include <QRectF>

namespace kindrel::output {

/// Where the labels stand on their sheet, all in tenths of a millimetre.
struct LabelGrid
{
    int page_width = 2100, page_height = 2970;
    int columns = 1, rows = 1;
    int width = 0, height = 0; ///< Of a label.
    int column_gap = 0, row_gap = 0;
    int left_margin = 0, top_margin = 0;
    int start = 1; ///< The first label that is printed on; those before it are used already. Row by row.

    [[nodiscard]] int labels() const { return columns * rows; }
    /// In points: the sheet, and the label at `place`, counted from 0.
    [[nodiscard]] QSizeF sheet() const;
    [[nodiscard]] QRectF label(int place) const;

    friend bool operator==(const LabelGrid&, const LabelGrid&) = default;
};

struct LabelFont
{
    QString family = QStringLiteral("Arial");
    int size = 10; ///< In points.
    bool bold = false, italic = false;

    [[nodiscard]] pages::TextStyle style() const { return {family, qreal(size), bold, italic}; }
    friend bool operator==(const LabelFont&, const LabelFont&) = default;
};

struct LabelSheet
{
    LabelGrid grid;
    LabelFont name, address;

    friend bool operator==(const LabelSheet&, const LabelSheet&) = default;
};

struct TagSheet
{
    LabelGrid grid;
    LabelFont given_name, surname, church;
    bool shows_church = true, shows_border = false;

    friend bool operator==(const TagSheet&, const TagSheet&) = default;
};

/// How mailing labels and name tags are printed.
struct LabelSetup
{
    LabelSheet labels;
    TagSheet tags;

    friend bool operator==(const LabelSetup&, const LabelSetup&) = default;
};

/// As the office holds it.
[[nodiscard]] LabelSetup load_label_setup(const core::Office& office);
/// As the file holds it, which another workstation may have written; the office has it from then on. Throws
/// core::FileError.
[[nodiscard]] LabelSetup reload_label_setup(core::Office& office);
/// Writes the parts that differ from what the office holds, among those that other workstations wrote meanwhile, and
/// gives the whole to the office. False when the setup's numbers cannot be printed, which the person has been told, or
/// may not be changed. Throws core::FileError when the file cannot be written.
[[nodiscard]] bool save_label_setup(core::Office& office, const LabelSetup& setup);

/// Why something cannot be printed.
struct LabelFault
{
    QString text = {};  ///< One sentence; empty when it can.
    QString field = {}; ///< Whose number is wrong, by its stored name without that of the sheet or text it belongs to.

    explicit operator bool() const { return !text.isEmpty(); }
};

[[nodiscard]] LabelFault fault_of(const LabelGrid& grid);
[[nodiscard]] LabelFault fault_of(const LabelFont& font);
/// The first fault of all parts, its field by the whole stored name.
[[nodiscard]] LabelFault fault_of(const LabelSetup& setup);

} // namespace kindrel::output
