#pragma once

class QBoxLayout;
class QLabel;
class QScrollArea;
class QString;
class QWidget;

namespace kindrel::desktop {

class Page;

/// A field below its caption, whose marked letter leads to it.
void add_below_caption(QBoxLayout& column, const QString& caption, QWidget* field);
/// A field beside its caption, as narrow as it can be.
void add_beside_caption(QBoxLayout& column, const QString& caption, QWidget* field);
/// Quiet words that may take several lines.
[[nodiscard]] QLabel* make_explanation(const QString& text);
/// The content of a setup page, which scrolls when the window is small.
[[nodiscard]] QScrollArea* make_scrolling(QBoxLayout* content);
/// The cursor goes to the field of this object name, its text selected.
void lead_to(Page& page, const QString& field);

} // namespace kindrel::desktop
