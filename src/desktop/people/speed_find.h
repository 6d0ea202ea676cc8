#pragma once

#include "desktop/people/speed_find_model.h"
#include "desktop/shell/desk.h"

#include <QDialog>

class QKeyEvent;
class QLabel;
class QLineEdit;
class QPushButton;
class QStackedWidget;
class QTableView;

namespace kindrel::desktop {

class EmptyPanel;

/// A small window over the main one that finds a family while one types: Enter opens the first, Down leads to the
/// others. It goes away when the person turns to something else.
class SpeedFindWindow : public QDialog
{
    Q_OBJECT

public:
    SpeedFindWindow(Desk& desk, QWidget& over);

    /// Comes forward with nothing typed. Stays away, after saying so, without the right to find families.
    void ask();
    void reject() override;

Q_SIGNALS:
    /// A new family is to be made with what was typed; empty where that was no name.
    void family_wanted(const QString& surname);

protected:
    bool eventFilter(QObject* target, QEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    void set_up_words();
    void set_up_list();
    void find();
    void show_outcome();
    void open_chosen();
    void add_family();
    [[nodiscard]] bool key_in_words(int key);
    [[nodiscard]] bool key_in_list(const QKeyEvent& key);

    Desk& m_desk;
    people::SpeedFind m_families;
    SpeedFindModel* m_model;
    QLineEdit* m_words;
    QTableView* m_view;
    EmptyPanel* m_empty;
    QStackedWidget* m_stack;
    QLabel* m_count;
    QPushButton* m_add;
};

} // namespace kindrel::desktop
