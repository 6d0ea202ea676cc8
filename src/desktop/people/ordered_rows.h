#pragma once

#include <QAbstractTableModel>

#include <algorithm>
#include <numeric>
#include <vector>

namespace kindrel::desktop {

/// The places of the keys as they order; keys that are alike stay as they are.
[[nodiscard]] inline std::vector<int> places_by(const std::vector<QString>& keys, Qt::SortOrder order)
{
    std::vector<int> places(keys.size());
    std::iota(places.begin(), places.end(), 0);
    const auto key = [&keys](int place) -> const QString& {
        return keys[std::size_t(place)];
    };
    if (order == Qt::AscendingOrder)
        std::ranges::stable_sort(places, std::ranges::less(), key);
    else
        std::ranges::stable_sort(places, std::ranges::greater(), key);
    return places;
}

/// A list whose rows can be ordered: what is chosen in it stays chosen.
class OrderedRowsModel : public QAbstractTableModel
{
public:
    using QAbstractTableModel::QAbstractTableModel;

protected:
    /// `change` puts into another order what the rows show.
    template <class Change>
    void reorder(const std::vector<int>& rows, Change change)
    {
        Q_EMIT layoutAboutToBeChanged({}, VerticalSortHint);
        const std::vector<int> before = rows;
        change();
        const QModelIndexList from = persistentIndexList();
        QModelIndexList to;
        for (const QModelIndex& index : from) {
            const auto now = std::ranges::find(rows, before[std::size_t(index.row())]);
            to += this->index(int(now - rows.begin()), index.column());
        }
        changePersistentIndexList(from, to);
        Q_EMIT layoutChanged({}, VerticalSortHint);
    }
};

} // namespace kindrel::desktop
