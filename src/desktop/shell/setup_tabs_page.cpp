#include "desktop/shell/setup_tabs_page.h"

#include "desktop/shell/chip.h"
#include "desktop/shell/note_bar.h"

#include <QAction>
#include <QShortcut>
#include <QTabWidget>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

SetupTabsPage::SetupTabsPage(Desk& desk, core::AreaEntry entry, const QString& title, SetupWords words,
                             const QString& tab_key)
    : Page(title), m_desk(desk), m_entry(std::move(entry)), m_words(std::move(words)), m_tab_key(tab_key),
      m_tabs(new QTabWidget)
{
    m_tabs->setDocumentMode(true);
    add_actions();
    set_content(m_tabs);
}

void SetupTabsPage::add_tab(QWidget* widget, const QString& title, SetupTab tab)
{
    m_tabs->addTab(widget, title);
    m_lists.push_back(std::move(tab));
}

void SetupTabsPage::start()
{
    m_tabs->setCurrentIndex(m_desk.remembered.value(m_tab_key, 0).toInt());
    connect(m_tabs, &QTabWidget::currentChanged, this, [this](int tab) {
        m_desk.remembered.keep(m_tab_key, tab);
        find();
        show_state();
    });
    show_lists();
}

void SetupTabsPage::add_actions()
{
    const auto turn = [this](const QKeySequence& keys, int by) {
        auto* key = new QShortcut(keys, this);
        key->setContext(Qt::WidgetWithChildrenShortcut);
        connect(key, &QShortcut::activated, this, [this, by] {
            m_tabs->setCurrentIndex((m_tabs->currentIndex() + by + m_tabs->count()) % m_tabs->count());
        });
    };
    turn(Qt::CTRL | Qt::Key_PageUp, -1);
    turn(Qt::CTRL | Qt::Key_PageDown, 1);
    auto* save_all = add_action(u"Save"_s, u"document-save"_s, m_words.save_tip);
    connect(save_all, &QAction::triggered, this, &SetupTabsPage::save);
    auto* cancel_all = add_action(u"Cancel"_s, u"edit-undo"_s, m_words.cancel_tip);
    connect(cancel_all, &QAction::triggered, this, &SetupTabsPage::cancel);
}

void SetupTabsPage::find()
{
    m_lists.at(std::size_t(m_tabs->currentIndex())).focus_list();
}

bool SetupTabsPage::altered() const
{
    return list_altered() || std::ranges::any_of(m_lists, [](const SetupTab& list) { return list.typing(); });
}

void SetupTabsPage::show_state()
{
    const bool unsaved = altered();
    m_saved = m_saved && !unsaved;
    chip().set(unsaved ? u"not saved"_s : QString(), State::altered);
    set_status(m_saved ? u"Saved"_s : QString());
    Q_EMIT state_changed();
}

void SetupTabsPage::show_lists()
{
    for (const SetupTab& list : m_lists)
        list.show();
    show_state();
}

bool SetupTabsPage::finish_typing()
{
    const int in_front = m_tabs->currentIndex();
    for (std::size_t tab = 0; tab < m_lists.size(); ++tab) {
        if (!m_lists[tab].typing())
            continue;
        m_tabs->setCurrentIndex(int(tab)); // What is refused is in sight, and the cursor stays with it.
        if (!m_lists[tab].finish_typing())
            return false;
    }
    m_tabs->setCurrentIndex(in_front);
    return true;
}

bool SetupTabsPage::save()
{
    bool typed = false;
    bool saved = false;
    try {
        typed = finish_typing();
        saved = typed && store();
    } catch (const core::DatabaseError& error) {
        m_desk.office.dialogue.show({m_words.unable_to_save, error.text()});
    }
    if (!typed)
        return false; // Everything stands as it was typed.
    m_saved = saved;
    show_lists();
    if (!saved)
        go_to_fault();
    return saved;
}

void SetupTabsPage::cancel()
{
    if (altered() && m_desk.office.dialogue.confirm({m_words.cancel_question}, core::Answer::no))
        drop();
}

void SetupTabsPage::drop()
{
    for (const SetupTab& list : m_lists)
        list.drop_typing();
    try {
        reread();
    } catch (const core::DatabaseError& error) { // The page must be able to close without its database.
        m_desk.office.dialogue.show({m_words.unable_to_read, error.text()});
    }
    note().clear();
    show_lists();
}

bool SetupTabsPage::leave()
{
    if (!save_or_drop(m_desk.office.dialogue, m_words.leave_question, [this] { drop(); }))
        return false;
    if (complete())
        return true;
    go_to_fault();
    return false;
}

} // namespace kindrel::desktop
