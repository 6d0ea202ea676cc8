#pragma once

#include "output/catalogue.h"
#include "output/labels/label_setup.h"

#include <vector>

namespace kindrel::output {

/// The page that sheets of this grid are printed on.
[[nodiscard]] pages::PageSetup sheet_page(const LabelGrid& grid);

/// A sheet that shows where its labels lie, each with its number, to be held against the real one. Only of a grid
/// without fault.
void write_test_sheet(const LabelGrid& grid, pages::PageSpool& spool);

/// Puts labels onto sheets one after another, each exactly in its place. The flow's page is the grid's.
class LabelSheets
{
public:
    LabelSheets(pages::Flow& flow, const LabelGrid& grid);

    [[nodiscard]] QSizeF label_size() const { return m_grid.label(0).size(); }
    /// The items count from the label's upper left corner.
    void add(const std::vector<pages::Item>& items);
    /// Writes the sheet begun last. False when there was no label, and so there is no sheet.
    [[nodiscard]] bool finish();

private:
    void write_sheet();

    pages::Flow& m_flow;
    LabelGrid m_grid;
    int m_place;
    bool m_empty = true;
    std::vector<pages::Item> m_items;
};

} // namespace kindrel::output
