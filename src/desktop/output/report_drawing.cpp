#include "desktop/output/report_drawing.h"

#include "core/files.h"

#include <QPainter>
#include <QTimer>

namespace kindrel::desktop {

namespace {

constexpr int pause_ms = 60;
constexpr QSize smallest(120, 140);
/// The sheet's shadow at its right and lower edges.
constexpr int shadow = 3;
constexpr QColor shadow_ink(0, 0, 0, 60);

} // namespace

ReportDrawing::ReportDrawing(Desk& desk, QWidget* parent) : QWidget(parent), m_desk(desk), m_pause(new QTimer(this))
{
    setObjectName(QStringLiteral("drawing"));
    setAccessibleName(QStringLiteral("The first page of the report"));
    setMinimumSize(smallest);
    m_pause->setSingleShot(true);
    m_pause->setInterval(pause_ms);
    connect(m_pause, &QTimer::timeout, this, &ReportDrawing::draw_now);
}

void ReportDrawing::show_report(const output::ReportChoice* report, const people::WorkingList& list,
                                const output::RunOptions& options)
{
    m_report = report ? std::optional(*report) : std::nullopt;
    m_list = list;
    m_options = options;
    m_pause->start();
}

void ReportDrawing::draw_now()
{
    m_pause->stop();
    if (!isVisible())
        return;
    m_page.reset();
    try {
        if (m_report)
            m_page = output::first_page(*m_report, {m_desk.office, m_list, m_options});
    } catch (const core::DatabaseError&) {
    } catch (const core::FileError&) {
    }
    update();
}

void ReportDrawing::showEvent(QShowEvent* event)
{
    QWidget::showEvent(event);
    m_pause->start();
}

void ReportDrawing::paintEvent(QPaintEvent*)
{
    if (!m_page)
        return;
    const QSizeF room = size() - QSize(shadow, shadow);
    const QSizeF sheet = m_page->size.scaled(room, Qt::KeepAspectRatio);
    const QRectF place(QPointF((room.width() - sheet.width()) / 2, 0), sheet);
    QPainter painter(this);
    painter.setRenderHints(QPainter::Antialiasing | QPainter::SmoothPixmapTransform);
    painter.fillRect(place.translated(shadow, shadow), shadow_ink);
    painter.fillRect(place, Qt::white);
    paint_page(painter, place);
}

void ReportDrawing::paint_page(QPainter& painter, const QRectF& paper)
{
    if (!m_page)
        return;
    const qreal scale = paper.width() / m_page->size.width();
    painter.setClipRect(paper);
    painter.translate(paper.topLeft());
    painter.scale(scale, scale);
    m_painter.paint(painter, *m_page, 1);
}

} // namespace kindrel::desktop
