#pragma once

#include "desktop/shell/palette.h"

#include <QFont>

class QApplication;
class QLabel;
class QWidget;

namespace kindrel::desktop {

/// How the person wants the program to look; `desktop` follows the workstation's own palette.
enum class Appearance { desktop, light, dark };

/// The sizes of a text by its part on the screen.
enum class TextSize { title, group, body, secondary };

/// Distances of the 4-pixel grid.
namespace space {
inline constexpr int field = 8;
inline constexpr int margin = 12;
inline constexpr int group = 16;
inline constexpr int row = 24;
inline constexpr int control = 28;
} // namespace space

/// Style, palette and font of the whole program.
class Look
{
public:
    /// Notes what the workstation itself looks like, so it must be made before the first apply().
    explicit Look(QApplication& application);

    /// `percent` is 100, 115 or 130.
    void apply(Appearance appearance, int percent);
    [[nodiscard]] Appearance appearance() const { return m_appearance; }
    [[nodiscard]] int percent() const { return m_percent; }

private:
    QApplication& m_application;
    Shade m_desktop_shade;
    QString m_font_family;
    Appearance m_appearance = Appearance::desktop;
    int m_percent = 100;
};

/// The program's font at a text's size.
[[nodiscard]] QFont font_for(TextSize size);
/// The program's own row height, grown with the text.
[[nodiscard]] int row_height();
/// Gives a widget's text its size for good: it grows and shrinks with the program's text.
void keep_text_size(QWidget& widget, TextSize size);
/// Fixes a width that is right for text at 100 percent and grows with it.
void keep_width(QWidget& widget, int pixels);
/// Size for good, and the quiet colour of either shade for secondary text.
void dress(QLabel& label, TextSize size);

} // namespace kindrel::desktop
