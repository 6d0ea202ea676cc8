#pragma once

#include "registers/weekly_register.h"

#include <QAbstractTableModel>

namespace kindrel::desktop {

/// The categories of the open date with their figures, each in the column of its kind, and the last date's figures
/// beside them.
class WeeklyGridModel : public QAbstractTableModel
{
    Q_OBJECT

public:
    enum Column { category, money, attendance, last, column_count };

    WeeklyGridModel(registers::WeeklyRegister& weekly, core::DayOrder day_order, QObject* parent = nullptr);

    /// Another date is open, or none.
    void refresh();
    /// Where the row's figure stands.
    [[nodiscard]] int figure_column(int row) const;

    [[nodiscard]] int rowCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] int columnCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] QVariant data(const QModelIndex& index, int role = Qt::DisplayRole) const override;
    [[nodiscard]] QVariant headerData(int section, Qt::Orientation orientation, int role) const override;
    [[nodiscard]] Qt::ItemFlags flags(const QModelIndex& index) const override;
    /// False, after saying why, when the text is no figure.
    bool setData(const QModelIndex& index, const QVariant& value, int role = Qt::EditRole) override;

private:
    [[nodiscard]] QString text_of(const registers::WeeklyRow& row, int column) const;

    registers::WeeklyRegister& m_weekly;
    core::DayOrder m_day_order;
};

} // namespace kindrel::desktop
