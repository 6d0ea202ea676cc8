#include "output/labels/fitted_text.h"

#include "pages/text_layout.h"

#include <algorithm>
#include <cmath>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

constexpr qreal step = 0.94;
constexpr qreal smallest = 0.05; ///< Of the wanted size; no text comes near it.

/// Sizes are kept to this part of a point.
qreal rounded_down(qreal size)
{
    return std::max(1.0, std::floor(size * pages::units_per_point)) / pages::units_per_point;
}

/// The style, smaller where the longest word is wider than the room.
pages::TextStyle word_style(const LabelText& text, qreal room, pages::TextMetrics& metrics)
{
    auto style = text.style;
    auto widest = pages::widest_word(text.text, style, metrics);
    while (widest > room && style.size > text.style.size * smallest) {
        style.size = rounded_down(style.size * std::min(room / widest, 0.99));
        widest = pages::widest_word(text.text, style, metrics);
    }
    return style;
}

pages::Drawing laid_out(std::span<const LabelText> texts, qreal width, qreal factor, pages::Align align,
                        pages::TextMetrics& metrics)
{
    pages::Drawing drawing{{width, 0}};
    for (const auto& text : texts) {
        const pages::Run run{text.text, text.style.sized(rounded_down(text.style.size * factor))};
        for (auto& block : pages::lay_out(std::span(&run, 1), {.align = align}, width, metrics)) {
            for (auto& item : block.items)
                drawing.items.push_back(moved(std::move(item), {0, drawing.size.height()}));
            drawing.size.rheight() += block.height;
        }
    }
    return drawing;
}

} // namespace

pages::Drawing fitted(std::span<const LabelText> texts, QSizeF room, pages::Align align, pages::TextMetrics& metrics)
{
    std::vector<LabelText> shown;
    for (const auto& text : texts) {
        if (!text.text.isEmpty())
            shown.push_back({text.text, word_style(text, room.width(), metrics)});
    }
    for (qreal factor = 1;; factor *= step) {
        auto drawing = laid_out(shown, room.width(), factor, align, metrics);
        if (drawing.size.height() <= room.height() || factor < smallest)
            return drawing;
    }
}

} // namespace kindrel::output
