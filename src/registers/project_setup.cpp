#include "registers/project_setup.h"

#include "core/open_church.h"
#include "people/setup_lists.h"
#include "people/sort_key.h"
#include "registers/belongings.h"
#include "registers/project_rows.h"

#include <algorithm>

namespace kindrel::registers {

using namespace Qt::StringLiterals;

namespace {

using core::Answer;

constexpr int longest_name = people::longest_setup_text;

const QString choose_to_remove = u"Please choose which item you wish to remove first"_s;
const QString select_to_remove = u"Unable to remove an item until you select one"_s;
const QString select_to_move = u"Please select an item for moving"_s;
const QString choose_to_move = u"Please choose which item you wish to move first"_s;
const QString select_to_rename = u"Please select an item for renaming"_s;
const QString highest = u"This is the highest position this item can be moved to"_s;
const QString lowest = u"This is the lowest position this item can be moved to"_s;

/// What a project or category is called in the question before its removal.
QString removal_question(QStringView what, const QString& name, QStringView this_what)
{
    return u"Please confirm that you wish to remove this %1 '%2', please note all records attached to this %3 will be "
           "removed once you delete this project. Do you wish to continue?"_s.arg(what, name, this_what);
}

QString project_question(Kind kind, const QString& name)
{
    const QStringView what = kind == Kind::roll      ? u"Roll project"
                             : kind == Kind::finance ? u"Financial project"
                                                     : u"item";
    return removal_question(what, name, what);
}

/// The names of a list without the one at `except`.
template <class List>
QStringList names_of(const List& list, int except = -1)
{
    QStringList names;
    for (int index = 0; const auto& item : list) {
        if (index++ != except)
            names += item.name;
    }
    return names;
}

template <std::size_t Count>
QStringList others_of(const std::array<QString, Count>& names, int except)
{
    QStringList others(names.begin(), names.end());
    others.removeAt(except);
    return others;
}

bool all_empty(const auto& names)
{
    return std::ranges::all_of(names, &QString::isEmpty);
}

bool holds(const std::vector<CategoryItem>& categories, int index)
{
    return index >= 0 && index < std::ssize(categories);
}

} // namespace

ProjectSetup::ProjectSetup(core::Office& office) : m_office(office)
{
    for (const auto kind : kinds)
        at(kind) = ProjectList(read_project_items(*office.session, kind));
}

bool ProjectSetup::refuse(const QString& text, const QString& more) const
{
    m_office.dialogue.show({.text = text, .more = more});
    return false;
}

bool ProjectSetup::fits(const QString& name, const QStringList& others) const
{
    if (name.size() > longest_name)
        return refuse(u"Please enter no more than %1 characters"_s.arg(longest_name));
    const auto key = people::sort_key(name);
    for (const auto& other : others) {
        if (!other.isEmpty() && people::sort_key(other) == key)
            return refuse(u"This item already exists in the list"_s, other);
    }
    return true;
}

void ProjectSetup::change(Kind kind, int project, const std::function<void(ProjectItem&)>& make)
{
    auto item = list(kind)[project];
    make(item);
    at(kind).replace(project, std::move(item));
}

// Projects.

bool ProjectSetup::add(Kind kind, const QString& name)
{
    ProjectItem item;
    item.name = people::tidy(name);
    if (item.name.isEmpty())
        return refuse(u"Please enter an item before attempting to add a new item to the list"_s);
    if (!fits(item.name, names_of(list(kind))))
        return false;
    at(kind).add(std::move(item));
    return true;
}

bool ProjectSetup::rename(Kind kind, int index, const QString& name)
{
    if (!list(kind).holds(index))
        return refuse(select_to_rename);
    const auto tidied = people::tidy(name);
    if (tidied.isEmpty())
        return refuse(u"Please enter an item"_s);
    if (!fits(tidied, names_of(list(kind), index)))
        return false;
    change(kind, index, [&](ProjectItem& item) { item.name = tidied; });
    return true;
}

bool ProjectSetup::remove(Kind kind, int index)
{
    const auto& items = list(kind);
    if (items.empty())
        return refuse(u"Unable to remove any items until you first add a new item"_s);
    if (!items.holds(index))
        return refuse(choose_to_remove);
    const core::Message question{.text = project_question(kind, items[index].name),
                                 .more = told_with_project(*m_office.session, register_kind(kind), items[index].key),
                                 .icon = core::Icon::question};
    if (!m_office.dialogue.confirm(question, Answer::no))
        return false;
    at(kind).remove(index);
    return true;
}

bool ProjectSetup::move_up(Kind kind, int index)
{
    if (!list(kind).holds(index))
        return refuse(select_to_move);
    return at(kind).move_up(index) || refuse(highest);
}

bool ProjectSetup::move_down(Kind kind, int index)
{
    if (!list(kind).holds(index))
        return refuse(select_to_move);
    return at(kind).move_down(index) || refuse(lowest);
}

// What a roll project counts.

bool ProjectSetup::roll_chosen(int project) const
{
    return list(Kind::roll).holds(project) ||
           refuse(u"You need to select a Roll project before adding any information to it"_s);
}

bool ProjectSetup::may_empty(QStringView what, const QString& name, const QString& told) const
{
    return told.isEmpty() ||
           m_office.dialogue.confirm(
               {.text =
                    u"Please confirm that you wish to remove this %1 '%2'. Do you wish to continue?"_s.arg(what, name),
                .more = told,
                .icon = core::Icon::question},
               Answer::no);
}

template <std::size_t Count>
bool ProjectSetup::set_name(int project, int place, const QString& name, const RollPart<Count>& part)
{
    if (!roll_chosen(project))
        return false;
    const auto& item = list(Kind::roll)[project];
    const auto& names = item.*part.names;
    const auto& before = names.at(static_cast<std::size_t>(place));
    const auto tidied = people::tidy(name);
    if (!tidied.isEmpty() && !fits(tidied, others_of(names, place)))
        return false;
    if (tidied.isEmpty() && !before.isEmpty() &&
        !may_empty(part.what, before, part.told(*m_office.session, item.key, place + 1)))
        return false;
    change(Kind::roll, project,
           [&](ProjectItem& changed) { (changed.*part.names).at(static_cast<std::size_t>(place)) = tidied; });
    return true;
}

bool ProjectSetup::set_service(int project, int place, const QString& name)
{
    return set_name<service_count>(project, place, name, {u"service", &ProjectItem::services, told_without_service});
}

bool ProjectSetup::set_absence(int project, int place, const QString& name)
{
    return set_name<absence_count>(project, place, name,
                                   {u"reason for being absent", &ProjectItem::absences, told_without_absence});
}

bool ProjectSetup::set_include(int project, int place, bool include)
{
    if (!roll_chosen(project))
        return false;
    change(Kind::roll, project, [&](ProjectItem& item) { item.include.at(static_cast<std::size_t>(place)) = include; });
    return true;
}

// Categories of a weekly project.

bool ProjectSetup::weekly_chosen(int project) const
{
    return list(Kind::weekly).holds(project) ||
           refuse(u"You must choose a weekly project before attempting to add anything to it"_s);
}

const std::vector<CategoryItem>& ProjectSetup::categories(int project, FigureKind kind) const
{
    return list(Kind::weekly)[project].categories(kind);
}

bool ProjectSetup::add_category(int project, FigureKind kind, const QString& name)
{
    if (!weekly_chosen(project))
        return false;
    const auto& item = list(Kind::weekly)[project];
    const auto tidied = people::tidy(name);
    if (tidied.isEmpty())
        return refuse(u"Please enter an item before attempting to add a new item to the list"_s);
    if (std::ssize(item.attendance) + std::ssize(item.finance) >= most_categories)
        return refuse(u"A weekly project can have no more than %1 categories"_s.arg(most_categories));
    if (!fits(tidied, names_of(categories(project, kind))))
        return false;
    change(Kind::weekly, project, [&](ProjectItem& changed) { changed.categories(kind).push_back({0, tidied}); });
    return true;
}

bool ProjectSetup::rename_category(int project, FigureKind kind, int index, const QString& name)
{
    if (!weekly_chosen(project))
        return false;
    if (!holds(categories(project, kind), index))
        return refuse(select_to_rename);
    const auto tidied = people::tidy(name);
    if (tidied.isEmpty())
        return refuse(u"Please enter an item"_s);
    if (!fits(tidied, names_of(categories(project, kind), index)))
        return false;
    change(Kind::weekly, project,
           [&](ProjectItem& item) { item.categories(kind).at(static_cast<std::size_t>(index)).name = tidied; });
    return true;
}

bool ProjectSetup::remove_category(int project, FigureKind kind, int index)
{
    if (!weekly_chosen(project))
        return false;
    const auto& items = categories(project, kind);
    if (items.empty())
        return refuse(u"Unable to remove any items until you first add a new item"_s);
    if (!holds(items, index))
        return refuse(select_to_remove);
    const auto& category = items[static_cast<std::size_t>(index)];
    const core::Message question{.text = removal_question(u"item", category.name, u"item"),
                                 .more = told_with_category(*m_office.session, category.key),
                                 .icon = core::Icon::question};
    if (!m_office.dialogue.confirm(question, Answer::no))
        return false;
    change(Kind::weekly, project, [&](ProjectItem& item) {
        auto& changed = item.categories(kind);
        changed.erase(changed.begin() + index);
    });
    return true;
}

bool ProjectSetup::move_category(int project, FigureKind kind, int index, bool up)
{
    if (!weekly_chosen(project))
        return false;
    CategoryList moved(categories(project, kind));
    if (!moved.holds(index))
        return refuse(choose_to_move);
    if (!(up ? moved.move_up(index) : moved.move_down(index)))
        return refuse(up ? highest : lowest);
    change(Kind::weekly, project, [&](ProjectItem& item) { item.categories(kind) = moved.items(); });
    return true;
}

bool ProjectSetup::move_category_up(int project, FigureKind kind, int index)
{
    return move_category(project, kind, index, true);
}

bool ProjectSetup::move_category_down(int project, FigureKind kind, int index)
{
    return move_category(project, kind, index, false);
}

// Leaving and saving.

bool ProjectSetup::check()
{
    m_faulty.reset();
    const auto& rolls = list(Kind::roll);
    for (int project = 0; project < rolls.size(); ++project) {
        if (all_empty(rolls[project].services)) {
            m_faulty = {Kind::roll, project};
            return refuse(u"You must enter at least one Roll service description for each Roll project"_s);
        }
    }
    const auto& weekly = list(Kind::weekly);
    for (int project = 0; project < weekly.size(); ++project) {
        if (weekly[project].attendance.empty() && weekly[project].finance.empty()) {
            m_faulty = {Kind::weekly, project};
            return refuse(u"You have set up a Weekly Project name without either adding a financial or attendance "
                          "category, please add at least one before exiting this area."_s);
        }
    }
    return true;
}

bool ProjectSetup::altered() const
{
    return std::ranges::any_of(m_lists, &ProjectList::altered);
}

void ProjectSetup::drop()
{
    for (auto& projects : m_lists)
        projects = ProjectList(projects.stored());
}

bool ProjectSetup::write(const AllItems& items)
{
    core::Transaction transaction(*m_office.session);
    for (const auto kind : kinds) {
        if (!list(kind).altered())
            continue;
        if (read_project_items(*m_office.session, kind) != list(kind).stored())
            return false;
        write_project_items(m_office, kind, list(kind).stored(), items[static_cast<std::size_t>(kind)]);
    }
    transaction.commit();
    return true;
}

bool ProjectSetup::save()
{
    if (!core::permitted(m_office, core::Area::project_setup) || !core::network_guard(m_office) || !check())
        return false;
    AllItems items;
    for (const auto kind : kinds) {
        auto& of_kind = items[static_cast<std::size_t>(kind)];
        of_kind = list(kind).items();
        if (list(kind).altered())
            give_keys(*m_office.session, kind, of_kind);
    }
    if (!write(items))
        return refuse(u"The projects have been changed by another user while they were open here."_s,
                      u"Nothing was stored. Leave this area and enter it again to see them as they are."_s);
    for (const auto kind : kinds)
        at(kind) = ProjectList(std::move(items[static_cast<std::size_t>(kind)]));
    return true;
}

} // namespace kindrel::registers
