#pragma once

#include "desktop/shell/palette.h"
#include "people/filter.h"

#include <QAbstractTableModel>

#include <functional>

namespace kindrel::desktop {

/// What stands behind an item of the list: a word, with its colour and icon.
struct ChoiceUse
{
    QString word = {};
    State state = State::plain;
    QString icon = {};
};

/// The items that a filter or fusion can ask for, narrowed by typed words.
class FilterChoiceModel : public QAbstractTableModel
{
    Q_OBJECT

public:
    using Use = std::function<ChoiceUse(const people::FilterItem&)>;
    enum Column { item_column, use_column, column_count };

    /// `heading` stands above the words that `use` gives.
    FilterChoiceModel(const QString& heading, Use use, QObject* parent = nullptr);

    void set_items(std::vector<people::FilterItem> items);
    /// Keeps the items in which every word begins some word; accents and case do not count.
    void narrow(const QString& typed);
    /// What the items are used for has changed.
    void refresh();
    [[nodiscard]] const people::FilterItem& item(int row) const { return m_items[m_shown[std::size_t(row)]]; }
    /// -1 when the item is not shown.
    [[nodiscard]] int row_of(const people::FilterItem& item) const;
    [[nodiscard]] bool empty() const { return m_items.empty(); }

    [[nodiscard]] int rowCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] int columnCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] QVariant data(const QModelIndex& index, int role) const override;
    [[nodiscard]] QVariant headerData(int section, Qt::Orientation orientation, int role) const override;

private:
    void find_shown();
    [[nodiscard]] QVariant use_data(const people::FilterItem& item, int role) const;

    QString m_heading;
    Use m_use;
    QStringList m_words; ///< Folded, each after a blank.
    std::vector<people::FilterItem> m_items;
    std::vector<QString> m_search; ///< Beside `m_items`: the folded words, each after a blank.
    std::vector<std::size_t> m_shown;
};

/// The item as it is listed: a ministry with the state that is asked for before it.
[[nodiscard]] QString choice_text(const people::FilterItem& item);

/// The typed words, folded, each after a blank, and a text in which they can be looked for.
[[nodiscard]] QStringList folded_words(const QString& typed);
[[nodiscard]] QString folded_text(const QString& text);
[[nodiscard]] bool holds_all(const QString& folded, const QStringList& words);

} // namespace kindrel::desktop
