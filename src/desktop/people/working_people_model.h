#pragma once

#include "people/listed_people.h"

#include <QAbstractTableModel>

namespace kindrel::desktop {

/// The people of a working list in its order.
class WorkingPeopleModel : public QAbstractTableModel
{
    Q_OBJECT

public:
    enum Column { name, family, file, column_count };

    using QAbstractTableModel::QAbstractTableModel;

    void set_people(std::vector<people::ListedPerson> people);
    [[nodiscard]] const people::ListedPerson& person(int row) const { return m_people.at(std::size_t(row)); }

    [[nodiscard]] int rowCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] int columnCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] QVariant data(const QModelIndex& index, int role) const override;
    [[nodiscard]] QVariant headerData(int section, Qt::Orientation orientation, int role) const override;

private:
    std::vector<people::ListedPerson> m_people;
};

} // namespace kindrel::desktop
