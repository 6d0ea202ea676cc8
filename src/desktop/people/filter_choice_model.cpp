#include "desktop/people/filter_choice_model.h"

#include "desktop/shell/icons.h"
#include "people/sort_key.h"

#include <QApplication>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::FilterItem;

QString choice_text(const FilterItem& item)
{
    if (item.ministry == people::MinistryChoice::active)
        return u"(Active) "_s + item.text;
    if (item.ministry == people::MinistryChoice::potential)
        return u"(Potential) "_s + item.text;
    return item.text;
}

QStringList folded_words(const QString& typed)
{
    QStringList words = people::sort_key(typed).split(u' ', Qt::SkipEmptyParts);
    for (QString& word : words)
        word.prepend(u' ');
    return words;
}

QString folded_text(const QString& text)
{
    return u' ' + people::sort_key(text).replace(u'(', u' ');
}

bool holds_all(const QString& folded, const QStringList& words)
{
    return std::ranges::all_of(words, [&](const QString& word) { return folded.contains(word); });
}

FilterChoiceModel::FilterChoiceModel(const QString& heading, Use use, QObject* parent)
    : QAbstractTableModel(parent), m_heading(heading), m_use(std::move(use))
{
}

void FilterChoiceModel::set_items(std::vector<FilterItem> items)
{
    beginResetModel();
    m_items = std::move(items);
    m_search.clear();
    for (const FilterItem& item : m_items)
        m_search.push_back(folded_text(choice_text(item)));
    find_shown();
    endResetModel();
}

void FilterChoiceModel::narrow(const QString& typed)
{
    beginResetModel();
    m_words = folded_words(typed);
    find_shown();
    endResetModel();
}

void FilterChoiceModel::find_shown()
{
    m_shown.clear();
    for (std::size_t place = 0; place < m_items.size(); ++place)
        if (holds_all(m_search[place], m_words))
            m_shown.push_back(place);
}

void FilterChoiceModel::refresh()
{
    if (!m_shown.empty())
        Q_EMIT dataChanged(index(0, use_column), index(rowCount() - 1, use_column));
}

int FilterChoiceModel::row_of(const FilterItem& item) const
{
    const auto is_it = [&](std::size_t place) {
        const FilterItem& here = m_items[place];
        return here.kind == item.kind && here.item == item.item && here.ministry == item.ministry;
    };
    const auto found = std::ranges::find_if(m_shown, is_it);
    return found == m_shown.end() ? -1 : int(found - m_shown.begin());
}

int FilterChoiceModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : int(m_shown.size());
}

int FilterChoiceModel::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : column_count;
}

QVariant FilterChoiceModel::use_data(const FilterItem& item, int role) const
{
    const ChoiceUse use = m_use(item);
    if (role == Qt::DisplayRole)
        return use.word;
    if (role == Qt::ForegroundRole)
        return state_colour(use.state, shade_of(QApplication::palette()));
    return role == Qt::DecorationRole && !use.icon.isEmpty() ? QVariant(icon(use.icon)) : QVariant();
}

QVariant FilterChoiceModel::data(const QModelIndex& index, int role) const
{
    if (!checkIndex(index, CheckIndexOption::IndexIsValid))
        return {};
    const FilterItem& shown = item(index.row());
    if (index.column() == use_column)
        return use_data(shown, role);
    return role == Qt::DisplayRole || role == Qt::ToolTipRole ? QVariant(choice_text(shown)) : QVariant();
}

QVariant FilterChoiceModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation != Qt::Horizontal || role != Qt::DisplayRole)
        return {};
    return section == use_column ? m_heading : u"Item"_s;
}

} // namespace kindrel::desktop
