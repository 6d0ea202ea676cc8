#pragma once

#include <QDialog>

#include <vector>

class QLabel;
class QLineEdit;
class QListWidget;
class QListWidgetItem;

namespace kindrel::desktop {

struct PickerItem
{
    int key = 0;
    QString text;
};

/// Chooses one item of a list: typed words narrow it, Down leads into it, Enter takes the item. Accents and case do
/// not count, and every word must begin some word of the item.
class ItemPicker : public QDialog
{
    Q_OBJECT

public:
    /// `none` stands where an empty list would be.
    ItemPicker(const QString& title, std::vector<PickerItem> items, const QString& none, QWidget* parent = nullptr);

    /// A last row adds what is typed when no item is called so.
    void allow_new();

Q_SIGNALS:
    void chosen(int key);
    void new_wanted(const QString& text);

protected:
    bool eventFilter(QObject* target, QEvent* event) override;

private:
    void narrow();
    [[nodiscard]] bool add_matches(const QString& typed);
    void take();
    [[nodiscard]] bool filter_key(int key);
    [[nodiscard]] bool list_key(const QString& text, int key);

    std::vector<PickerItem> m_items;
    QString m_none;
    bool m_new_allowed = false;
    QLineEdit* m_filter;
    QListWidget* m_list;
    QLabel* m_words;
};

} // namespace kindrel::desktop
