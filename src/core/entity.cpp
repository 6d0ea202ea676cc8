#include "core/entity.h"

#include <array>

namespace kindrel::core {

namespace {

constexpr std::array<QStringView, entity_count> tables{
    u"tbl_id_surname",
    u"tbl_id_person",
    u"tbl_id_group",
    u"tbl_id_status",
    u"tbl_id_ministry",
    u"tbl_id_individual_date",
    u"tbl_id_flexi",
    u"tbl_id_family_group",
    u"tbl_id_family_date",
    u"tbl_id_title",
    u"tbl_id_occupation",
    u"tbl_id_suburb",
    u"tbl_id_security",
    u"tbl_id_roll_date",
    u"tbl_id_roll_project",
    u"tbl_id_finance_project",
    u"tbl_id_weekly_project",
    u"tbl_id_weekly_group",
    u"tbl_id_weekly_date",
    u"tbl_id_finance_date",
    u"tbl_id_fusion",
    u"tbl_id_history",
    u"tbl_id_roster_project",
    u"tbl_id_roster_duty",
    u"tbl_id_roster_dates",
    u"tbl_id_roster_duty_people",
    u"tbl_id_roster_teams",
    u"tbl_id_master_duty",
    u"tbl_id_email_history",
    u"tbl_id_print_history",
    u"tbl_id_roster_memory",
    u"tbl_id_user_id",
    u"tbl_id_wardline_compliance",
    u"tbl_id_wardline_risk",
    u"tbl_id_wardline_status",
    u"tbl_id_wardline_reviews",
    u"tbl_id_wardline_procedure",
    u"tbl_id_wardline_event",
    u"tbl_id_wardline_comment",
    u"tbl_id_wardline_incident",
    u"tbl_id_wardline_document",
    u"tbl_id_wardline_application",
    u"tbl_id_wardline_referee",
    u"tbl_id_wardline_incident",
    u"tbl_id_wardline_audit_risk",
    u"tbl_id_wardline_audit_status",
    u"tbl_id_wardline_audit_review",
    u"tbl_id_wardline_audit_incident",
    u"tbl_id_wardline_security",
    u"tbl_id_wardline_template",
};

}

QStringView counter_table(Entity entity)
{
    const int number = static_cast<int>(entity);
    return number >= 1 && number <= entity_count ? tables[static_cast<std::size_t>(number - 1)] : QStringView();
}

} // namespace kindrel::core
