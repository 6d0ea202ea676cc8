#pragma once

#include <QStringView>

namespace kindrel::core {

/// The kinds of thing that have keys of their own, by the number under which the allocation knows them.
enum class Entity : int {
    surname = 1,
    person,
    group,
    status,
    ministry,
    individual_date,
    flexi,
    family_group,
    family_date,
    title,
    occupation,
    suburb,
    security,
    roll_date,
    roll_project,
    finance_project,
    weekly_project,
    weekly_group,
    weekly_date,
    finance_date,
    fusion,
    history,
    roster_project,
    roster_duty,
    roster_date,
    roster_duty_people,
    roster_team,
    master_duty,
    email_history,
    print_history,
    roster_memory,
    user,
    wardline_compliance,
    wardline_risk,
    wardline_status,
    wardline_reviews,
    wardline_procedure,
    wardline_event,
    wardline_comment,
    wardline_incident,
    wardline_document,
    wardline_application,
    wardline_referee,
    wardline_incident_record, ///< Draws from the same counter as `wardline_incident`.
    wardline_audit_risk,
    wardline_audit_status,
    wardline_audit_review,
    wardline_audit_incident,
    wardline_security,
    wardline_template
};
inline constexpr int entity_count = 50;

/// The counter table of an entity; empty for a number outside 1 to 50.
[[nodiscard]] QStringView counter_table(Entity entity);

} // namespace kindrel::core
