#pragma once

#include "desktop/people/filter_choice_model.h"
#include "desktop/shell/remembered.h"

#include <QWidget>

class QKeyEvent;
class QLineEdit;
class QStackedWidget;
class QTableView;

namespace kindrel::desktop {

class EmptyPanel;

/// Items to use, narrowed as one types. Down leads from the line into the list, letters lead back. Space or Enter asks
/// for the next use of the chosen item, + and - for one in particular: in the list, and in the line while it is empty.
class FilterChoiceList : public QWidget
{
    Q_OBJECT

public:
    /// `title` says what is listed, `heading` what stands behind the items.
    FilterChoiceList(Remembered& remembered, const QString& title, const QString& heading, FilterChoiceModel::Use use);

    /// The chosen item and the typed words stay.
    void set_items(std::vector<people::FilterItem> items);
    /// How a list without any item gets some.
    void say_when_empty(const QString& next_step) { m_when_empty = next_step; }
    void forget_typed();
    void refresh() { m_model->refresh(); }
    /// Null when none is chosen.
    [[nodiscard]] const people::FilterItem* chosen() const;
    void focus_line();

Q_SIGNALS:
    void chosen_changed();
    void step_wanted();
    void plus_wanted();
    void minus_wanted();

protected:
    bool eventFilter(QObject* target, QEvent* event) override;

private:
    void set_up_line(const QString& title);
    void set_up_table(Remembered& remembered, const QString& title);
    void typed(const QString& text);
    void select(int row);
    [[nodiscard]] bool line_key(const QKeyEvent& key);
    [[nodiscard]] bool use_key(const QKeyEvent& key);
    [[nodiscard]] bool list_key(const QKeyEvent& key);
    [[nodiscard]] bool back_to_line(const QKeyEvent& key);

    FilterChoiceModel* m_model;
    QLineEdit* m_line;
    QTableView* m_table;
    QStackedWidget* m_stack;
    EmptyPanel* m_empty;
    QString m_when_empty = QStringLiteral("Its items are made on the page Setup Lists.");
};

} // namespace kindrel::desktop
