#include "core/references.h"

#include <array>

namespace kindrel::core {

namespace {

constexpr std::array all{
    Home{Entity::surname, "tbl_surname", "surname_id"},
    Home{Entity::person, "tbl_people", "person_id"},
    Home{Entity::group, "tbl_group_setup", "group_id"},
    Home{Entity::status, "tbl_status_setup", "status_id"},
    Home{Entity::ministry, "tbl_ministry_setup", "ministry_id"},
    Home{Entity::individual_date, "tbl_individual_date_setup", "in_date_id"},
    Home{Entity::flexi, "tbl_flexi_setup", "flexi_id"},
    Home{Entity::family_group, "tbl_family_group_setup", "family_group_id"},
    Home{Entity::family_date, "tbl_family_date_setup", "fam_date_id"},
    Home{Entity::title, "tbl_title", "title_id"},
    Home{Entity::occupation, "tbl_occupation_setup", "occupation_id"},
    Home{Entity::suburb, "tbl_suburb_setup", "suburb_id"},
    Home{Entity::security, "tbl_security", "security_id"},
    Home{Entity::roll_date, "tbl_roll_date", "roll_date_id"},
    Home{Entity::roll_project, "tbl_roll_project", "roll_project_id"},
    Home{Entity::finance_project, "tbl_finance_project", "finance_project_id"},
    Home{Entity::weekly_project, "tbl_weekly_project", "weekly_project_id"},
    Home{Entity::weekly_group, "tbl_weekly_group", "group_id"},
    Home{Entity::weekly_date, "tbl_weekly_date", "weekly_date_id"},
    Home{Entity::finance_date, "tbl_finance_date", "finance_date_id"},
    Home{Entity::fusion, "Tbl_fusion_group", "fusion_id"},
    Home{Entity::history, "tbl_group_history", "history_id"},
    Home{Entity::roster_project, "tbl_roster_project", "roster_project_id"},
    Home{Entity::roster_duty, "tbl_roster_duty", "duty_id"},
    Home{Entity::roster_date, "tbl_roster_date", "date_id"},
    Home{Entity::roster_duty_people, "tbl_roster_people", "roster_people_id"},
    Home{Entity::roster_team, "tbl_roster_team", "team_id"},
    Home{Entity::master_duty, "tbl_roster_master_duty", "master_duty_id"},
    Home{Entity::email_history, "tbl_email_history", "email_history_id"},
    Home{Entity::print_history, "tbl_print_history", "print_history_id"},
    Home{Entity::roster_memory, "tbl_roster_memory", "memory_id"},
    Home{Entity::user, "tbl_security", "user_id"},
    Home{Entity::wardline_compliance, "tbl_wardline_compliance", "compliance_id"},
    Home{Entity::wardline_risk, "tbl_wardline_risk", "risk_id"},
    Home{Entity::wardline_status, "tbl_wardline_status", "status_id"},
    Home{Entity::wardline_reviews, "tbl_wardline_reviews", "reviews_id"},
    Home{Entity::wardline_procedure, "tbl_wardline_procedure", "procedure_id"},
    Home{Entity::wardline_event, "tbl_wardline_event", "event_id"},
    Home{Entity::wardline_comment, "tbl_wardline_comment", "comment_id"},
    Home{Entity::wardline_incident, "tbl_wardline_incident", "incident_id"},
    Home{Entity::wardline_document, "tbl_wardline_store_document", "document_id"},
    Home{Entity::wardline_application, "tbl_wardline_application_records", "application_id"},
    Home{Entity::wardline_referee, "tbl_wardline_referee_records", "referee_id"},
    Home{Entity::wardline_incident_record, "tbl_wardline_incident_records", "incident_id_in"},
    Home{Entity::wardline_audit_risk, "tbl_wardline_audit_risk", "audit_id"},
    Home{Entity::wardline_audit_status, "tbl_wardline_audit_status", "audit_id"},
    Home{Entity::wardline_audit_review, "tbl_wardline_audit_review", "audit_id"},
    Home{Entity::wardline_audit_incident, "tbl_wardline_audit_incident", "audit_id"},
    Home{Entity::wardline_security, "tbl_wardline_security_archive", "security_id"},
    Home{Entity::wardline_template, "tbl_wardline_template", "template_id"},
    Home{Entity::wardline_template, "tbl_wardline_flat_template", "template_id"},
    Home{Entity::wardline_template, "tbl_wardline_export_template", "template_id"},
};

}

std::span<const Home> homes()
{
    return all;
}

} // namespace kindrel::core
