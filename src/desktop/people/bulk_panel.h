#pragma once

#include "desktop/shell/desk.h"
#include "people/setup_lists.h"
#include "people/tagging.h"

#include <QWidget>

class QCheckBox;
class QComboBox;
class QGridLayout;
class QLabel;
class QLineEdit;
class QListWidget;
class QPushButton;
class QTimer;

namespace kindrel::desktop {

class DateField;

/// Gives a setup item to everybody on a list or takes it from them, and says beforehand how many that changes.
class BulkPanel : public QWidget
{
    Q_OBJECT

public:
    explicit BulkPanel(Desk& desk);

    /// Reads the items again.
    void reload();
    void set_list(const people::WorkingList& list);
    void focus_first();

Q_SIGNALS:
    void done(const people::BulkChange& change);

protected:
    bool eventFilter(QObject* target, QEvent* event) override;

private:
    void make_items();
    void make_details();
    [[nodiscard]] QWidget* make_buttons();
    void add_button(QGridLayout& rows, people::TagAct act, const QString& name, const QString& text);
    void choose_kind(int row);
    void show_items();
    void choose_item();
    void take_details();
    void count();
    void run(people::TagAct act);

    Desk& m_desk;
    people::TagItem m_item;
    std::optional<people::WorkingList> m_list;
    std::vector<people::SetupItem> m_known; ///< Of the chosen kind.
    QComboBox* m_kind;
    QLineEdit* m_filter;
    QListWidget* m_items;
    QWidget* m_details;
    QComboBox* m_state;
    DateField* m_date;
    QLineEdit* m_field;
    QCheckBox* m_mark;
    std::array<QPushButton*, 2> m_buttons{}; ///< In the order of people::TagAct.
    std::array<QLabel*, 2> m_counts{};       ///< Beside them.
    QTimer* m_pause;
};

} // namespace kindrel::desktop
