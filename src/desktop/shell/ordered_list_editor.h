#pragma once

#include "desktop/shell/ordered_list_model.h"

#include <QWidget>

#include <memory>

class QLabel;
class QStackedWidget;
class QTableView;

namespace kindrel::desktop {

class AddLine;
class CommandSide;
class InPlaceEditing;

/// A list in the person's own order: the line at the top adds to it, keys and buttons change what is chosen. Insert
/// goes to the line, Enter edits in place, Delete removes, Alt with an arrow moves.
class OrderedListEditor : public QWidget
{
    Q_OBJECT

public:
    /// Object names of columns and table are made from `name`.
    OrderedListEditor(std::unique_ptr<ListOperations> list, const QString& name, QWidget* parent = nullptr);
    ~OrderedListEditor() override;

    /// The chosen row, -1 when there is none.
    [[nodiscard]] int current() const;
    /// After the list was changed elsewhere. A place that is not there becomes the nearest one.
    void show_list(int current);
    void focus_list();
    void focus_add_line();

    /// Something stands in the line at the top or in an open cell that is not in the list yet.
    [[nodiscard]] bool typing() const;
    /// Brings it into the list; false when it was refused.
    [[nodiscard]] bool finish_typing();
    void drop_typing();

    /// Of several lists in sight only one has letters on its buttons; all have the keys.
    void drop_letters();
    /// For further controls under the buttons.
    [[nodiscard]] CommandSide& side() { return *m_side; }
    [[nodiscard]] QTableView& table() { return *m_table; }

Q_SIGNALS:
    /// The list, or what is being typed.
    void changed();
    void chosen(int row);
    /// What an import brought.
    void told(const QString& words);

private:
    void furnish_add_line();
    [[nodiscard]] QStackedWidget* make_list(const QString& name);
    void add_commands();
    bool add();
    void rename();
    void remove();
    void move_up();
    void move_down();
    void sort();
    void import();
    /// Shows the list when the change was made; otherwise the cursor goes back to the list.
    void done(bool made, int current);

    std::unique_ptr<ListOperations> m_list;
    OrderedListModel m_model;
    AddLine* m_add_line;
    QTableView* m_table;
    InPlaceEditing* m_cells;
    CommandSide* m_side;
    QLabel* m_count;
    QStackedWidget* m_stack = nullptr;
};

} // namespace kindrel::desktop
