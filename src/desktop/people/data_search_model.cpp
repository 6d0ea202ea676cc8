#include "desktop/people/data_search_model.h"

#include "desktop/people/status_words.h"
#include "desktop/shell/value_form.h"
#include "people/sort_key.h"

#include <QApplication>
#include <QFont>

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
    put_in_order();
    endResetModel();
}

void DataSearchModel::put_in_order()
{
    std::vector<QString> keys(m_entries.size());
    const bool as_read = m_sort_column == surname && m_sort_order == Qt::AscendingOrder;
    for (std::size_t place = 0; place < keys.size() && !as_read; ++place) {
        const auto& entry = m_entries[place];
        keys[place] = people::sort_key(m_sort_column == value ? entry.order : text(entry, m_sort_column));
    }
    m_order = places_by(keys, m_sort_order);
}

void DataSearchModel::sort(int column, Qt::SortOrder order)
{
    reorder(m_order, [&] {
        m_sort_column = column >= 0 && column < column_count ? column : surname;
        m_sort_order = order;
        put_in_order();
    });
}

const people::DataEntry& DataSearchModel::entry(int row) const
{
    return m_entries[std::size_t(m_order.at(std::size_t(row)))];
}

std::vector<people::DataEntry> DataSearchModel::entries() const
{
    std::vector<people::DataEntry> listed;
    for (int row = 0; row < rowCount(); ++row)
        listed.push_back(entry(row));
    return listed;
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
    const people::DataEntry& found = entry(index.row());
    if (role == Qt::DisplayRole || (role == Qt::ToolTipRole && index.column() == value))
        return text(found, index.column());
    if (role == Qt::ForegroundRole && index.column() == status)
        return state_colour(state_of(found.Condition), shade_of(QApplication::palette()));
    if (role == Qt::ForegroundRole && index.column() == first_name)
        return state_colour(state_of(found.states), shade_of(QApplication::palette()));
    if (role == Qt::FontRole && index.column() == first_name && found.states.deceased) {
        QFont font = QApplication::font();
        font.setItalic(true);
        return font;
    }
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
