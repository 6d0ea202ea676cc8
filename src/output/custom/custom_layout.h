#pragma once

#include "core/paths.h"
#include "pages/page_setup.h"
#include "pages/style.h"

#include <QStringList>

#include <array>
#include <optional>
#include <vector>

namespace kindrel::output {

/// What an entry of a layout is about. Receipts are filled for people with what they gave.
enum class LayoutKind { families, people, receipts };

/// The sections of a layout, in the order in which they are written.
enum class LayoutPlace { page_header, page_footer, start, family, person, giver, end_of_group, end };
inline constexpr int layout_place_count = 8;

/// A look of the layout's own; what is not given is as in the body text, or as in the built-in style of this name.
struct LayoutStyle
{
    QString name;
    QString font = {};
    std::optional<double> size = {};
    bool plain = false; ///< Takes bold, italic and underline off first.
    bool bold = false, italic = false, underline = false;
    std::optional<QRgb> colour = {};
    std::optional<pages::Align> align = {};

    friend bool operator==(const LayoutStyle&, const LayoutStyle&) = default;
};

/// A value of the register in a layout.
struct LayoutField
{
    QString name;
    QString item = {}; ///< Of a list kind: only what stands under this item; empty for all.
    std::optional<QString> joint =
        {}; ///< Between several values; unset: as the field's values are listed in a sentence.

    friend bool operator==(const LayoutField&, const LayoutField&) = default;
};

/// One step of a line: words, a field, or a mark between them.
struct LayoutPart
{
    enum class Kind { text, field, style, tab, open, close };
    Kind kind = Kind::text;
    QString text = {}; ///< The words, or the name of the style.
    LayoutField field = {};

    friend bool operator==(const LayoutPart&, const LayoutPart&) = default;
};
using LayoutParts = std::vector<LayoutPart>;

/// Whether an element is printed depends on this field's having a value, or having none.
struct LayoutCondition
{
    LayoutField field;
    bool unless = false;

    friend bool operator==(const LayoutCondition&, const LayoutCondition&) = default;
};

/// One line of a section. Which members count depends on the kind.
struct LayoutElement
{
    enum class Kind { line, row, rule, space, portrait, barcode, note };
    Kind kind = Kind::line;
    std::vector<LayoutPart> parts = {};  ///< Of a line.
    std::vector<LayoutParts> cells = {}; ///< Of a row.
    bool always = false;                 ///< Lines and rows: captions are printed for empty fields too.
    double width = 0, height = 0;        ///< Points; a rule's thickness and a space are heights.
    pages::Align align = pages::Align::left;
    QString text = {}; ///< Of a note, which is not printed.
    std::optional<LayoutCondition> condition = {};

    friend bool operator==(const LayoutElement&, const LayoutElement&) = default;
};

struct LayoutColumn
{
    QString heading;
    double width = 0; ///< Points; 0 takes a share.
    double share = 1;
    pages::Align align = pages::Align::left;

    friend bool operator==(const LayoutColumn&, const LayoutColumn&) = default;
};

enum class LayoutLines { none, rows, grid };

/// The columns into which the layout's rows are written; without columns there is no table.
struct LayoutTable
{
    LayoutLines lines = LayoutLines::rows;
    bool striped = false;
    std::vector<LayoutColumn> columns = {};

    friend bool operator==(const LayoutTable&, const LayoutTable&) = default;
};

struct LayoutGrouping
{
    LayoutField field;
    bool new_page = false;
    bool leave_out_others = false; ///< Else those without a value stand in a last group.

    friend bool operator==(const LayoutGrouping&, const LayoutGrouping&) = default;
};

/// A report or receipt as a church has laid it out. The paper is the run's.
struct CustomLayout
{
    LayoutKind kind = LayoutKind::families;
    QStringList notes = {}; ///< Comments above the first section.
    QString title = {};
    pages::PageSetup page = {};
    double text_size = 9.5;
    QString font = {}; ///< Empty: the house's.
    std::vector<double> tabs = {};
    bool decorated = true; ///< Whether pages carry the church's header and footer.
    bool one_to_a_page = false;
    std::vector<LayoutStyle> styles = {};
    LayoutTable table = {};
    std::optional<LayoutGrouping> grouping = {};
    std::array<std::vector<LayoutElement>, layout_place_count> sections = {};

    [[nodiscard]] const std::vector<LayoutElement>& section(LayoutPlace place) const
    {
        return sections[static_cast<std::size_t>(place)];
    }
    [[nodiscard]] std::vector<LayoutElement>& section(LayoutPlace place)
    {
        return sections[static_cast<std::size_t>(place)];
    }
    friend bool operator==(const CustomLayout&, const CustomLayout&) = default;
};

/// Something in a layout's text that cannot be understood.
struct LayoutFault
{
    int line = 0; ///< From 1; 0 for the file as a whole.
    QString text;

    /// "Line 12: …".
    [[nodiscard]] QString shown() const;
    friend bool operator==(const LayoutFault&, const LayoutFault&) = default;
};

struct ParsedLayout
{
    CustomLayout layout;
    std::vector<LayoutFault> faults; ///< In order of the lines; a layout with faults cannot be run.
};

/// A new layout of this kind, as its text begins when nothing is said.
[[nodiscard]] CustomLayout empty_layout(LayoutKind kind);
/// `kind` holds where the text does not say it itself. Finds all faults, never throws.
[[nodiscard]] ParsedLayout parse_layout(const QString& text, LayoutKind kind);
/// The text that parses into this layout again. Texts of a layout have one line.
[[nodiscard]] QString to_text(const CustomLayout& layout);

inline constexpr qsizetype largest_layout = 1 << 20; ///< In bytes.
/// "*.rpt" holds reports per family, "*.rpy" per person and "*.rct" receipts, unless the text says otherwise.
[[nodiscard]] LayoutKind layout_kind_of(const QString& file);
/// Parses a file's content, which may be no text at all.
[[nodiscard]] ParsedLayout parse_layout_file(const QByteArray& content, LayoutKind kind);
/// Reads and parses. A file that is not there is a fault. Throws core::FileError when it cannot be read.
[[nodiscard]] ParsedLayout load_layout(const QString& file);

} // namespace kindrel::output
