#include "desktop/registers/weekly_grid_model.h"

#include "desktop/registers/figure_grid.h"
#include "desktop/shell/palette.h"

#include <QApplication>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using registers::FigureKind;

namespace {

QString shown(const std::optional<core::Amount>& figure, FigureKind kind)
{
    return figure ? registers::shown_figure(*figure, kind) : QString();
}

} // namespace

WeeklyGridModel::WeeklyGridModel(registers::WeeklyRegister& weekly, core::DayOrder day_order, QObject* parent)
    : QAbstractTableModel(parent), m_weekly(weekly), m_day_order(day_order)
{
}

void WeeklyGridModel::refresh()
{
    beginResetModel();
    endResetModel();
}

int WeeklyGridModel::figure_column(int row) const
{
    const auto kind = m_weekly.rows().at(std::size_t(row)).category.kind;
    return kind == FigureKind::money ? money : attendance;
}

int WeeklyGridModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : int(m_weekly.rows().size());
}

int WeeklyGridModel::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : int(column_count);
}

QString WeeklyGridModel::text_of(const registers::WeeklyRow& row, int column) const
{
    const auto kind = row.category.kind;
    if (column == category)
        return row.category.name;
    if (column == last)
        return shown(row.last, kind);
    const bool own = (column == money) == (kind == FigureKind::money);
    return own ? shown(row.figure, kind) : QString();
}

QVariant WeeklyGridModel::data(const QModelIndex& index, int role) const
{
    if (!checkIndex(index, CheckIndexOption::IndexIsValid))
        return {};
    switch (role) {
    case Qt::DisplayRole:
    case Qt::EditRole:
        return text_of(m_weekly.rows()[std::size_t(index.row())], index.column());
    case field_name_role:
        return index.column() == money ? u"fin_in"_s : u"att_in"_s;
    case Qt::ToolTipRole:
        return index.column() == category ? text_of(m_weekly.rows()[std::size_t(index.row())], category) : QVariant();
    case Qt::ForegroundRole:
        return index.column() == last ? QVariant(quiet_colour(shade_of(QApplication::palette()))) : QVariant();
    case Qt::TextAlignmentRole:
        return int(Qt::AlignVCenter | (index.column() == category ? Qt::AlignLeft : Qt::AlignRight));
    default:
        return {};
    }
}

QVariant WeeklyGridModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation != Qt::Horizontal)
        return {};
    if (role == Qt::TextAlignmentRole)
        return int(Qt::AlignVCenter | (section == category ? Qt::AlignLeft : Qt::AlignRight));
    if (role != Qt::DisplayRole)
        return {};
    if (section != last)
        return QStringList{u"Category"_s, kind_name(FigureKind::money), kind_name(FigureKind::attendance)}.value(
            section);
    const auto date = m_weekly.last_date();
    return date ? date->shown(m_day_order) : u"Last date"_s;
}

Qt::ItemFlags WeeklyGridModel::flags(const QModelIndex& index) const
{
    const auto flags = QAbstractTableModel::flags(index);
    return checkIndex(index, CheckIndexOption::IndexIsValid) && index.column() == figure_column(index.row())
               ? flags | Qt::ItemIsEditable
               : flags;
}

bool WeeklyGridModel::setData(const QModelIndex& index, const QVariant& value, int role)
{
    if (role != Qt::EditRole || !(flags(index) & Qt::ItemIsEditable) ||
        !m_weekly.enter_figure(index.row(), value.toString()))
        return false;
    Q_EMIT dataChanged(index, index);
    return true;
}

} // namespace kindrel::desktop
