#pragma once

#include "desktop/people/data_search_model.h"
#include "desktop/people/search_tab.h"
#include "desktop/shell/desk.h"

class QLabel;
class QListWidget;
class QPushButton;
class QStackedWidget;
class QTableView;

namespace kindrel::desktop {

class EmptyPanel;

/// The parts of the record at the left, and those who have an entry in the chosen one at the right. Values that are
/// marked as unlisted stand here and never on paper or in files.
class DataSearchTab : public SearchTab
{
    Q_OBJECT

public:
    explicit DataSearchTab(Desk& desk);

    void entered() override;
    void open() override;
    void look() override;
    void lend_list(const std::function<void(const QString& title, const QAbstractItemModel&)>& use) const override;
    [[nodiscard]] QString count_words() const override;

Q_SIGNALS:
    void counted();

protected:
    bool eventFilter(QObject* target, QEvent* event) override;

private:
    void set_up_parts();
    void set_up_list();
    [[nodiscard]] QWidget* make_list_side();
    /// Lists those who have an entry in the chosen part.
    void list_part();
    void show_entries(std::vector<people::DataEntry> entries);
    [[nodiscard]] bool key_pressed(const QObject* target, int key);
    void to_tagging();
    /// The families of the list, and in `place` that of the chosen row; empty when no row is chosen.
    [[nodiscard]] std::vector<int> families(int& place) const;

    Desk& m_desk;
    const people::DataPart* m_part = nullptr; ///< The one that is listed; null before the first.
    QListWidget* m_parts;
    DataSearchModel* m_model;
    QTableView* m_view;
    EmptyPanel* m_empty;
    QStackedWidget* m_stack;
    QLabel* m_count;
    QPushButton* m_to_tagging;
    std::optional<qint64> m_change_mark;
};

} // namespace kindrel::desktop
