#include "desktop/shell/main_window.h"

#include "desktop/shell/help.h"
#include "desktop/shell/idle_watch.h"
#include "desktop/shell/mode_words.h"
#include "desktop/shell/page.h"
#include "desktop/shell/page_stack.h"
#include "desktop/shell/rail.h"
#include "desktop/shell/view_menu.h"

#include <QCloseEvent>
#include <QHBoxLayout>
#include <QLabel>
#include <QMenu>
#include <QShortcut>
#include <QStatusBar>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr std::size_t areas_with_keys = 9;
constexpr int narrow_below = 900;
constexpr QSize first_size{1024, 690};
constexpr QSize least_size{720, 480};

} // namespace

MainWindow::MainWindow(Desk& desk, std::span<const AreaDefinition> areas, Look& look)
    : m_desk(desk), m_areas(areas), m_look(look), m_rail(new Rail), m_stack(new PageStack(areas)), m_mode(new QLabel),
      m_count(new QLabel)
{
    setObjectName(u"main_window"_s);
    setWindowTitle(core::product.toString() + desk.office.caption_suffix);
    setMinimumSize(least_size);
    auto* content = new QWidget;
    auto* row = new QHBoxLayout(content);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(0);
    row->addWidget(m_rail);
    row->addWidget(m_stack, 1);
    setCentralWidget(content);
    add_areas();
    add_foot();
    add_status_bar();
    add_keys();
    follow_window(desk.remembered, *this, first_size);
    open_place(0);
    auto* watch = new IdleWatch(this);
    connect(watch, &IdleWatch::idle, this, [this] { set_idle(true); });
    connect(watch, &IdleWatch::returned, this, [this] { set_idle(false); });
}

bool MainWindow::granted(const AreaDefinition& area) const
{
    return !area.area || core::may_enter(m_desk.office, *area.area);
}

void MainWindow::add_areas()
{
    for (std::size_t place = 0; place < m_areas.size(); ++place) {
        const AreaDefinition& area = m_areas[place];
        auto* button = m_rail->add_area(QString::fromLatin1(area.icon), QString::fromLatin1(area.title));
        button->setObjectName(QString::fromLatin1(area.key));
        button->setEnabled(granted(area));
        button->set_tip(granted(area) ? button->text() : u"Your password does not open this area"_s);
        if (place >= areas_with_keys)
            continue;
        const QKeySequence key(Qt::CTRL | Qt::Key(Qt::Key_1 + place));
        if (granted(area))
            button->set_tip(u"%1 (%2)"_s.arg(button->text(), key.toString(QKeySequence::NativeText)));
        connect(new QShortcut(key, this), &QShortcut::activated, this, [this, place] { open_place(place); });
    }
    connect(m_rail, &Rail::chosen, this, [this](int place) { open_place(std::size_t(place)); });
    connect(m_stack, &PageStack::came_forward, this, [this](std::size_t place) {
        m_rail->choose(int(place));
        show_status();
    });
    connect(m_stack, &PageStack::closed, this, &MainWindow::show_marks);
}

void MainWindow::add_foot()
{
    auto* view = m_rail->add_foot(u"contrast"_s, u"View"_s);
    view->setObjectName(u"view"_s);
    connect(view, &QAbstractButton::clicked, this, [this, view] {
        QMenu* menu = make_view_menu(m_look, m_desk.remembered, this);
        menu->popup(view->mapToGlobal(QPoint(view->width(), view->height() - menu->sizeHint().height())));
    });
    auto* help = m_rail->add_foot(u"help-contents"_s, u"Help"_s);
    help->setToolTip(u"Help on this page (F1)"_s);
    connect(help, &QAbstractButton::clicked, this, &MainWindow::show_help);
}

void MainWindow::add_status_bar()
{
    statusBar()->setSizeGripEnabled(false);
    m_mode->setText(mode_words(m_desk.office));
    for (QLabel* label : {m_count, m_mode}) {
        dress(*label, TextSize::secondary);
        label->setContentsMargins(space::field, 0, space::field, 0);
        statusBar()->addPermanentWidget(label);
    }
}

