#include "output/labels/label_stock.h"

#include <algorithm>
#include <array>

namespace kindrel::output {

namespace {

/// Page, columns and rows, label, gaps, margins; tenths of a millimetre.
constexpr std::array stocks{
    LabelStock{"A4, 1 x 1, 199.6 x 289.1 mm", {2100, 2970, 1, 1, 1996, 2891, 0, 0, 52, 40}},
    LabelStock{"A4, 1 x 2, 199.6 x 143.5 mm", {2100, 2970, 1, 2, 1996, 1435, 0, 0, 52, 50}},
    LabelStock{"A4, 2 x 2, 99.1 x 139.0 mm", {2100, 2970, 2, 2, 991, 1390, 25, 0, 47, 95}},
    LabelStock{"A4, 2 x 4, 99.1 x 67.7 mm", {2100, 2970, 2, 4, 991, 677, 25, 0, 47, 131}},
    LabelStock{"A4, 2 x 5, 99.1 x 57.0 mm", {2100, 2970, 2, 5, 991, 570, 25, 0, 47, 60}},
    LabelStock{"A4, 2 x 7, 99.1 x 38.1 mm", {2100, 2970, 2, 7, 991, 381, 25, 0, 47, 151}},
    LabelStock{"A4, 2 x 8, 99.1 x 33.9 mm", {2100, 2970, 2, 8, 991, 339, 25, 0, 47, 129}},
    LabelStock{"A4, 3 x 6, 63.5 x 46.6 mm", {2100, 2970, 3, 6, 635, 466, 25, 0, 72, 87}},
    LabelStock{"A4, 3 x 7, 63.5 x 38.1 mm", {2100, 2970, 3, 7, 635, 381, 25, 0, 72, 151}},
    LabelStock{"A4, 3 x 8, 63.5 x 33.9 mm", {2100, 2970, 3, 8, 635, 339, 25, 0, 72, 129}},
    LabelStock{"A4, 3 x 8, 70.0 x 37.0 mm, edge to edge", {2100, 2970, 3, 8, 700, 370, 0, 0, 0, 5}},
    LabelStock{"A4, 5 x 13, 38.1 x 21.2 mm", {2100, 2970, 5, 13, 381, 212, 25, 0, 47, 107}},
    LabelStock{"A4, name tags, 2 x 5, 86.0 x 55.0 mm", {2100, 2970, 2, 5, 860, 550, 0, 0, 190, 110}},
    LabelStock{"A4, name tags, 2 x 4, 80.0 x 50.0 mm", {2100, 2970, 2, 4, 800, 500, 150, 60, 175, 395}},
    LabelStock{"Letter, 2 x 3, 4 x 3 1/3 in", {2159, 2794, 2, 3, 1016, 847, 48, 0, 40, 127}},
    LabelStock{"Letter, 2 x 5, 4 x 2 in", {2159, 2794, 2, 5, 1016, 508, 48, 0, 40, 127}},
    LabelStock{"Letter, 2 x 7, 4 x 1 1/3 in", {2159, 2794, 2, 7, 1016, 339, 48, 0, 40, 212}},
    LabelStock{"Letter, 2 x 10, 4 x 1 in", {2159, 2794, 2, 10, 1016, 254, 48, 0, 40, 127}},
    LabelStock{"Letter, 3 x 10, 2 5/8 x 1 in", {2159, 2794, 3, 10, 667, 254, 31, 0, 48, 127}},
    LabelStock{"Letter, name tags, 2 x 4, 3 3/8 x 2 1/3 in", {2159, 2794, 2, 4, 857, 593, 95, 47, 175, 140}},
};

} // namespace

std::span<const LabelStock> label_stocks()
{
    return stocks;
}

const LabelStock* stock_of(const LabelGrid& grid)
{
    const auto found = std::ranges::find_if(stocks, [&](const LabelStock& stock) {
        auto measures = grid;
        measures.start = stock.grid.start;
        return measures == stock.grid;
    });
    return found == stocks.end() ? nullptr : &*found;
}

} // namespace kindrel::output
