#include "desktop/shell/ordered_list_model.h"

#include "desktop/shell/palette.h"

#include <QApplication>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

OrderedListModel::OrderedListModel(ListOperations& list, QObject* parent) : QAbstractTableModel(parent), m_list(list)
{
    const ListCaptions captions = list.captions();
    m_fields = int(captions.fields.size());
    m_has_users = !captions.users.isEmpty();
    m_headings = captions.fields;
    for (const QString& further : {captions.remark, captions.users})
        if (!further.isEmpty())
            m_headings += further;
}

void OrderedListModel::refresh()
{
    beginResetModel();
    endResetModel();
}

int OrderedListModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : m_list.count();
}

int OrderedListModel::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : int(m_headings.size());
}

QString OrderedListModel::text_of(const ListRow& row, int column) const
{
    if (is_field(column))
        return row.texts.value(column);
    if (is_users(column))
        return row.users ? QString::number(*row.users) : u"new"_s;
    return row.remark;
}

QVariant OrderedListModel::colour_of(const ListRow& row, int column) const
{
    const Shade shade = shade_of(QApplication::palette());
    if (is_users(column) && !row.users)
        return state_colour(State::altered, shade);
    const bool unused = is_users(column) && *row.users == 0;
    return unused || !row.remark.isEmpty() ? QVariant(quiet_colour(shade)) : QVariant();
}

QVariant OrderedListModel::data(const QModelIndex& index, int role) const
{
    if (!checkIndex(index, CheckIndexOption::IndexIsValid))
        return {};
    switch (role) {
    case Qt::DisplayRole:
    case Qt::EditRole:
        return text_of(m_list.row(index.row()), index.column());
    case Qt::ForegroundRole:
        return colour_of(m_list.row(index.row()), index.column());
    case Qt::TextAlignmentRole:
        return int(Qt::AlignVCenter | (is_users(index.column()) ? Qt::AlignRight : Qt::AlignLeft));
    default:
        return {};
    }
}

QVariant OrderedListModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation != Qt::Horizontal)
        return {};
    if (role == Qt::DisplayRole)
        return m_headings.value(section);
    if (role == Qt::TextAlignmentRole)
        return int(Qt::AlignVCenter | (is_users(section) ? Qt::AlignRight : Qt::AlignLeft));
    return {};
}

Qt::ItemFlags OrderedListModel::flags(const QModelIndex& index) const
{
    const auto flags = QAbstractTableModel::flags(index);
    return index.isValid() && is_field(index.column()) ? flags | Qt::ItemIsEditable : flags;
}

bool OrderedListModel::setData(const QModelIndex& index, const QVariant& value, int role)
{
    if (role != Qt::EditRole || !index.isValid() || !is_field(index.column()))
        return false;
    QStringList texts = m_list.row(index.row()).texts;
    texts[index.column()] = value.toString();
    if (!m_list.rename(index.row(), texts))
        return false;
    Q_EMIT dataChanged(this->index(index.row(), 0), this->index(index.row(), columnCount() - 1));
    return true;
}

} // namespace kindrel::desktop
