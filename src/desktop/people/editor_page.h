#pragma once

#include "core/entry.h"
#include "desktop/people/editor_tab.h"
#include "desktop/shell/page.h"

namespace kindrel::desktop {

class DraftKeeper;
class DuplicateWatch;
class EditorBook;
class EditorCommands;
class EditorHeader;
class EditorPeople;

/// One family file to be read, changed and saved, under its lock.
class EditorPage : public Page
{
    Q_OBJECT

public:
    /// Null, after saying why, when the area cannot be entered.
    [[nodiscard]] static EditorPage* open(Desk& desk);

    /// False, after saying why, when the family before stays or this one cannot be opened. `among` are the families to
    /// turn the pages in, `among_name` what they are called.
    [[nodiscard]] bool open_family(int surname_id, std::vector<int> among, const QString& among_name);
    /// With the surname, where one is known already.
    [[nodiscard]] bool new_family(const QString& surname = {});
    [[nodiscard]] bool open_draft(int surname_id);

    [[nodiscard]] QString help() const override { return QStringLiteral("editor"); }
    void entered() override;
    void find() override;
    bool save() override;
    [[nodiscard]] bool altered() const override { return m_bench.editor.altered(); }
    [[nodiscard]] bool holds_lock() const override;
    [[nodiscard]] bool leave() override;

private:
    EditorPage(Desk& desk, core::AreaEntry entry);

    [[nodiscard]] QWidget* make_content();
    void add_actions();
    void add_menu();
    void show_family();
    void show_person();
    [[nodiscard]] bool finish_typing();
    /// After another family has come: from its first person on.
    void arrive();
    void turn(bool (people::FamilyEditor::*step)());
    void undo();
    void focus_guilty(people::SaveRefusal::Where where);

    core::AreaEntry m_entry;
    EditorBench m_bench;
    EditorHeader* m_header;
    EditorPeople* m_people;
    EditorBook* m_tabs;
    EditorCommands* m_commands;
    DuplicateWatch* m_duplicates;
    DraftKeeper* m_drafts;
    QAction* m_undo = nullptr;
    bool m_saved = false;
};

} // namespace kindrel::desktop
