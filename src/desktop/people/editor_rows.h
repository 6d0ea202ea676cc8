#pragma once

#include "desktop/people/editor_row_lists.h"
#include "desktop/people/editor_tab.h"

class QHBoxLayout;
class QLabel;
class QTableView;

namespace kindrel::desktop {

class AddLine;
class EditorRowsModel;
class InPlaceEditing;

/// One list of rows of the editor under its heading. Insert adds, Delete removes, Alt with an arrow moves, Enter types
/// into a cell, Space turns a tag over.
class EditorRows : public QWidget
{
    Q_OBJECT

public:
    EditorRows(EditorBench& bench, people::RowList list);

    /// Shows the rows of the family or of the chosen person; a cell that is open keeps what is being typed.
    void show_file();
    /// Brings what is typed into the family; false when it was refused.
    [[nodiscard]] bool finish_typing();

protected:
    bool eventFilter(QObject* target, QEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    struct Command
    {
        const char* name; ///< The button's object name.
        const char* text; ///< Null for a button that its icon explains.
        const char* icon;
        const char* tip;
        QKeySequence key;
        Qt::ShortcutContext reach;
        void (EditorRows::*run)();
    };

    [[nodiscard]] QHBoxLayout* make_heading_row();
    void add_command(QHBoxLayout& row, const Command& command);
    void furnish_table();
    void furnish_add_line();
    /// The chosen row stands out in the list that the cursor is in alone.
    void colour_choice();
    [[nodiscard]] int current() const;
    void select(int row);
    [[nodiscard]] QString words_instead() const;

    void add();
    void pick();
    [[nodiscard]] std::vector<people::LinkRow> items_to_add() const;
    void add_item(const people::LinkRow& item);
    void add_new_item(const QString& text);
    bool add_typed();
    void remove();
    void move_up();
    void move_down();
    void set_today();
    void turn_over();
    void open_cell();
    /// Shows the family again when the change was made; the cursor is in the list either way.
    void done(bool made, int row);

    EditorBench& m_bench;
    const RowListLook& m_look;
    EditorRowsModel* m_model;
    QTableView* m_table;
    InPlaceEditing* m_cells;
    AddLine* m_add_line = nullptr;
    QLabel* m_words;
    std::vector<QWidget*> m_commands;
};

} // namespace kindrel::desktop
