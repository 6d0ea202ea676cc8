#include "desktop/people/family_list_model.h"

#include "desktop/people/status_words.h"
#include "people/search_words.h"
#include "people/sort_key.h"

#include <QApplication>

#include <algorithm>
#include <numeric>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::AddressBookEntry;

namespace {

struct ColumnDefinition
{
    const char* heading;
    QString (*text)(const AddressBookEntry&);
};

constexpr std::array<ColumnDefinition, FamilyListModel::column_count> columns{{
    {"Name",
     [](const AddressBookEntry& entry) {
         return entry.surname;
     }},
    {"First name",
     [](const AddressBookEntry& entry) {
         return entry.name;
     }},
    {"Suburb",
     [](const AddressBookEntry& entry) {
         return entry.suburb;
     }},
    {"Phone",
     [](const AddressBookEntry& entry) {
         return entry.phone;
     }},
    {"Status", status_words},
}};

} // namespace

void FamilyListModel::set_entries(std::vector<AddressBookEntry> entries)
{
    beginResetModel();
    m_entries = std::move(entries);
    m_search.clear();
    m_search.reserve(m_entries.size());
    for (const auto& one : m_entries)
        m_search.push_back(people::search_words(one.surname + u' ' + one.name + u' ' + one.suburb));
    put_in_order();
    filter(m_order);
    endResetModel();
}

bool FamilyListModel::matches(int entry) const
{
    return people::has_all(m_search[std::size_t(entry)], m_words);
}

void FamilyListModel::filter(std::span<const int> candidates)
{
    std::vector<int> left;
    left.reserve(candidates.size());
    std::copy_if(candidates.begin(), candidates.end(), std::back_inserter(left),
                 [this](int one) { return matches(one); });
    m_shown = std::move(left);
}

bool FamilyListModel::narrow(const QString& typed)
{
    const QStringList words = people::wanted_words(typed);
    if (words == m_words)
        return false;
    const bool further = people::narrows(m_words, words);
    beginResetModel();
    m_words = words;
    filter(further ? m_shown : m_order);
    endResetModel();
    return true;
}

std::vector<QString> FamilyListModel::order_keys(int column) const
{
    std::vector<QString> keys;
    keys.reserve(m_entries.size());
    for (const auto& one : m_entries)
        keys.push_back(people::sort_key(columns[std::size_t(column)].text(one)));
    return keys;
}

void FamilyListModel::put_in_order()
{
    if (m_sort_column == surname && m_sort_order == Qt::AscendingOrder) { // As they were read.
        m_order.resize(m_entries.size());
        std::iota(m_order.begin(), m_order.end(), 0);
    } else {
        m_order = places_by(order_keys(m_sort_column), m_sort_order);
    }
}

void FamilyListModel::sort(int column, Qt::SortOrder order)
{
    reorder(m_shown, [&] {
        m_sort_column = column >= 0 && column < column_count ? column : surname;
        m_sort_order = order;
        put_in_order();
        filter(m_order);
    });
}

const AddressBookEntry& FamilyListModel::entry(int row) const
{
    return m_entries[std::size_t(m_shown.at(std::size_t(row)))];
}

int FamilyListModel::row_of(int surname_id) const
{
    const auto found = std::find_if(m_shown.begin(), m_shown.end(), [this, surname_id](int one) {
        return m_entries[std::size_t(one)].Surname_ID == surname_id;
    });
    return found == m_shown.end() ? -1 : int(found - m_shown.begin());
}

std::vector<int> FamilyListModel::surname_ids() const
{
    std::vector<int> keys;
    keys.reserve(m_shown.size());
    for (const int one : m_shown)
        keys.push_back(m_entries[std::size_t(one)].Surname_ID);
    return keys;
}

int FamilyListModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : int(m_shown.size());
}

int FamilyListModel::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : column_count;
}

QVariant FamilyListModel::data(const QModelIndex& index, int role) const
{
    if (!index.isValid())
        return {};
    const AddressBookEntry& family = entry(index.row());
    if (role == Qt::DisplayRole)
        return columns[std::size_t(index.column())].text(family);
    if (role == Qt::ForegroundRole && index.column() == status)
        return state_colour(state_of(family), shade_of(QApplication::palette()));
    return {};
}

QVariant FamilyListModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation != Qt::Horizontal || section >= column_count)
        return {};
    if (role == Qt::DisplayRole)
        return QString::fromLatin1(columns[std::size_t(section)].heading);
    if (role == Qt::TextAlignmentRole)
        return int(Qt::AlignLeft | Qt::AlignVCenter);
    return {};
}

} // namespace kindrel::desktop
