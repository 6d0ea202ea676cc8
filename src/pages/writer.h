#pragma once

#include "pages/block.h"
#include "pages/picture.h"
#include "pages/style.h"

#include <QString>

#include <initializer_list>
#include <span>

namespace kindrel::pages {

class TextMetrics;

struct CaptionValue
{
    QString caption; ///< Printed as it stands, with the blank it ends in.
    QString value;   ///< Empty: the caption is left out too.
};

struct Ruling
{
    qreal thickness = 0.5;
    QRgb colour = ink::hairline;
    qreal before = 2;
    qreal after = 2;
};

struct TickBoxes
{
    int count = 1;
    qreal size = 8;
    qreal gap = 4;
    Align align = Align::left;
};

/// Writes content downwards into a place of given width: a flow's column, a table's cell, a page's header or footer.
class Writer
{
public:
    virtual ~Writer() = default;
    Writer(const Writer&) = delete;
    Writer& operator=(const Writer&) = delete;

    /// Room from the present indent to the right edge.
    [[nodiscard]] qreal width() const { return m_width - m_indent; }
    [[nodiscard]] const TypeScale& type() const { return m_type; }
    [[nodiscard]] TextMetrics& metrics() { return *m_metrics; }

    /// One text of one look; empty text makes an empty line.
    void line(const QString& text) { line(text, m_type.body); }
    void line(const QString& text, const TextStyle& style, Align align = Align::left,
              LongText long_text = LongText::wrap);
    /// Texts of several looks flowing together.
    void paragraph(std::span<const Run> runs, const ParagraphStyle& style = {});
    void paragraph(std::initializer_list<Run> runs, const ParagraphStyle& style = {});
    /// Three texts on one line at the left, the middle and the right; those that would meet are elided.
    void spread(const QString& left, const QString& centre, const QString& right, const TextStyle& style);
    /// The captions with their values after one another; nothing at all when every value is empty.
    void captions(std::span<const CaptionValue> pairs);
    void captions(std::initializer_list<CaptionValue> pairs) { captions(std::span(pairs.begin(), pairs.size())); }
    void caption(const QString& caption, const QString& value);
    /// Levels 1 to 3. Stays with what follows.
    void heading(const QString& text, int level = 1);

    /// Scaled into `size` with its shape kept, never above the width there is; an empty one frames `size`.
    void picture(const Picture& picture, QSizeF size, Align align = Align::left);
    /// Code 128 with its quiet zones inside `size`.
    void barcode(const QString& content, QSizeF size, Align align = Align::left);
    void tick_boxes(const TickBoxes& boxes);
    void drawing(const Drawing& drawing, Align align = Align::left);
    void rule(const Ruling& ruling = {});
    void space(qreal height);

    /// Takes a block as it is; what all the others end in.
    void write(Block block);

protected:
    Writer(std::shared_ptr<TextMetrics> metrics, const TypeScale& type, qreal width);
    [[nodiscard]] const std::shared_ptr<TextMetrics>& shared_metrics() const { return m_metrics; }
    virtual void put(Block block) = 0;
    /// The height of an empty column or cell.
    [[nodiscard]] virtual qreal place_height() = 0;

private:
    friend class Indent;
    friend class Group;
    friend class Table;

    /// The highest block that fits below the headings repeated above it.
    [[nodiscard]] qreal tallest();
    /// `heading` counts from the present indent.
    void repeat_from_here(const Blocks& heading);

    std::shared_ptr<TextMetrics> m_metrics;
    TypeScale m_type;
    qreal m_width;
    qreal m_indent = 0;
    std::shared_ptr<const Blocks> m_heading;
};

/// Moves what is written during its life to the right.
class Indent
{
public:
    Indent(Writer& writer, qreal by) : m_writer(writer), m_by(by) { m_writer.m_indent += m_by; }
    ~Indent() { m_writer.m_indent -= m_by; }
    Indent(const Indent&) = delete;
    Indent& operator=(const Indent&) = delete;

private:
    Writer& m_writer;
    qreal m_by;
};

/// A heading whose section runs to the end of its life: where the section goes on in another column, the heading stands
/// there again followed by " (continued)".
class Group
{
public:
    Group(Writer& writer, const QString& text, int level = 1);
    ~Group() { m_writer.m_heading = m_outer; }
    Group(const Group&) = delete;
    Group& operator=(const Group&) = delete;

private:
    Writer& m_writer;
    std::shared_ptr<const Blocks> m_outer;
};

/// Collects content for a place of its own instead of flowing it: a cell, a header, a footer.
class Box final : public Writer
{
public:
    Box(std::shared_ptr<TextMetrics> metrics, const TypeScale& type, qreal width, qreal height)
        : Writer(std::move(metrics), type, width), m_height(height)
    {
    }
    [[nodiscard]] const Blocks& blocks() const { return m_blocks; }
    [[nodiscard]] Blocks take() { return std::move(m_blocks); }

private:
    void put(Block block) override { m_blocks.push_back(std::move(block)); }
    qreal place_height() override { return m_height; }

    Blocks m_blocks;
    qreal m_height;
};

} // namespace kindrel::pages
