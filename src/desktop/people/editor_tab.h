#pragma once

#include "desktop/shell/desk.h"
#include "people/family_editor.h"

#include <QObject>
#include <QWidget>

namespace kindrel::desktop {

/// What the parts of the editor's screen work on: the family in the editor and the person chosen in it.
class EditorBench : public QObject
{
    Q_OBJECT

public:
    EditorBench(Desk& on, QObject* parent) : QObject(parent), desk(on), editor(on.office) {}

    Desk& desk;
    people::FamilyEditor editor;

    /// The place of the chosen person in the family, -1 while it has nobody.
    [[nodiscard]] int person() const { return m_person; }
    void choose_person(int person);
    /// After anything in the editor was changed, by whichever part: everybody shows the family again.
    void show_again() { Q_EMIT changed(); }

Q_SIGNALS:
    void changed();
    void person_chosen();

private:
    int m_person = -1;
};

/// A tab of the editor. It shows what the bench holds, and writes what is typed through the editor as it is typed.
class EditorTab : public QWidget
{
    Q_OBJECT

public:
    explicit EditorTab(EditorBench& bench) : m_bench(bench) {}

    /// Shows the family and the chosen person; a field that the cursor is in keeps what is being typed.
    virtual void show_file() = 0;
    /// Brings what is typed and not entered yet into the family; false when it was refused.
    [[nodiscard]] virtual bool finish_typing() { return true; }
    /// Puts the cursor where a refused save belongs; false when that is on another tab.
    [[nodiscard]] virtual bool focus_guilty(people::SaveRefusal::Where) { return false; }

protected:
    [[nodiscard]] EditorBench& bench() const { return m_bench; }
    [[nodiscard]] people::FamilyEditor& editor() const { return m_bench.editor; }
    [[nodiscard]] const people::FamilyFile& file() const { return m_bench.editor.file(); }

private:
    EditorBench& m_bench;
};

} // namespace kindrel::desktop
