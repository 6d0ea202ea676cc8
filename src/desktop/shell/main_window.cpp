#include "desktop/shell/main_window.h"

#include "desktop/shell/help.h"
#include "desktop/shell/idle_watch.h"
#include "desktop/shell/page.h"
#include "desktop/shell/rail.h"
#include "desktop/shell/view_menu.h"

#include <QCloseEvent>
#include <QHBoxLayout>
#include <QLabel>
#include <QMenu>
#include <QShortcut>
#include <QStackedWidget>
#include <QStatusBar>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int narrow_below = 900;
constexpr QSize first_size{1024, 690};
constexpr QSize least_size{720, 480};

QString mode_words(const core::Office& office)
{
    switch (office.mode) {
    case core::Mode::training:
        return u"Training Mode"_s;
    case core::Mode::booked_out:
        return u"Remote Access Mode"_s;
    case core::Mode::network:
        return u"Network Mode"_s;
    case core::Mode::normal:
        break;
    }
    return u"This workstation"_s;
}

} // namespace

MainWindow::MainWindow(Desk& desk, std::span<const AreaDefinition> areas, Look& look)
    : m_desk(desk), m_areas(areas), m_look(look), m_rail(new Rail), m_stack(new QStackedWidget), m_mode(new QLabel),
      m_count(new QLabel), m_pages(areas.size())
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
    return !area.right || m_desk.office.may(*area.right);
}

void MainWindow::add_areas()
{
    for (std::size_t place = 0; place < m_areas.size(); ++place) {
        const AreaDefinition& area = m_areas[place];
        auto* button = m_rail->add_area(QString::fromLatin1(area.icon), QString::fromLatin1(area.title));
        const QKeySequence key(Qt::CTRL | Qt::Key(Qt::Key_1 + place));
        button->setObjectName(QString::fromLatin1(area.key));
        button->setEnabled(granted(area));
        button->set_tip(granted(area) ? u"%1 (%2)"_s.arg(button->text(), key.toString(QKeySequence::NativeText))
                                      : u"Your password does not open this area"_s);
        if (place < 9) {
            auto* shortcut = new QShortcut(key, this);
            connect(shortcut, &QShortcut::activated, this, [this, place] { open_place(place); });
        }
    }
    connect(m_rail, &Rail::chosen, this, [this](int place) { open_place(std::size_t(place)); });
}

void MainWindow::add_foot()
{
    auto* view = m_rail->add_foot(u"configure"_s, u"View"_s);
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
    key(QKeySequence::Find, [this] { page()->find(); });
    key(QKeySequence::Save, [this] { page()->save(); });
    key(QKeySequence::Print, [this] { page()->print(); });
    key(Qt::CTRL | Qt::Key_W, [this] { close_page(); });
    key(Qt::Key_F1, [this] { show_help(); });
}

Page* MainWindow::page() const
{
    return static_cast<Page*>(m_stack->currentWidget());
}

void MainWindow::open_area(const QString& key)
{
    for (std::size_t place = 0; place < m_areas.size(); ++place)
        if (key == QLatin1StringView(m_areas[place].key))
            open_place(place);
}

void MainWindow::open_place(std::size_t place)
{
    if (!granted(m_areas[place]) || !(m_pages[place] || make_page(place)))
        return;
    m_stack->setCurrentWidget(m_pages[place]);
    m_rail->choose(int(place));
    m_pages[place]->entered();
    show_status();
}

bool MainWindow::make_page(std::size_t place)
{
    if (page())
        m_rail->choose(int(place_of(page()))); // Until the area lets us in.
    Page* made = m_areas[place].make(m_desk);
    if (!made)
        return false;
    m_pages[place] = made;
    m_stack->addWidget(made);
    connect(made, &Page::status_changed, this, &MainWindow::show_status);
    connect(made, &Page::state_changed, this, &MainWindow::show_marks);
    show_marks();
    return true;
}

std::size_t MainWindow::place_of(const Page* page) const
{
    return std::size_t(std::find(m_pages.begin(), m_pages.end(), page) - m_pages.begin());
}

void MainWindow::show_marks()
{
    for (std::size_t place = 0; place < m_pages.size(); ++place) {
        const Page* page = m_pages[place];
        const bool locked = page && page->holds_lock();
        m_rail->mark(int(place), {.altered = page && page->altered(), .locked = locked, .idle = locked && m_idle});
    }
}

void MainWindow::set_idle(bool idle)
{
    m_idle = idle;
    show_marks();
}

void MainWindow::close_page()
{
    const std::size_t place = place_of(page());
    if (place == 0 || !page()->leave())
        return;
    Page* closing = page();
    m_pages[place] = nullptr;
    open_place(0);
    closing->deleteLater();
    m_stack->removeWidget(closing);
    show_marks();
}

bool MainWindow::leave_all()
{
    return std::all_of(m_pages.begin(), m_pages.end(), [](Page* page) { return !page || page->leave(); });
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
    if (!leave_all()) {
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
