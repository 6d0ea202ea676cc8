#include "desktop/output/preview_window.h"

#include "core/files.h"
#include "desktop/output/preview_bar.h"
#include "desktop/output/run_strip.h"
#include "desktop/output/thumbnails.h"
#include "desktop/shell/help.h"
#include "desktop/shell/note_bar.h"
#include "desktop/shell/only_window.h"
#include "desktop/shell/printing.h"
#include "pages/pdf.h"

#include <QApplication>
#include <QCloseEvent>
#include <QHBoxLayout>
#include <QShortcut>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr QSize first_size{940, 690};

Zoom kept_zoom(const Remembered& remembered)
{
    const int fit = remembered.value(u"preview/fit"_s, int(Zoom::Fit::width)).toInt();
    return {Zoom::Fit(std::clamp(fit, int(Zoom::Fit::width), int(Zoom::Fit::none))),
            remembered.value(u"preview/percent"_s, 100).toInt()};
}

void keep(Remembered& remembered, Zoom zoom)
{
    remembered.keep(u"preview/fit"_s, int(zoom.fit));
    remembered.keep(u"preview/percent"_s, zoom.percent);
}

} // namespace

PreviewWindow::PreviewWindow(Desk& desk, const QString& title, const QString& printed)
    : m_desk(desk), m_bar(new PreviewBar), m_note(new NoteBar), m_thumbnails(new Thumbnails(m_spool)),
      m_view(new PageView(m_spool)), m_strip(new RunStrip(desk.office.dialogue)),
      m_printed(printed.isEmpty() ? u"Sent to the printer."_s : printed)
{
    setObjectName(u"preview"_s);
    setWindowTitle(title);
    lay_out();
    connect_tools();
    add_keys();
    m_view->set_zoom(kept_zoom(desk.remembered));
    m_view->setFocus();
    m_spool.on_page([this](int number) { page_came(number); });
}

void PreviewWindow::lay_out()
{
    auto* pages = new QHBoxLayout;
    pages->setSpacing(0);
    pages->addWidget(m_thumbnails);
    pages->addWidget(m_view, 1);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(0);
    column->addWidget(m_bar);
    column->addWidget(m_note);
    column->addLayout(pages, 1);
    column->addWidget(m_strip);
}

void PreviewWindow::connect_tools()
{
    connect(m_bar, &PreviewBar::page_wanted, m_view, &PageView::show_page);
    connect(m_bar, &PreviewBar::turn_wanted, this, [this](int by) { m_view->show_page(m_view->number() + by); });
    connect(m_bar, &PreviewBar::zoom_wanted, m_view, &PageView::set_zoom);
    connect(m_bar, &PreviewBar::zoom_step_wanted, m_view, &PageView::zoom_by);
    connect(m_bar, &PreviewBar::find_wanted, this, &PreviewWindow::find);
    connect(m_bar, &PreviewBar::print_wanted, this, &PreviewWindow::print);
    connect(m_bar, &PreviewBar::pdf_wanted, this, &PreviewWindow::save_pdf);
    connect(m_thumbnails, &Thumbnails::chosen, m_view, &PageView::show_page);
    connect(m_view, &PageView::page_changed, this, &PreviewWindow::show_state);
    connect(m_view, &PageView::zoom_changed, this, [this] {
        m_bar->show_zoom(*m_view);
        keep(m_desk.remembered, m_view->zoom());
    });
}

