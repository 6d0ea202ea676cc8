#include "desktop/people/editor_page.h"

#include "desktop/people/draft_keeper.h"
#include "desktop/people/duplicate_watch.h"
#include "desktop/people/editor_book.h"
#include "desktop/people/editor_commands.h"
#include "desktop/people/editor_header.h"
#include "desktop/people/editor_people.h"
#include "desktop/shell/chip.h"
#include "desktop/shell/look.h"
#include "desktop/shell/note_bar.h"

#include <QAction>
#include <QCoreApplication>
#include <QHBoxLayout>
#include <QMenu>
#include <QToolButton>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::FamilyEditor;
using people::Saved;
using Where = people::SaveRefusal::Where;

EditorPage* EditorPage::open(Desk& desk)
{
    auto entry = core::enter(desk.office, core::AreaId::family_editor);
    return entry ? new EditorPage(desk, std::move(*entry)) : nullptr;
}

EditorPage::EditorPage(Desk& desk, core::AreaEntry entry)
    : Page({}), m_entry(std::move(entry)), m_bench(desk, nullptr), m_header(new EditorHeader(m_bench)),
      m_people(new EditorPeople(m_bench)), m_tabs(new EditorBook(m_bench, note())),
      m_commands(new EditorCommands(m_bench, note(), *this, [this] { return finish_typing(); })),
      m_duplicates(new DuplicateWatch(m_bench, note(), this)), m_drafts(new DraftKeeper(m_bench, note(), this))
{
    setObjectName(u"Editor"_s);
    set_content(make_content());
    add_actions();
    add_menu();
    setTabOrder(m_people->last_field(), m_tabs->first_field());
    m_duplicates->follow(*this);
    connect(&m_bench, &EditorBench::changed, this, &EditorPage::show_family);
    connect(&m_bench, &EditorBench::person_chosen, this, &EditorPage::show_person);
    connect(m_people, &EditorPeople::opened, m_tabs, &EditorBook::open_person);
    connect(m_people, &EditorPeople::name_entered, m_duplicates, &DuplicateWatch::look);
    show_family();
}

QWidget* EditorPage::make_content()
{
    auto* content = new QWidget;
    auto* row = new QHBoxLayout;
    row->setSpacing(0);
    row->addWidget(m_people);
    row->addWidget(m_tabs, 1);
    auto* column = new QVBoxLayout(content);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(0);
    column->addWidget(m_header);
    column->addLayout(row, 1);
    return content;
}

void EditorPage::add_actions()
{
    const auto add = [this](const QString& text, const QString& icon_name, const QString& tip, const QKeySequence& keys,
                            auto act) {
        QAction* action = add_action(text, icon_name, tip);
        action->setShortcut(keys);
        action->setShortcutContext(Qt::WidgetWithChildrenShortcut);
        connect(action, &QAction::triggered, this, act);
        return action;
    };
    add(u"Save"_s, u"document-save"_s, u"Save the family file (Ctrl+S)"_s, {}, [this] { save(); });
    add(u"New"_s, u"list-add"_s, u"A new family file (Ctrl+N)"_s, {}, [this] { (void)new_family(); });
    add(u"Previous"_s, u"go-previous"_s, u"The family before (Ctrl+PgUp)"_s, Qt::CTRL | Qt::Key_PageUp,
        [this] { turn(&FamilyEditor::previous); });
    add(u"Next"_s, u"go-next"_s, u"The family behind (Ctrl+PgDn)"_s, Qt::CTRL | Qt::Key_PageDown,
        [this] { turn(&FamilyEditor::next); });
    m_undo =
        add(u"Undo"_s, u"edit-undo"_s, u"Take back the last change (Ctrl+Z)"_s, QKeySequence::Undo, [this] { undo(); });
}

void EditorPage::add_menu()
{
    QAction* more = add_action(u"More"_s, u"application-menu"_s, u"Transfer, move and delete (Alt+O)"_s);
    more->setShortcut(Qt::ALT | Qt::Key_O);
    more->setShortcutContext(Qt::WidgetWithChildrenShortcut);
    connect(more, &QAction::triggered, this, [this, more] {
        for (const QObject* of : more->associatedObjects())
            if (const auto* button = qobject_cast<const QToolButton*>(of))
                m_commands->menu().popup(button->mapToGlobal(QPoint(0, button->height())));
    });
}

