#include "desktop/shell/rail.h"

#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"

#include <QKeyEvent>
#include <QPainter>
#include <QScrollArea>
#include <QScrollBar>
#include <QToolButton>
#include <QVBoxLayout>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int gap = 2;
constexpr int arrow_height = 18;

} // namespace

Rail::Rail(QWidget* parent)
    : QWidget(parent), m_column(new QVBoxLayout), m_foot_column(new QVBoxLayout), m_scroll(new QScrollArea),
      m_earlier(make_arrow(u"go-up"_s, u"Earlier areas"_s, -1)),
      m_further(make_arrow(u"go-down"_s, u"Further areas"_s, 1))
{
    setFixedWidth(wide);
    auto* areas = new QWidget;
    areas->setLayout(m_column);
    m_column->setContentsMargins(0, 0, 0, 0);
    m_column->setSpacing(gap);
    m_column->addStretch(1);
    m_scroll->setFrameShape(QFrame::NoFrame);
    m_scroll->setFocusPolicy(Qt::NoFocus);
    m_scroll->setWidgetResizable(true);
    m_scroll->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    m_scroll->setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    m_scroll->setWidget(areas);
    areas->setAutoFillBackground(false); // A scroll area turns it on.
    m_scroll->viewport()->setAutoFillBackground(false);
    m_foot_column->setSpacing(gap);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, space::field, 1, space::field);
    column->setSpacing(gap);
    column->addWidget(m_scroll, 1);
    column->addLayout(m_foot_column);
    const QScrollBar* bar = m_scroll->verticalScrollBar();
    connect(bar, &QAbstractSlider::valueChanged, this, &Rail::place_arrows);
    connect(bar, &QAbstractSlider::rangeChanged, this, &Rail::place_arrows);
}

QToolButton* Rail::make_arrow(const QString& icon_name, const QString& words, int step)
{
    auto* arrow = new QToolButton(this);
    arrow->setIcon(icon(icon_name));
    arrow->setToolTip(words);
    arrow->setAccessibleName(words);
    arrow->setFocusPolicy(Qt::NoFocus);
    arrow->setAutoRepeat(true);
    arrow->setAutoFillBackground(true);
    arrow->setBackgroundRole(QPalette::Button);
    arrow->hide();
    connect(arrow, &QAbstractButton::clicked, this, [this, step] {
        auto* bar = m_scroll->verticalScrollBar();
        bar->setValue(bar->value() + 2 * step * RailButton::low_height);
    });
    return arrow;
}

RailButton* Rail::add_area(const QString& icon_name, const QString& text)
{
    auto* button = new RailButton(icon_name, text);
    button->setCheckable(true);
    button->setAutoExclusive(true);
    button->installEventFilter(this);
    const int place = int(m_areas.size());
    m_column->insertWidget(place, button);
    m_areas.push_back(button);
    connect(button, &QAbstractButton::clicked, this, [this, place] { Q_EMIT chosen(place); });
    return button;
}

RailButton* Rail::add_foot(const QString& icon_name, const QString& text)
{
    auto* button = new RailButton(icon_name, text);
    m_foot_column->addWidget(button);
    m_foot.push_back(button);
    return button;
}

void Rail::set_narrow(bool shortened)
{
    setFixedWidth(shortened ? narrow : wide);
    for (const auto* group : {&m_areas, &m_foot})
        for (RailButton* button : *group)
            button->set_narrow(shortened);
}

void Rail::fit()
{
    int needed = 2 * space::field;
    for (const auto* group : {&m_areas, &m_foot})
        for (const RailButton* button : *group)
            needed += button->full_height() + gap;
    for (const auto* group : {&m_areas, &m_foot})
        for (RailButton* button : *group)
            button->set_low(needed > height());
    place_arrows();
}

void Rail::bring_into_view(QWidget& button)
{
    const QRect place = button.geometry();
    m_scroll->ensureVisible(0, place.bottom() + gap, 0, arrow_height);
    m_scroll->ensureVisible(0, place.top() - gap, 0, arrow_height);
}

void Rail::place_arrows()
{
    const QScrollBar* bar = m_scroll->verticalScrollBar();
    const QRect place = m_scroll->geometry();
    m_earlier->setGeometry(place.left(), place.top(), place.width(), arrow_height);
    m_further->setGeometry(place.left(), place.bottom() + 1 - arrow_height, place.width(), arrow_height);
    m_earlier->setVisible(bar->value() > bar->minimum());
    m_further->setVisible(bar->value() < bar->maximum());
    for (auto* arrow : {m_earlier, m_further})
        arrow->raise();
}

bool Rail::event(QEvent* event)
{
    const bool done = QWidget::event(event);
    if (event->type() == QEvent::Resize || event->type() == QEvent::FontChange ||
        event->type() == QEvent::LayoutRequest)
        fit();
    return done;
}

void Rail::go(const QObject* from, int step)
{
    const int count = int(m_areas.size());
    int place = int(std::ranges::find(m_areas, from) - m_areas.begin()) + step;
    while (place >= 0 && place < count && !m_areas[std::size_t(place)]->isEnabled())
        place += step;
    if (place >= 0 && place < count)
        m_areas[std::size_t(place)]->setFocus(step < 0 ? Qt::BacktabFocusReason : Qt::TabFocusReason);
}

bool Rail::eventFilter(QObject* target, QEvent* event)
{
    if (event->type() == QEvent::FocusIn)
        bring_into_view(*static_cast<QWidget*>(target));
    if (event->type() != QEvent::KeyPress)
        return QWidget::eventFilter(target, event);
    const int key = static_cast<QKeyEvent*>(event)->key();
    if (key == Qt::Key_Up || key == Qt::Key_Down) // The button itself would open every area on the way.
        go(target, key == Qt::Key_Up ? -1 : 1);
    else if (key == Qt::Key_Return || key == Qt::Key_Enter)
        static_cast<RailButton*>(target)->click();
    else
        return QWidget::eventFilter(target, event);
    return true;
}

void Rail::choose(int area)
{
    RailButton& button = *m_areas.at(std::size_t(area));
    button.setChecked(true);
    bring_into_view(button);
}

void Rail::mark(int area, const RailMarks& marks)
{
    m_areas.at(std::size_t(area))->set_marks(marks);
}

void Rail::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.fillRect(rect(), palette().color(QPalette::Button));
    painter.setPen(line_colour(shade_of(palette())));
    painter.drawLine(rect().topRight(), rect().bottomRight());
}

} // namespace kindrel::desktop
