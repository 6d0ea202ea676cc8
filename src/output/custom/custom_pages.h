#pragma once

#include "output/custom/custom_fields.h"
#include "pages/flow.h"
#include "pages/table.h"

namespace kindrel::output {

/// The looks of a layout in one run, its own styles among them.
class CustomLooks
{
public:
    /// `percent` is of the layout's own sizes.
    CustomLooks(const CustomLayout& layout, int percent);

    [[nodiscard]] const pages::TypeScale& type() const { return m_type; }
    [[nodiscard]] const pages::TextStyle& style(const QString& name) const;
    [[nodiscard]] std::optional<pages::Align> align(const QString& name) const;

private:
    struct Look
    {
        QString name;
        pages::TextStyle style;
        std::optional<pages::Align> align;
    };
    [[nodiscard]] const Look* find(const QString& name) const;

    pages::TypeScale m_type;
    std::vector<Look> m_looks;
};

/// What a line or cell comes to when its fields are filled in.
struct FilledLine
{
    std::vector<pages::Run> runs;
    std::optional<pages::Align> align;
    bool printed = false; ///< False when all its fields are empty.
};

/// Writes the sections of a layout. The table stays open from its first row until close_table().
class CustomPages
{
public:
    CustomPages(const CustomLayout& layout, const CustomLooks& looks, const core::Paths& paths);

    /// Everything that the section holds; `place` must live until close_table() where the section has rows.
    void write(pages::Writer& place, LayoutPlace section, const FieldSource& source);
    void close_table() { m_table.reset(); }

private:
    [[nodiscard]] FilledLine fill(const LayoutParts& parts, bool always, const FieldSource& source) const;
    void write(pages::Writer& place, const LayoutElement& element, const FieldSource& source);
    void write_line(pages::Writer& place, const LayoutElement& element, const FieldSource& source) const;
    void write_row(pages::Writer& place, const LayoutElement& element, const FieldSource& source);
    void write_portrait(pages::Writer& place, const LayoutElement& element, const FieldSource& source) const;
    void write_barcode(pages::Writer& place, const LayoutElement& element, const FieldSource& source) const;
    [[nodiscard]] pages::Table& table(pages::Writer& place);

    const CustomLayout& m_layout;
    const CustomLooks& m_looks;
    const core::Paths& m_paths;
    std::optional<pages::Table> m_table;
};

} // namespace kindrel::output
