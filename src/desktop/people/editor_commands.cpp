#include "desktop/people/editor_commands.h"

#include "desktop/people/church_dialog.h"
#include "desktop/people/transfer_dialog.h"
#include "desktop/shell/note_bar.h"

#include <QMenu>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

EditorCommands::EditorCommands(EditorBench& bench, NoteBar& note, QWidget& page, std::function<bool()> ready)
    : QObject(&page), m_bench(bench), m_note(note), m_ready(std::move(ready)), m_menu(new QMenu(&page))
{
    m_menu->setObjectName(u"more"_s);
    add(u"Transfer person to &new family"_s, &EditorCommands::transfer_to_new);
    add(u"&Transfer person into existing family\u2026"_s, &EditorCommands::transfer);
    m_menu->addSeparator();
    add(u"&Move to another church\u2026"_s, &EditorCommands::move_to_church);
    add(u"Add to &visitation list"_s, &EditorCommands::add_to_visitation);
    m_menu->addSeparator();
    add(u"&Delete family"_s, &EditorCommands::remove_family);
}

void EditorCommands::add(const QString& text, void (EditorCommands::*command)())
{
    connect(m_menu->addAction(text), &QAction::triggered, this, [this, command] {
        if (m_ready())
            (this->*command)();
    });
}

QString EditorCommands::person_name() const
{
    const auto& people = m_bench.editor.file().people;
    const int person = m_bench.person();
    return person < 0 || person >= std::ssize(people) ? QString() : people[std::size_t(person)].Name;
}

void EditorCommands::done(const QString& note)
{
    m_bench.choose_person(0);
    m_bench.show_again();
    m_note.say(note);
}

void EditorCommands::transfer_to_new()
{
    const QString name = person_name();
    if (m_bench.editor.transfer_to_new(m_bench.person()))
        done(u"%1 has a family file of their own now."_s.arg(name));
    else
        m_bench.show_again(); // It may have been saved first.
}

void EditorCommands::transfer()
{
    if (!m_bench.editor.may_transfer()) // Before a family is chosen in vain.
        return;
    const QString name = person_name();
    const auto family = choose_family(m_bench.desk, m_bench.editor.file().family.Surname_ID);
    if (family && m_bench.editor.transfer_to(m_bench.person(), *family))
        done(u"%1 is in the other family file now."_s.arg(name));
    else
        m_bench.show_again();
}

void EditorCommands::move_to_church()
{
    const QString surname = m_bench.editor.file().family.surname;
    const ChurchChoice choice = choose_other_church(m_bench.desk);
    if (!choice.cancelled && m_bench.editor.move_to_church(choice.church, m_bench.desk.progress))
        done(u"The %1 family is in the other church now."_s.arg(surname));
}

void EditorCommands::add_to_visitation()
{
    if (m_bench.editor.add_to_visitation())
        done(u"The family is on the visitation list."_s);
    else
        m_bench.show_again();
}

void EditorCommands::remove_family()
{
    const QString surname = m_bench.editor.file().family.surname;
    const bool stored = !m_bench.editor.is_new();
    if (m_bench.editor.remove_family())
        done(stored ? u"The %1 family was deleted."_s.arg(surname) : QString());
}

} // namespace kindrel::desktop
