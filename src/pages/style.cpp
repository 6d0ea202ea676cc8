#include "pages/style.h"

namespace kindrel::pages {

TextStyle TextStyle::bolder(bool on) const
{
    auto style = *this;
    style.bold = on;
    return style;
}

TextStyle TextStyle::slanted(bool on) const
{
    auto style = *this;
    style.italic = on;
    return style;
}

TextStyle TextStyle::sized(qreal points) const
{
    auto style = *this;
    style.size = points;
    return style;
}

TextStyle TextStyle::coloured(QRgb ink) const
{
    auto style = *this;
    style.colour = ink;
    return style;
}

TypeScale TypeScale::around(const TextStyle& body)
{
    const auto heading = [&](qreal times) {
        return body.bolder().sized(body.size * times);
    };
    return {.headings = {heading(1.55), heading(1.25), heading(1.1)},
            .body = body,
            .caption = body.coloured(ink::grey),
            .small = body.sized(body.size * 0.85).coloured(ink::grey),
            .separator = heading(1.25)};
}

} // namespace kindrel::pages
