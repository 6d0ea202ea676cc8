#include "registers/register_kind.h"

#include <algorithm>

namespace kindrel::registers {

namespace {

using core::Area;
using core::AreaId;
using core::Entity;
using core::LockKind;

constexpr auto one_in_roll =
    u"To protect the integrity of your data, %1 only allows one user at a time to edit the Roll Project. If no user is "
    "on the system then you will need to enter the 'Network Setup' area to unlock this Roll project.";
constexpr auto one_in_financial =
    u"To protect the integrity of your data, %1 only allows one user at a time to edit the Financial Project. If no "
    "user is on the system then you will need to enter the 'Network Setup' area to unlock this Financial project.";
constexpr auto one_in_finance =
    u"To protect the integrity of your data, %1 only allows one user at a time to edit the Finance Project. If no user "
    "is on the system then you will need to enter the 'Network Setup' area to unlock this Finance project.";
constexpr auto one_in_weekly =
    u"To protect the integrity of your data, %1 only allows one user at a time to edit the weekly Project. If no user "
    "is on the system then you will need to enter the 'Network Setup' area to unlock this Weekly project.";

constexpr std::array all{
    RegisterKind{
        .kind = Kind::roll,
        .projects_query = u"Qry_roll_load_project",
        .project_table = u"tbl_roll_project",
        .project_key = u"roll_project_id",
        .project_name = u"roll_project",
        .entry_position = u"roll_add_position",
        .output_position = u"roll_output_position",
        .dates_query = u"Qry_roll_load_dates",
        .date_table = u"tbl_roll_date",
        .date_key = u"roll_date_id",
        .date = u"roll_date",
        .belongings = {Belonging{u"tbl_roll_attendance", u"roll_date_id", u"mark", u"marks"},
                       Belonging{u"tbl_roll_visitors", u"roll_date_id", u"visitor figure", u"visitor figures"},
                       Belonging{u"tbl_roll_memo", u"roll_date_id", u"note", u"notes", false}},
        .project_entity = Entity::roll_project,
        .date_entity = Entity::roll_date,
        .lock = LockKind::roll,
        .area = AreaId::roll,
        .right = Area::roll,
        .words = u"Roll Project",
        .no_projects = u"Unable to enter a roll as no roll projects have been setup. Please go to the roll setup area, "
                       "which is accessed from the main menu setup tab to enter a new roll project.",
        .held_at_entry = {u"Unable to enter this Roll Project as another user is editing this Roll Project.",
                          one_in_roll},
        .held_at_removal = {u"Unable to delete this date as another user is editing this Roll Project.", one_in_roll},
        .unsaved_question = u"You have un-saved Roll information, do you wish to save this data before exiting the "
                            "roll program?",
    },
    RegisterKind{
        .kind = Kind::finance,
        .projects_query = u"Qry_finance_load_project",
        .project_table = u"tbl_finance_project",
        .project_key = u"finance_project_id",
        .project_name = u"finance_project",
        .entry_position = u"finance_add_position",
        .output_position = u"finance_output_position",
        .dates_query = u"Qry_finance_load_dates",
        .date_table = u"tbl_finance_date",
        .date_key = u"finance_date_id",
        .date = u"finance_date",
        .belongings = {Belonging{u"tbl_finance_data", u"finance_date_id", u"amount", u"amounts"},
                       Belonging{u"tbl_finance_memo", u"finance_date_id", u"note", u"notes", false},
                       {}},
        .project_entity = Entity::finance_project,
        .date_entity = Entity::finance_date,
        .lock = LockKind::finance,
        .area = AreaId::finance,
        .right = Area::full_financial,
        .words = u"Financial Project",
        .no_projects = u"Unable to enter a financial project as no financial projects have been setup. Please go to "
                       "the financial setup area that is accessed from the main menu setup tab to enter a new "
                       "financial project.",
        .held_at_entry = {u"Unable to enter this Financial Project as another user is editing this Financial Project.",
                          one_in_financial},
        .held_at_removal = {u"Unable to delete this date as another user is editing this Finance Project.",
                            one_in_finance},
        .unsaved_question = u"You have un-saved financial information, do you wish to save this data before exiting "
                            "the finance program?",
    },
    RegisterKind{
        .kind = Kind::weekly,
        .projects_query = u"Qry_weekly_load_project",
        .project_table = u"tbl_weekly_project",
        .project_key = u"weekly_project_id",
        .project_name = u"weekly_project",
        .entry_position = u"weekly_add_position",
        .output_position = u"weekly_output_position",
        .dates_query = u"Qry_weekly_load_dates",
        .date_table = u"tbl_weekly_date",
        .date_key = u"weekly_date_id",
        .date = u"weekly_date",
        .belongings = {Belonging{u"tbl_weekly_amount", u"date_id", u"figure", u"figures"},
                       Belonging{u"tbl_weekly_memo", u"weekly_date_id", u"note", u"notes", false},
                       {}},
        .project_entity = Entity::weekly_project,
        .date_entity = Entity::weekly_date,
        .lock = LockKind::weekly,
        .area = AreaId::weekly,
        .right = Area::weekly_statistics,
        .words = u"Weekly Project",
        .no_projects = u"Unable to enter a Weekly project, as no Weekly projects have been setup. Please go to the "
                       "weekly setup area, which is accessed from the main menu setup tab to enter a new weekly "
                       "project.",
        .held_at_entry = {u"Unable to enter this Weekly Project as another user is editing this Weekly Project.",
                          one_in_weekly},
        .held_at_removal = {u"Unable to delete this date as another user is editing this Weekly Project.",
                            one_in_weekly},
        .unsaved_question = u"You have un-saved Weekly Statistics information, do you wish to save this data before "
                            "exiting the weekly program?",
    },
};
static_assert(all.size() == kinds.size());
static_assert(std::ranges::is_sorted(all, {}, &RegisterKind::kind));

} // namespace

std::span<const Belonging> RegisterKind::belonging_tables() const
{
    const auto end = std::ranges::find(belongings, nullptr, &Belonging::table);
    return {belongings.begin(), end};
}

QString named(const char16_t* name)
{
    return u'[' + QString::fromUtf16(name) + u']';
}

const RegisterKind& register_kind(Kind kind)
{
    return all[static_cast<std::size_t>(kind)];
}

bool permitted(const core::Office& office, const RegisterKind& kind)
{
    return core::may_enter(office, kind.area) || core::permitted(office, kind.right);
}

} // namespace kindrel::registers