void MainWindow::add_keys()
{
    const auto key = [this](const QKeySequence& keys, auto action) {
        connect(new QShortcut(keys, this), &QShortcut::activated, this, action);
    };
    key(Qt::CTRL | Qt::Key_K, [this] { m_desk.navigation.find_family(); });
    key(QKeySequence::New, [this] { m_desk.navigation.new_family(); });
    key(QKeySequence::Find, [this] { page()->find(); });
    key(QKeySequence::Save, [this] { page()->save(); });
    key(QKeySequence::Print, [this] { page()->print(); });
    key(Qt::CTRL | Qt::Key_W, [this] { close_page(); });
    key(Qt::Key_F1, [this] { show_help(); });
}

Page* MainWindow::page() const
{
    return m_stack->front();
}

std::size_t MainWindow::place_of(const QString& key) const
{
    const auto found =
        std::ranges::find_if(m_areas, [&key](const auto& area) { return key == QLatin1StringView(area.key); });
    return std::size_t(found - m_areas.begin());
}

void MainWindow::open_area(const QString& key)
{
    if (const std::size_t place = place_of(key); place < m_areas.size())
        open_place(place);
}

Page* MainWindow::page_of(const QString& key) const
{
    const std::size_t place = place_of(key);
    return place < m_areas.size() ? m_stack->at(place) : nullptr;
}

void MainWindow::close_place(std::size_t place)
{
    if (place == m_stack->front_place())
        open_place(0);
    m_stack->close(place);
}

void MainWindow::open_place(std::size_t place)
{
    if (!granted(m_areas[place]) || !(m_stack->at(place) || make_page(place)))
        return;
    m_stack->bring_forward(place);
    page()->entered();
}

bool MainWindow::make_page(std::size_t place)
{
    if (page())
        m_rail->choose(int(m_stack->front_place())); // Until the area lets us in.
    if (!m_stack->make_way(place))
        return false;
    Page* made = m_areas[place].make(m_desk);
    if (!made)
        return false;
    m_stack->put(place, made);
    connect(made, &Page::status_changed, this, &MainWindow::show_status);
    connect(made, &Page::state_changed, this, &MainWindow::show_marks);
    connect(
        made, &Page::finished, this, [this, place] { close_place(place); }, Qt::QueuedConnection);
    show_marks();
    Q_EMIT page_made(made);
    return true;
}

void MainWindow::show_marks()
{
    for (std::size_t place = 0; place < m_stack->places(); ++place) {
        const Page* page = m_stack->at(place);
        const bool locked = page && page->holds_lock();
        m_rail->mark(int(place), {.altered = page && page->altered(), .locked = locked, .idle = locked && m_idle});
    }
}

void MainWindow::close_page()
{
    const std::size_t place = m_stack->front_place();
    if (place != 0 && m_stack->leave(place))
        close_place(place);
}

bool MainWindow::leave_all()
{
    return m_stack->leave_all();
}

bool MainWindow::make_way_for(const QString& key)
{
    return m_stack->make_way(place_of(key));
}

void MainWindow::show_status()
{
    m_count->setText(page()->status());
}

void MainWindow::show_help()
{
    open_help(m_desk.windows, page()->help());
}

void MainWindow::closeEvent(QCloseEvent* event)
{
    const bool unasked = m_session_end.under_way() || !m_may_close;
    if (!leave_all() || !(unasked || m_may_close())) {
        event->ignore();
        return;
    }
    event->accept();
    Q_EMIT closed();
}

void MainWindow::resizeEvent(QResizeEvent* event)
{
    QMainWindow::resizeEvent(event);
    fit_rail();
}

void MainWindow::changeEvent(QEvent* event)
{
    QMainWindow::changeEvent(event);
    if (event->type() == QEvent::FontChange)
        fit_rail();
}

void MainWindow::fit_rail()
{
    // Larger text needs the room sooner.
    m_rail->set_narrow(width() < narrow_below * m_look.percent() / 100);
}

} // namespace kindrel::desktop
