#pragma once

#include "desktop/people/editor_tab.h"

#include <functional>

class QMenu;

namespace kindrel::desktop {

class NoteBar;

/// What is done with a person or a family as a whole. What was done stands in the note bar.
class EditorCommands : public QObject
{
    Q_OBJECT

public:
    /// `ready` is asked before each command: what is typed and not entered yet belongs to the family. A command does
    /// not run when it answers false.
    EditorCommands(EditorBench& bench, NoteBar& note, QWidget& page, std::function<bool()> ready);

    [[nodiscard]] QMenu& menu() { return *m_menu; }

private:
    void add(const QString& text, void (EditorCommands::*command)());
    void transfer_to_new();
    void transfer();
    void move_to_church();
    void add_to_visitation();
    void remove_family();
    [[nodiscard]] QString person_name() const;
    void done(const QString& note);

    EditorBench& m_bench;
    NoteBar& m_note;
    std::function<bool()> m_ready;
    QMenu* m_menu;
};

} // namespace kindrel::desktop