void EditorPage::show_family()
{
    const FamilyEditor& editor = m_bench.editor;
    const int people = int(editor.file().people.size());
    if (m_bench.person() >= people || (people > 0 && m_bench.person() < 0))
        m_bench.choose_person(m_bench.person());
    m_saved = m_saved && !editor.altered();
    set_title(editor.caption().trimmed());
    chip().set(editor.altered() ? u"not saved"_s : QString(), State::altered);
    m_undo->setEnabled(editor.can_undo());
    m_header->show_file();
    show_person();
    set_status(m_saved ? u"Saved"_s : QString());
    Q_EMIT state_changed();
}

void EditorPage::show_person()
{
    m_people->show_file();
    m_tabs->show_file();
}

bool EditorPage::finish_typing()
{
    return m_people->finish_typing() && m_tabs->finish_typing();
}

void EditorPage::entered()
{
    m_tabs->read_lists();
    if (!focusWidget() || m_bench.editor.is_new())
        m_people->focus_surname();
    else
        focusWidget()->setFocus();
}

void EditorPage::find()
{
    m_people->focus_surname();
}

void EditorPage::arrive()
{
    m_saved = false;
    m_duplicates->forget();
    note().clear();
    m_bench.choose_person(0);
    show_family();
    if (m_bench.editor.is_new()) {
        m_tabs->setCurrentIndex(0);
        m_people->focus_surname();
    }
}

bool EditorPage::open_family(int surname_id, std::vector<int> among, const QString& among_name)
{
    if (surname_id == m_bench.editor.stored().family.Surname_ID && surname_id != 0) {
        m_bench.editor.walk(std::move(among), among_name);
        return true; // It is here already, with what was typed.
    }
    if (!finish_typing() || !m_bench.editor.open(surname_id)) {
        show_family();
        return false;
    }
    m_bench.editor.walk(std::move(among), among_name);
    arrive();
    if (!m_bench.editor.is_new())
        m_people->focus_people();
    return true;
}

bool EditorPage::new_family(const QString& surname)
{
    const bool started = finish_typing() && m_bench.editor.start_new();
    if (!started) {
        show_family();
        return false;
    }
    if (!surname.isEmpty())
        m_bench.editor.change(u"surname"_s, [&](people::FamilyFile& file) { file.family.surname = surname; });
    arrive();
    return true;
}

bool EditorPage::open_draft(int surname_id)
{
    const auto drafts = people::Drafts(m_bench.desk.office).all();
    const auto draft =
        std::ranges::find(drafts, surname_id, [](const people::Draft& each) { return each.stored.family.Surname_ID; });
    if (draft == drafts.end() || !finish_typing() || !m_bench.editor.restore(*draft))
        return false;
    arrive();
    return true;
}

void EditorPage::turn(bool (FamilyEditor::*step)())
{
    if (finish_typing() && (m_bench.editor.*step)())
        arrive();
    else
        show_family();
}

void EditorPage::undo()
{
    m_bench.editor.undo();
    m_bench.show_again();
}

bool EditorPage::holds_lock() const
{
    return m_bench.desk.office.shared() && !m_bench.editor.is_new();
}

bool EditorPage::save()
{
    if (!finish_typing())
        return false;
    set_status(u"Saving..."_s);
    QCoreApplication::processEvents(QEventLoop::ExcludeUserInputEvents);
    const Saved saved = m_bench.editor.save();
    m_saved = saved == Saved::yes;
    m_bench.show_again();
    if (saved == Saved::left)
        Q_EMIT finished();
    else if (const auto guilty = m_bench.editor.guilty(); saved == Saved::no && guilty)
        focus_guilty(*guilty);
    return m_saved;
}

bool EditorPage::leave()
{
    const bool left = finish_typing() && m_bench.editor.leave();
    m_bench.show_again(); // The page may stay, for another one may not let go.
    if (!left && m_bench.editor.guilty())
        focus_guilty(*m_bench.editor.guilty());
    return left;
}

void EditorPage::focus_guilty(Where where)
{
    if (where == Where::surname)
        m_people->focus_surname();
    else if (where == Where::people)
        m_people->focus_add_line();
    else
        m_tabs->focus_guilty(where);
}

} // namespace kindrel::desktop
