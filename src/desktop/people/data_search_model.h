#pragma once

#include "people/data_search.h"

#include <QAbstractTableModel>

namespace kindrel::desktop {

/// What becomes of values that are marked as unlisted.
enum class Unlisted { shown, withheld };

/// The people who have an entry in a part of the record.
class DataSearchModel : public QAbstractTableModel
{
    Q_OBJECT

public:
    enum Column { surname, first_name, value, status };
    static constexpr int column_count = 4;

    explicit DataSearchModel(Unlisted unlisted, QObject* parent = nullptr)
        : QAbstractTableModel(parent), m_unlisted(unlisted)
    {
    }

    void set_entries(std::vector<people::DataEntry> entries);
    [[nodiscard]] const std::vector<people::DataEntry>& entries() const { return m_entries; }

    [[nodiscard]] int rowCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] int columnCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] QVariant data(const QModelIndex& index, int role = Qt::DisplayRole) const override;
    [[nodiscard]] QVariant headerData(int section, Qt::Orientation orientation, int role) const override;

private:
    [[nodiscard]] QString text(const people::DataEntry& entry, int column) const;

    Unlisted m_unlisted;
    std::vector<people::DataEntry> m_entries;
};

} // namespace kindrel::desktop
