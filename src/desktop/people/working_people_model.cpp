#include "desktop/people/working_people_model.h"

#include "desktop/people/status_words.h"

#include <QApplication>
#include <QFont>

#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::ListedPerson;

namespace {

constexpr std::array headings{"Name", "Family", "File"};

QString text_of(const ListedPerson& person, int column)
{
    if (column == WorkingPeopleModel::name)
        return person.name;
    if (column == WorkingPeopleModel::family)
        return person.surname;
    return person.booked_out ? u"\u2192 Booked out"_s : QString();
}

} // namespace

void WorkingPeopleModel::set_people(std::vector<ListedPerson> people)
{
    beginResetModel();
    m_people = std::move(people);
    endResetModel();
}

int WorkingPeopleModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : int(m_people.size());
}

int WorkingPeopleModel::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : column_count;
}

QVariant WorkingPeopleModel::data(const QModelIndex& index, int role) const
{
    if (!checkIndex(index, CheckIndexOption::IndexIsValid))
        return {};
    const ListedPerson& shown = person(index.row());
    if (role == Qt::DisplayRole)
        return text_of(shown, index.column());
    if (role == Qt::ForegroundRole && index.column() != family) {
        const State state = index.column() == file ? State::booked_out : state_of(shown.states);
        return state_colour(state, shade_of(QApplication::palette()));
    }
    if (role == Qt::FontRole && index.column() == name && shown.states.deceased) {
        QFont font = QApplication::font();
        font.setItalic(true);
        return font;
    }
    return {};
}

QVariant WorkingPeopleModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation != Qt::Horizontal || role != Qt::DisplayRole || section >= column_count)
        return {};
    return QString::fromLatin1(headings[std::size_t(section)]);
}

} // namespace kindrel::desktop
