#pragma once

#include "desktop/people/ordered_rows.h"
#include "people/data_search.h"

namespace kindrel::desktop {

/// What becomes of values that are marked as unlisted.
enum class Unlisted { shown, withheld };

/// The people who have an entry in a part of the record.
class DataSearchModel : public OrderedRowsModel
{
    Q_OBJECT

public:
    enum Column { surname, first_name, value, status };
    static constexpr int column_count = 4;

    explicit DataSearchModel(Unlisted unlisted, QObject* parent = nullptr)
        : OrderedRowsModel(parent), m_unlisted(unlisted)
    {
    }

    void set_entries(std::vector<people::DataEntry> entries);
    /// In the order of the rows.
    [[nodiscard]] std::vector<people::DataEntry> entries() const;
    [[nodiscard]] const people::DataEntry& entry(int row) const;
    void sort(int column, Qt::SortOrder order) override;

    [[nodiscard]] int rowCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] int columnCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] QVariant data(const QModelIndex& index, int role = Qt::DisplayRole) const override;
    [[nodiscard]] QVariant headerData(int section, Qt::Orientation orientation, int role) const override;

private:
    [[nodiscard]] QString text(const people::DataEntry& entry, int column) const;
    void put_in_order();

    Unlisted m_unlisted;
    std::vector<people::DataEntry> m_entries; ///< As they were read.
    std::vector<int> m_order;                 ///< Their places, row by row.
    int m_sort_column = surname;
    Qt::SortOrder m_sort_order = Qt::AscendingOrder;
};

} // namespace kindrel::desktop