void PreviewWindow::add_keys()
{
    const auto key = [this](const QKeySequence& keys, auto action) {
        connect(new QShortcut(keys, this), &QShortcut::activated, this, action);
    };
    key(QKeySequence::Find, [this] { m_bar->focus_find(); });
    key(QKeySequence::Print, [this] { print(); });
    key(QKeySequence::Save, [this] { save_pdf(); });
    key(Qt::CTRL | Qt::Key_G, [this] { m_bar->focus_page(); });
    key(Qt::CTRL | Qt::Key_Plus, [this] { m_view->zoom_by(1); });
    key(Qt::CTRL | Qt::Key_Equal, [this] { m_view->zoom_by(1); });
    key(Qt::CTRL | Qt::Key_Minus, [this] { m_view->zoom_by(-1); });
    key(Qt::CTRL | Qt::Key_0, [this] { m_view->set_zoom({Zoom::Fit::none, 100}); });
    key(Qt::CTRL | Qt::Key_K, [this] { m_desk.navigation.find_family(); });
    key(Qt::Key_F1, [this] { open_help(m_desk.windows, u"preview"_s); });
    key(Qt::Key_Escape, [this] { m_view->setFocus(); });
}

void PreviewWindow::page_came(int number)
{
    m_thumbnails->grow();
    m_view->refresh();
    show_state();
    if (number == 1)
        m_strip->yield();
}

bool PreviewWindow::produced(const Producer& produce)
{
    const OnlyWindow alone(*this);
    try {
        return produce(*m_strip, m_spool);
    } catch (const core::FileError& error) {
        m_desk.office.dialogue.show({u"The report could not be made."_s, error.text()});
    } catch (const core::DatabaseError& error) {
        m_desk.office.dialogue.show({u"The report could not be made."_s, error.text()});
    }
    return false;
}

void PreviewWindow::run(const Producer& produce)
{
    m_running = true;
    m_bar->set_complete(false);
    const bool whole = produced(produce);
    m_running = false;
    m_strip->end();
    m_bar->set_complete(true);
    m_view->refresh();
    show_state();
    if (!whole)
        close();
}

void PreviewWindow::show_state()
{
    m_bar->show_page(m_view->number(), m_spool.page_count(), m_spool.finished());
    m_thumbnails->show_page(m_view->number());
}

void PreviewWindow::find(const QString& text, bool backwards)
{
    m_note->clear();
    m_view->mark(text);
    const int count = m_spool.page_count();
    // New words are sought on the page in sight too, the same ones again from the next page on.
    const int first = text == m_sought ? 1 : 0;
    m_sought = text;
    for (int step = first; !text.isEmpty() && step < first + count; ++step) {
        const int place = m_view->number() - 1 + (backwards ? 2 * count - step : step);
        const int number = place % count + 1;
        if (pages::find(m_spool.page(number), text).empty())
            continue;
        m_view->show_page(number);
        return;
    }
    if (!text.isEmpty())
        m_note->say(u"\u201c%1\u201d does not occur in this document."_s.arg(text));
}

void PreviewWindow::print()
{
    if (!m_running && m_desk.printing.print({m_spool, windowTitle(), m_view->number()}, *this))
        m_note->say(m_printed);
}

void PreviewWindow::save_pdf()
{
    if (m_running)
        return;
    const auto file = m_desk.office.dialogue.choose_file({.title = u"Save as PDF"_s,
                                                          .filter = u"PDF (*.pdf)"_s,
                                                          .suggested = windowTitle().replace(u'/', u'-') + u".pdf"_s,
                                                          .kind = core::FileQuestion::Kind::save});
    if (!file)
        return;
    try {
        if (pages::write_pdf(m_spool, *file, {windowTitle(), core::product.toString()}, &m_desk.progress))
            m_note->say(u"Saved as %1"_s.arg(*file));
    } catch (const core::FileError& error) {
        m_desk.office.dialogue.show({u"The document could not be saved."_s, error.text()});
    }
}

void PreviewWindow::closeEvent(QCloseEvent* event)
{
    if (!m_running) {
        event->accept();
        return;
    }
    m_strip->ask_to_cancel();
    event->ignore();
}

void open_preview(Desk& desk, const QString& title, const Producer& produce, const QString& printed)
{
    auto* window = new PreviewWindow(desk, title, printed);
    desk.windows.open(window, first_size);
    QMetaObject::invokeMethod(
        window, [window, produce] { window->run(produce); }, Qt::QueuedConnection);
}

} // namespace kindrel::desktop
