#include "desktop/output/sheet_picture.h"

#include "desktop/shell/palette.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>

#include <map>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr QSize smallest(220, 300);
constexpr int edge = 3; ///< Around the sheet, for its shadow and for the mark of the first label at its edge.
constexpr QColor shadow_ink(0, 0, 0, 60);
constexpr QColor label_edge(150, 156, 163);
constexpr QColor used_label(226, 229, 233);
constexpr QColor start_mark(31, 95, 168); ///< On white paper, whatever the shade of the window.

/// The label that a key leads to; may lie outside the sheet.
std::optional<int> led_to(int key, const output::LabelGrid& grid)
{
    const std::map<int, int> places{
        {Qt::Key_Left, grid.start - 1},
        {Qt::Key_Right, grid.start + 1},
        {Qt::Key_Up, grid.start - grid.columns},
        {Qt::Key_Down, grid.start + grid.columns},
        {Qt::Key_Home, 1},
        {Qt::Key_End, grid.labels()},
    };
    const auto found = places.find(key);
    return found == places.end() ? std::nullopt : std::optional(found->second);
}

} // namespace

SheetPicture::SheetPicture(Desk& desk, QWidget* parent) : ReportDrawing(desk, parent)
{
    setFocusPolicy(Qt::StrongFocus);
    setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Expanding);
    setToolTip(u"Click the label to start at, or choose it with the arrow keys"_s);
}

void SheetPicture::show_sheet(const output::LabelGrid& grid, const output::ReportChoice& report,
                              const people::WorkingList& list)
{
    m_grid = grid;
    m_fault.clear();
    show_report(&report, list, {});
    setAccessibleName(u"The sheet, starting at label %1 of %2"_s.arg(grid.start).arg(grid.labels()));
    update();
}

void SheetPicture::show_fault(const QString& fault)
{
    m_fault = fault;
    show_report(nullptr, {}, {});
    setAccessibleName(fault);
    update();
}

QSize SheetPicture::sizeHint() const
{
    return minimumSizeHint(); // It takes what room the fields leave.
}

QSize SheetPicture::minimumSizeHint() const
{
    return smallest;
}

QRectF SheetPicture::sheet() const
{
    const QSizeF room = size() - QSize(2 * edge, 2 * edge);
    const QSizeF drawn = m_grid.sheet().scaled(room, Qt::KeepAspectRatio);
    return {QPointF((width() - drawn.width()) / 2, edge), drawn};
}

QRectF SheetPicture::on_screen(const QRectF& of_sheet) const
{
    const QRectF paper = sheet();
    const qreal scale = paper.width() / m_grid.sheet().width();
    return {paper.topLeft() + of_sheet.topLeft() * scale, of_sheet.size() * scale};
}

void SheetPicture::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHints(QPainter::Antialiasing | QPainter::SmoothPixmapTransform);
    if (!m_fault.isEmpty()) {
        painter.setPen(state_colour(State::error, shade_of(palette())));
        painter.drawText(rect().adjusted(edge, edge, -edge, -edge), Qt::AlignHCenter | Qt::AlignTop | Qt::TextWordWrap,
                         m_fault);
        return;
    }
    painter.fillRect(sheet().translated(edge, edge), shadow_ink);
    painter.fillRect(sheet(), Qt::white);
    paint_labels(painter);
    paint_page(painter, sheet());
}

void SheetPicture::paint_labels(QPainter& painter) const
{
    painter.setPen(QPen(label_edge, 1, Qt::DashLine));
    for (int label = 1; label <= m_grid.labels(); ++label) {
        painter.setBrush(label < m_grid.start ? QBrush(used_label) : QBrush(Qt::NoBrush));
        painter.drawRect(on_screen(m_grid.label(label - 1)));
    }
    painter.setBrush(Qt::NoBrush);
    painter.setPen(QPen(start_mark, hasFocus() ? 3 : 1.5));
    painter.drawRect(on_screen(m_grid.label(m_grid.start - 1)));
}

void SheetPicture::mousePressEvent(QMouseEvent* event)
{
    if (!m_fault.isEmpty() || event->button() != Qt::LeftButton)
        return;
    for (int label = 1; label <= m_grid.labels(); ++label) {
        if (on_screen(m_grid.label(label - 1)).contains(event->position())) {
            Q_EMIT start_chosen(label);
            return;
        }
    }
}

void SheetPicture::keyPressEvent(QKeyEvent* event)
{
    const auto label = m_fault.isEmpty() ? led_to(event->key(), m_grid) : std::nullopt;
    if (!label || event->modifiers().testAnyFlags(Qt::ControlModifier | Qt::AltModifier)) {
        QWidget::keyPressEvent(event);
        return;
    }
    if (*label >= 1 && *label <= m_grid.labels())
        Q_EMIT start_chosen(*label);
}

} // namespace kindrel::desktop
