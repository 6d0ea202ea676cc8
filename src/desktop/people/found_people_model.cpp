#include "desktop/people/found_people_model.h"

#include "core/progress_run.h"
#include "desktop/people/filter_choice_model.h"
#include "desktop/people/status_words.h"
#include "people/disclosed.h"
#include "people/family_store.h"
#include "people/listed_people.h"

#include <QApplication>
#include <QHash>
#include <QSet>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr std::size_t families_per_step = 1000;
const QStringList& headings()
{
    static const QStringList texts{u"Name"_s, u"Family"_s, u"Suburb"_s};
    return texts;
}

QString text_of(const FoundPerson& person, int column)
{
    return column == FoundPeopleModel::name     ? person.name
           : column == FoundPeopleModel::family ? person.family
                                                : person.suburb;
}

void add_family(QHash<int, FoundPerson>& people, const people::DisclosedFamily& family, bool preferred)
{
    const QString suburb = family.residential() ? family.residential()->suburb : QString();
    for (const auto& person : family.people())
        people.insert(person.person_id, {.surname_id = family.family().Surname_ID,
                                         .name = people::listed_name(person, family.family().surname, preferred),
                                         .family = family.family().surname,
                                         .suburb = suburb,
                                         .state = state_of(states_of(person))});
}

} // namespace

std::optional<std::vector<FoundPerson>> read_people(Desk& desk, const people::WorkingList& list)
{
    const auto disclosure = people::Disclosure::of(desk.office);
    const std::vector<int> families = list.families();
    QHash<int, FoundPerson> known;
    const core::ProgressRun run(desk.progress, u"Reading the people found"_s,
                                int(families.size() / families_per_step) + 1,
                                u"Are you sure that you wish to cancel this report?"_s);
    bool cancelled = false;
    for (std::size_t first = 0; first < families.size() && !cancelled; first += families_per_step) {
        const auto some = std::span(families).subspan(first, std::min(families_per_step, families.size() - first));
        for (auto& file :
             people::load_families(*desk.office.session, some, people::Part::address | people::Part::details))
            add_family(known, people::disclose(std::move(file), disclosure), disclosure.use_preferred_names);
        cancelled = !desk.progress.step();
    }
    if (cancelled)
        return std::nullopt;
    std::vector<FoundPerson> found;
    for (const auto& member : list.members)
        if (const auto person = known.constFind(member.person_id); person != known.constEnd())
            found.push_back(*person);
    return found;
}

void FoundPeopleModel::set_people(std::vector<FoundPerson> people)
{
    beginResetModel();
    m_people = std::move(people);
    m_search.clear();
    for (const FoundPerson& person : m_people)
        m_search.push_back(folded_text(person.name + u' ' + person.family + u' ' + person.suburb));
    find_shown({});
    endResetModel();
}

void FoundPeopleModel::narrow(const QString& typed)
{
    beginResetModel();
    find_shown(folded_words(typed));
    endResetModel();
}

void FoundPeopleModel::find_shown(const QStringList& words)
{
    m_shown.clear();
    for (std::size_t place = 0; place < m_people.size(); ++place)
        if (holds_all(m_search[place], words))
            m_shown.push_back(place);
}

std::vector<int> FoundPeopleModel::surname_ids() const
{
    std::vector<int> keys;
    QSet<int> there;
    for (const std::size_t place : m_shown) {
        const int key = m_people[place].surname_id;
        if (!there.contains(key))
            keys.push_back(key);
        there.insert(key);
    }
    return keys;
}

int FoundPeopleModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : int(m_shown.size());
}

int FoundPeopleModel::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : column_count;
}

QVariant FoundPeopleModel::data(const QModelIndex& index, int role) const
{
    if (!checkIndex(index, CheckIndexOption::IndexIsValid))
        return {};
    const FoundPerson& shown = person(index.row());
    if (role == Qt::DisplayRole)
        return text_of(shown, index.column());
    if (role == Qt::ForegroundRole && index.column() == name)
        return state_colour(shown.state, shade_of(QApplication::palette()));
    if (role == Qt::FontRole && index.column() == name && shown.state == State::deceased) {
        QFont font = QApplication::font();
        font.setItalic(true);
        return font;
    }
    return {};
}

QVariant FoundPeopleModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    return orientation == Qt::Horizontal && role == Qt::DisplayRole ? QVariant(headings().value(section)) : QVariant();
}

} // namespace kindrel::desktop
