#pragma once

#include "desktop/people/family_list_model.h"
#include "desktop/shell/desk.h"

#include <QWidget>

class QComboBox;
class QHBoxLayout;
class QKeyEvent;
class QLineEdit;
class QStackedWidget;
class QTableView;

namespace kindrel::desktop {

class EmptyPanel;

/// Families to choose from: a selector, a filter that narrows as one types, and the list. Down leads from the filter
/// into the list, Enter opens. Nothing is read before the first reload() or choose().
class FamilyListWidget : public QWidget
{
    Q_OBJECT

public:
    explicit FamilyListWidget(Desk& desk, QWidget* parent = nullptr);

    void choose(people::FamilyList list);
    [[nodiscard]] people::FamilyList list() const;
    /// Only families of this group; 0: whatever group.
    void narrow_to_group(int family_group_id);
    /// Reads the list again, keeping words and chosen family.
    void reload();
    void focus_filter();
    /// The page has another way to find families; the selector stands at the left, with `beside` next to it.
    void replace_filter(QWidget* beside);
    /// False when the family is not in the list.
    bool choose_family(int surname_id);
    [[nodiscard]] FamilyListModel& model() { return *m_model; }
    [[nodiscard]] QTableView& view() { return *m_view; }
    /// Its place in the list; -1 when none is.
    [[nodiscard]] int chosen_row() const;
    /// "312 of 1,204 families".
    [[nodiscard]] QString count_words() const;

Q_SIGNALS:
    /// A family was asked for; `row` is its place in the list.
    void opened(int row);
    /// A look at a family was asked for, with Space or Ctrl+Enter.
    void looked_at(int row);
    void shown_changed();

protected:
    bool eventFilter(QObject* target, QEvent* event) override;

private:
    [[nodiscard]] bool may_list() const;
    void set_up_view();
    void set_up_filter();
    void typed(const QString& text);
    void open_chosen();
    void look_at_chosen();
    [[nodiscard]] bool key_in_view(const QKeyEvent& key);
    void show_outcome();
    void select(int row);
    [[nodiscard]] int chosen_family() const;

    Desk& m_desk;
    FamilyListModel* m_model;
    int m_family_group = 0;
    QString m_when_empty = QStringLiteral("Choose another list above, or one of the totals at the left.");
    QHBoxLayout* m_top;
    QComboBox* m_selector;
    QLineEdit* m_filter;
    QTableView* m_view;
    QStackedWidget* m_stack;
    EmptyPanel* m_empty;
};

} // namespace kindrel::desktop
