#include "desktop/shell/palette.h"

#include <array>

namespace kindrel::desktop {

namespace {

/// The colours of one shade, by what they are for.
struct Colours
{
    QRgb base, window, raised, text, quiet, faint, selection, link, line, hover, edge;
};

constexpr std::array shades{
    Colours{0xffffffff, 0xfff3f5f7, 0xffeceff2, 0xff1f2328, 0xff5f6670, 0xff9aa1a9, 0xff1f5fa8, 0xff1f5fa8, 0xffd3d8de,
            0xffe2e7ed, 0xff868d95},
    Colours{0xff1e2226, 0xff24292e, 0xff2a2f35, 0xffe6e9ec, 0xffa0a7af, 0xff6e757d, 0xff2f6db5, 0xff7db7f0, 0xff3b424a,
            0xff343a41, 0xff737b84},
};

const Colours& colours(Shade shade)
{
    return shades[static_cast<std::size_t>(shade)];
}

struct StateColours
{
    State state;
    std::array<QRgb, 2> in;
};

constexpr std::array state_table{
    StateColours{State::plain, {0xff1f2328, 0xffe6e9ec}},      StateColours{State::deceased, {0xff5f6670, 0xffa0a7af}},
    StateColours{State::archive, {0xff7a5230, 0xffd2a679}},    StateColours{State::prospect, {0xff1b62a8, 0xff7db7f0}},
    StateColours{State::privacy, {0xff7a3e9d, 0xffcfa3ea}},    StateColours{State::contact, {0xff0b6b63, 0xff6ccfc4}},
    StateColours{State::booked_out, {0xffa84300, 0xfff0975a}}, StateColours{State::altered, {0xff8a5a00, 0xffe3b341}},
    StateColours{State::error, {0xffb3261e, 0xfff28b82}},
};

void set_backgrounds(QPalette& palette, const Colours& of)
{
    palette.setColor(QPalette::Window, of.window);
    palette.setColor(QPalette::Base, of.base);
    palette.setColor(QPalette::AlternateBase, of.window);
    palette.setColor(QPalette::ToolTipBase, of.raised);
    palette.setColor(QPalette::Button, of.raised);
    palette.setColor(QPalette::Highlight, of.selection);
}

void set_texts(QPalette& palette, const Colours& of)
{
    for (const auto role : {QPalette::WindowText, QPalette::Text, QPalette::ButtonText, QPalette::ToolTipText})
        palette.setColor(role, of.text);
    palette.setColor(QPalette::PlaceholderText, of.quiet);
    palette.setColor(QPalette::BrightText, 0xffffffff);
    palette.setColor(QPalette::HighlightedText, 0xffffffff);
    palette.setColor(QPalette::Link, of.link);
    palette.setColor(QPalette::LinkVisited, of.link);
}

void set_edges(QPalette& palette, const Colours& of)
{
    palette.setColor(QPalette::Light, of.base);
    palette.setColor(QPalette::Midlight, of.hover);
    palette.setColor(QPalette::Mid, of.line);
    palette.setColor(QPalette::Dark, of.faint);
    palette.setColor(QPalette::Shadow, 0xff101418);
}

void set_disabled(QPalette& palette, const Colours& of)
{
    for (const auto role : {QPalette::WindowText, QPalette::Text, QPalette::ButtonText})
        palette.setColor(QPalette::Disabled, role, of.faint);
    palette.setColor(QPalette::Disabled, QPalette::Highlight, of.faint);
    palette.setColor(QPalette::Disabled, QPalette::Base, of.window);
}

} // namespace

QPalette palette_of(Shade shade)
{
    QPalette palette;
    const Colours& of = colours(shade);
    set_backgrounds(palette, of);
    set_texts(palette, of);
    set_edges(palette, of);
    set_disabled(palette, of);
    return palette;
}

Shade shade_of(const QPalette& palette)
{
    return palette.color(QPalette::Window).lightness() < 128 ? Shade::dark : Shade::light;
}

QColor state_colour(State state, Shade shade)
{
    for (const auto& entry : state_table)
        if (entry.state == state)
            return entry.in[static_cast<std::size_t>(shade)];
    return {};
}

QColor quiet_colour(Shade shade)
{
    return colours(shade).quiet;
}

QColor line_colour(Shade shade)
{
    return colours(shade).line;
}

QColor edge_colour(Shade shade)
{
    return colours(shade).edge;
}

QColor hover_colour(Shade shade)
{
    return colours(shade).hover;
}

} // namespace kindrel::desktop
