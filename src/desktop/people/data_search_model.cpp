#include "desktop/people/data_search_model.h"

#include "desktop/people/status_words.h"
#include "desktop/shell/value_form.h"

#include <QApplication>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr std::array headings{"Name", "First name", "Entry", "Status"};
static_assert(headings.size() == DataSearchModel::column_count);

} // namespace

void DataSearchModel::set_entries(std::vector<people::DataEntry> entries)
{
    beginResetModel();
    m_entries = std::move(entries);
    endResetModel();
}

int DataSearchModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : int(m_entries.size());
}

int DataSearchModel::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : column_count;
}

QString DataSearchModel::text(const people::DataEntry& entry, int column) const
{
    switch (column) {
    case surname:
        return entry.surname;
    case first_name:
        return entry.name;
    case status:
        return status_word(entry.Condition);
    default:
        break;
    }
    if (!entry.hidden)
        return entry.value;
    return m_unlisted == Unlisted::withheld ? hidden_mark() : u"%1 (%2)"_s.arg(entry.value, hidden_mark());
}

QVariant DataSearchModel::data(const QModelIndex& index, int role) const
{
    if (!index.isValid())
        return {};
    const people::DataEntry& found = m_entries[std::size_t(index.row())];
    if (role == Qt::DisplayRole || (role == Qt::ToolTipRole && index.column() == value))
        return text(found, index.column());
    if (role == Qt::ForegroundRole && index.column() == status)
        return state_colour(state_of(found.Condition), shade_of(QApplication::palette()));
    return {};
}

QVariant DataSearchModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation != Qt::Horizontal || section >= column_count)
        return {};
    if (role == Qt::DisplayRole)
        return QString::fromLatin1(headings[std::size_t(section)]);
    if (role == Qt::TextAlignmentRole)
        return int(Qt::AlignLeft | Qt::AlignVCenter);
    return {};
}

} // namespace kindrel::desktop
