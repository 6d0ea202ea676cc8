#pragma once

#include "desktop/people/ordered_rows.h"
#include "people/address_book.h"

#include <span>

namespace kindrel::desktop {

/// A family list, narrowed by typed words and ordered by a column. Everything it needs for that is worked out once
/// per list, so that a keystroke only compares texts that stand ready.
class FamilyListModel : public OrderedRowsModel
{
    Q_OBJECT

public:
    enum Column { surname, first_name, suburb, phone, status };
    static constexpr int column_count = 5;

    using OrderedRowsModel::OrderedRowsModel;

    void set_entries(std::vector<people::AddressBookEntry> entries);
    /// Keeps the families in which every word begins some word of surname, first name or suburb; accents and case do
    /// not count. Returns whether the shown rows changed.
    bool narrow(const QString& typed);
    void sort(int column, Qt::SortOrder order) override;

    [[nodiscard]] int total() const { return int(m_entries.size()); }
    [[nodiscard]] const people::AddressBookEntry& entry(int row) const;
    /// -1 when the family is not shown.
    [[nodiscard]] int row_of(int surname_id) const;
    /// The shown families in order.
    [[nodiscard]] std::vector<int> surname_ids() const;

    [[nodiscard]] int rowCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] int columnCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] QVariant data(const QModelIndex& index, int role) const override;
    [[nodiscard]] QVariant headerData(int section, Qt::Orientation orientation, int role) const override;

private:
    [[nodiscard]] bool matches(int entry) const;
    void filter(std::span<const int> candidates);
    void put_in_order();
    [[nodiscard]] std::vector<QString> order_keys(int column) const;

    std::vector<people::AddressBookEntry> m_entries;
    std::vector<QString> m_search; ///< Beside `m_entries`: its folded words, each after a blank.
    std::vector<int> m_order;      ///< All entries as the sorting has them.
    std::vector<int> m_shown;      ///< What of it the words leave.
    QStringList m_words;           ///< Folded, each after a blank.
    int m_sort_column = surname;
    Qt::SortOrder m_sort_order = Qt::AscendingOrder;
};

} // namespace kindrel::desktop
