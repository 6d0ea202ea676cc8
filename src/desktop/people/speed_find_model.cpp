#include "desktop/people/speed_find_model.h"

#include "desktop/people/status_words.h"

#include <QApplication>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

people::AddressBookEntry state_of_file(const people::SpeedFindLine& line)
{
    people::AddressBookEntry entry;
    entry.Condition = line.Condition;
    entry.booked_out = line.booked_out;
    return entry;
}

QString text(const people::SpeedFindLine& line, int column)
{
    switch (column) {
    case SpeedFindModel::surname:
        return line.surname;
    case SpeedFindModel::people:
        return line.people;
    case SpeedFindModel::suburb:
        return line.suburb;
    case SpeedFindModel::phone:
        return line.phone;
    default:
        break;
    }
    // Most are active: saying so in every line would hide those that are not.
    const auto file = state_of_file(line);
    return state_of(file) == State::plain ? QString() : status_words(file);
}

} // namespace

void SpeedFindModel::set_hits(people::SpeedFindHits hits)
{
    beginResetModel();
    m_hits = std::move(hits);
    endResetModel();
}

int SpeedFindModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : int(m_hits.lines.size());
}

int SpeedFindModel::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : column_count;
}

QVariant SpeedFindModel::data(const QModelIndex& index, int role) const
{
    if (!index.isValid())
        return {};
    const people::SpeedFindLine& line = *m_hits.lines[std::size_t(index.row())];
    if (role == Qt::DisplayRole || (role == Qt::ToolTipRole && index.column() == people))
        return text(line, index.column());
    if (role == Qt::ForegroundRole && index.column() == status)
        return state_colour(state_of(state_of_file(line)), shade_of(QApplication::palette()));
    return {};
}

} // namespace kindrel::desktop
