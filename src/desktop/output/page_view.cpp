#include "desktop/output/page_view.h"

#include "desktop/shell/look.h"

#include <QApplication>
#include <QKeyEvent>
#include <QPainter>
#include <QScrollBar>
#include <QWheelEvent>

#include <algorithm>
#include <array>
#include <cmath>

namespace kindrel::desktop {

namespace {

constexpr std::array zoom_steps{50, 75, 100, 125, 150, 200, 300, 400};
constexpr int border = 16;
constexpr qreal points_per_inch = 72;
constexpr QColor mark_colour(255, 200, 0, 110);

/// The step after or before `percent`.
int neighbour(int percent, bool larger)
{
    if (larger) {
        const auto next = std::upper_bound(zoom_steps.begin(), zoom_steps.end(), percent);
        return next == zoom_steps.end() ? Zoom::most : *next;
    }
    const auto next = std::lower_bound(zoom_steps.begin(), zoom_steps.end(), percent);
    return next == zoom_steps.begin() ? Zoom::least : *(next - 1);
}

} // namespace

PageView::PageView(const pages::PageSpool& spool, QWidget* parent) : QAbstractScrollArea(parent), m_spool(spool)
{
    setFrameShape(NoFrame);
    setFocusPolicy(Qt::StrongFocus);
    viewport()->setBackgroundRole(QPalette::Mid);
    setAccessibleName(QStringLiteral("Page"));
}

void PageView::show_page(int number)
{
    if (m_spool.page_count() == 0)
        return;
    const int wanted = std::clamp(number, 1, m_spool.page_count());
    if (wanted == m_page.number)
        return;
    m_page = m_spool.page(wanted);
    mark(m_marked);
    verticalScrollBar()->setValue(0);
    lay_out();
    Q_EMIT page_changed(wanted);
}

void PageView::refresh()
{
    if (m_page.number == 0)
        show_page(1);
    viewport()->update();
}

void PageView::mark(const QString& text)
{
    m_marked = text;
    m_marks = text.isEmpty() ? std::vector<pages::Found>() : pages::find(m_page, text);
    viewport()->update();
}

void PageView::set_zoom(Zoom zoom)
{
    zoom.percent = std::clamp(zoom.percent, Zoom::least, Zoom::most);
    m_zoom = zoom;
    lay_out();
    Q_EMIT zoom_changed();
}

void PageView::zoom_by(int steps)
{
    int percent = shown_percent();
    for (int step = 0; step < std::abs(steps); ++step)
        percent = neighbour(percent, steps > 0);
    set_zoom({Zoom::Fit::none, percent});
}

int PageView::shown_percent() const
{
    return int(std::lround(scale() / natural_scale() * 100));
}

qreal PageView::natural_scale() const
{
    return logicalDpiX() / points_per_inch;
}

qreal PageView::scale() const
{
    if (m_zoom.fit == Zoom::Fit::none || m_page.size.isEmpty())
        return natural_scale() * m_zoom.percent / 100;
    // Room for the scroll bar is always kept, or a page that just fits would flicker between two sizes.
    const int bar = verticalScrollBar()->sizeHint().width();
    const qreal across = (contentsRect().width() - bar - 2 * border) / m_page.size.width();
    const qreal down = (contentsRect().height() - 2 * border) / m_page.size.height();
    return std::max(0.1, m_zoom.fit == Zoom::Fit::width ? across : std::min(across, down));
}

QRectF PageView::page_place() const
{
    const QSizeF size = m_page.size * scale();
    const qreal left = std::max<qreal>(border, (viewport()->width() - size.width()) / 2);
    const qreal top = std::max<qreal>(border, (viewport()->height() - size.height()) / 2);
    return QRectF(QPointF(left - horizontalScrollBar()->value(), top - verticalScrollBar()->value()), size);
}

void PageView::lay_out()
{
    const QSizeF size = m_page.size * scale() + QSizeF(2 * border, 2 * border);
    const auto set = [](QScrollBar& bar, qreal whole, int seen) {
        bar.setRange(0, std::max(0, int(std::ceil(whole)) - seen));
        bar.setPageStep(seen);
        bar.setSingleStep(space::row);
    };
    set(*horizontalScrollBar(), size.width(), viewport()->width());
    set(*verticalScrollBar(), size.height(), viewport()->height());
    viewport()->update();
}

void PageView::paintEvent(QPaintEvent*)
{
    if (m_page.number == 0)
        return;
    QPainter painter(viewport());
    painter.setRenderHint(QPainter::Antialiasing);
    const QRectF place = page_place();
    painter.fillRect(place.translated(2, 2), QColor(0, 0, 0, 50));
    painter.fillRect(place, Qt::white);
    painter.setClipRect(place);
    painter.translate(place.topLeft());
    painter.scale(scale(), scale());
    for (const auto& mark : m_marks)
        painter.fillRect(mark.where, mark_colour);
    m_painter.paint(painter, m_page, m_spool.page_count());
}

void PageView::resizeEvent(QResizeEvent*)
{
    lay_out();
    if (m_zoom.fit != Zoom::Fit::none)
        Q_EMIT zoom_changed();
}

std::optional<int> PageView::page_for(int key) const
{
    switch (key) {
    case Qt::Key_PageDown:
        return number() + 1;
    case Qt::Key_PageUp:
        return number() - 1;
    case Qt::Key_Home:
        return 1;
    case Qt::Key_End:
        return m_spool.page_count();
    default:
        return std::nullopt;
    }
}

void PageView::keyPressEvent(QKeyEvent* event)
{
    if (const auto wanted = page_for(event->key()))
        show_page(*wanted);
    else if (event->key() == Qt::Key_Down || event->key() == Qt::Key_Up)
        verticalScrollBar()->triggerAction(event->key() == Qt::Key_Down ? QScrollBar::SliderSingleStepAdd
                                                                        : QScrollBar::SliderSingleStepSub);
    else
        QAbstractScrollArea::keyPressEvent(event);
}

void PageView::wheelEvent(QWheelEvent* event)
{
    const int turn = event->angleDelta().y();
    if (event->modifiers() & Qt::ControlModifier) {
        zoom_by(turn > 0 ? 1 : -1);
        return;
    }
    QScrollBar& bar = *verticalScrollBar();
    const int before = bar.value();
    QAbstractScrollArea::wheelEvent(event);
    if (bar.value() != before || turn == 0)
        return;
    show_page(number() + (turn < 0 ? 1 : -1));
    if (turn > 0 && number() > 1)
        bar.setValue(bar.maximum());
}

} // namespace kindrel::desktop
