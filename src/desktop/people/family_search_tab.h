#pragma once

#include "desktop/people/search_tab.h"
#include "desktop/shell/desk.h"
#include "people/text_search.h"

class QCheckBox;
class QComboBox;
class QLabel;
class QLineEdit;
class QPushButton;

namespace kindrel::desktop {

class FamilyListWidget;

/// A family list by file status and family group, in which a text is found in one family after another.
class FamilySearchTab : public SearchTab
{
    Q_OBJECT

public:
    explicit FamilySearchTab(Desk& desk);

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
    [[nodiscard]] QWidget* make_question();
    void set_up_list();
    void read_groups();
    void search();
    void start_anew();
    void show_count();

    Desk& m_desk;
    people::TextSearch m_search;
    QLineEdit* m_text;
    QCheckBox* m_names_only;
    QPushButton* m_button;
    QComboBox* m_groups;
    FamilyListWidget* m_families;
    QLabel* m_count;
    QLabel* m_found;
    std::optional<qint64> m_change_mark; ///< Nothing until the first reading.
};

} // namespace kindrel::desktop
