#include "pages/find.h"

#include "pages/line_layout.h"
#include "pages/text_metrics.h"

#include <algorithm>
#include <cmath>

namespace kindrel::pages {

namespace {

/// Texts further apart than this many times their size are not read as one.
constexpr qreal widest_gap = 1.0;

/// Neighbouring texts of one line, and what they read as.
struct Stretch
{
    std::vector<const TextItem*> items;
    std::vector<int> starts;
    QString text;

    [[nodiscard]] bool takes(const TextItem& next) const
    {
        if (items.empty())
            return true;
        const auto& last = *items.back();
        const auto gap = next.at.x() - last.at.x() - last.width;
        return std::abs(next.at.y() - last.at.y()) < 0.5 && std::abs(gap) < widest_gap * next.style.size;
    }
    void add(const TextItem& item)
    {
        items.push_back(&item);
        starts.push_back(int(text.size()));
        text += item.text;
    }
};

/// Where characters `from` to `to` of the item stand.
QRectF rectangle(const TextItem& item, qsizetype from, qsizetype to, TextMetrics& metrics)
{
    QTextLayout layout;
    const auto line = shape_line(layout, item, [&](const TextStyle& style) { return metrics.font(style); });
    const auto edge = [&](qsizetype index) {
        return item.at.x() + (line.cursorToX(int(index)) - line.naturalTextRect().x()) / units_per_point;
    };
    const auto [left, right] = std::minmax({edge(from), edge(to)});
    return {left, item.at.y() - metrics.ascent(item.style), right - left, metrics.line_height(item.style)};
}

QRectF rectangle(const Stretch& stretch, qsizetype from, qsizetype to, TextMetrics& metrics)
{
    QRectF all;
    for (size_t i = 0; i < stretch.items.size(); ++i) {
        const auto& item = *stretch.items[i];
        const auto first = std::max<qsizetype>(from - stretch.starts[i], 0);
        const auto last = std::min<qsizetype>(to - stretch.starts[i], item.text.size());
        if (first < last)
            all |= rectangle(item, first, last, metrics);
    }
    return all;
}

void search(const Stretch& stretch, int page, const QString& text, TextMetrics& metrics, std::vector<Found>& found)
{
    for (auto at = stretch.text.indexOf(text, 0, Qt::CaseInsensitive); at >= 0;
         at = stretch.text.indexOf(text, at + text.size(), Qt::CaseInsensitive))
        found.push_back({page, rectangle(stretch, at, at + text.size(), metrics)});
}

void search(const Page& page, const QString& text, TextMetrics& metrics, std::vector<Found>& found)
{
    Stretch stretch;
    for (const auto& item : page.items) {
        const auto* piece = std::get_if<TextItem>(&item);
        if (!piece)
            continue;
        if (!stretch.takes(*piece)) {
            search(stretch, page.number, text, metrics, found);
            stretch = {};
        }
        stretch.add(*piece);
    }
    search(stretch, page.number, text, metrics, found);
}

} // namespace

std::vector<Found> find(const Page& page, const QString& text)
{
    TextMetrics metrics;
    std::vector<Found> found;
    if (!text.isEmpty())
        search(page, text, metrics, found);
    return found;
}

std::vector<Found> find(const PageSpool& spool, const QString& text)
{
    TextMetrics metrics;
    std::vector<Found> found;
    for (int number = 1; number <= spool.page_count() && !text.isEmpty(); ++number)
        search(spool.page(number), text, metrics, found);
    return found;
}

} // namespace kindrel::pages
