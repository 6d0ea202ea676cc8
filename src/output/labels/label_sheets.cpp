#include "output/labels/label_sheets.h"

#include "output/labels/fitted_text.h"

#include <utility>

namespace kindrel::output {

namespace {

/// Of a page whose stored measures cannot be right; nothing is printed on it.
constexpr QSizeF smallest_page(72, 72);
constexpr qreal number_size = 9; ///< Points, of the labels' numbers on a test sheet.

} // namespace

pages::PageSetup sheet_page(const LabelGrid& grid)
{
    return {.margins = {}, .sheet = grid.sheet().expandedTo(smallest_page)};
}

LabelSheets::LabelSheets(pages::Flow& flow, const LabelGrid& grid) : m_flow(flow), m_grid(grid), m_place(grid.start - 1)
{
}

void LabelSheets::add(const std::vector<pages::Item>& items)
{
    m_empty = false;
    if (m_place == m_grid.labels())
        write_sheet();
    const auto corner = m_grid.label(m_place++).topLeft();
    for (const auto& item : items)
        m_items.push_back(pages::moved(item, corner));
}

bool LabelSheets::finish()
{
    if (!m_empty)
        write_sheet();
    return !m_empty;
}

void LabelSheets::write_sheet()
{
    m_flow.write({.height = m_flow.setup().size().height(), .items = std::exchange(m_items, {})});
    m_place = 0;
}

void write_test_sheet(const LabelGrid& grid, pages::PageSpool& spool)
{
    auto whole = grid;
    whole.start = 1;
    pages::Flow flow(spool, sheet_page(whole));
    LabelSheets sheets(flow, whole);
    const QRectF frame({}, sheets.label_size());
    for (int number = 1; number <= whole.labels(); ++number) {
        const LabelText text{QString::number(number), {.size = number_size}};
        const auto words = fitted(std::span(&text, 1), frame.size(), pages::Align::centre, flow.metrics());
        std::vector<pages::Item> items{pages::RectsItem{.rects = {frame}, .outline = pages::ink::grey}};
        for (const auto& item : words.items)
            items.push_back(pages::moved(item, {0, (frame.height() - words.size.height()) / 2}));
        sheets.add(items);
    }
    static_cast<void>(sheets.finish());
    flow.finish();
}

} // namespace kindrel::output
