#pragma once

#include "people/speed_find.h"

#include <QAbstractTableModel>

namespace kindrel::desktop {

/// The families that speed find found for what was typed.
class SpeedFindModel : public QAbstractTableModel
{
    Q_OBJECT

public:
    enum Column { surname, people, suburb, phone, status };
    static constexpr int column_count = 5;

    using QAbstractTableModel::QAbstractTableModel;

    void set_hits(people::SpeedFindHits hits);
    [[nodiscard]] const people::SpeedFindHits& hits() const { return m_hits; }

    [[nodiscard]] int rowCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] int columnCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] QVariant data(const QModelIndex& index, int role = Qt::DisplayRole) const override;

private:
    people::SpeedFindHits m_hits;
};

} // namespace kindrel::desktop
