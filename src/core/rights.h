#pragma once

#include <QStringView>

#include <bitset>

namespace kindrel::core {

/// The access areas in the order in which the security setup lists them.
enum class Area {
    read_only_family_data,
    add_family,
    search_for_family,
    family_file_notebook,
    visitation_notes_in_notebook,
    personal_notes_in_notebook,
    birth_dates,
    roll,
    pin_financial_only,
    full_financial,
    weekly_statistics,
    rosters,
    wardline,
    report_outputs,
    data_analysis,
    create_and_send_emails,
    tagging,
    school_year_manager,
    visitation,
    visitation_tab,
    people_organiser,
    group_history_manager,
    export_text,
    report_viewer,
    custom_report,
    custom_letter,
    backup_data,
    restore_data,
    book_in_out,
    file_clearance,
    legend,
    quick_date,
    fast_find,
    family_file_setup,
    filter_fusion_setup,
    project_setup,
    roster_setup,
    wardline_setup,
    global_data_setup,
    vision_setup,
    network_setup,
    security
};
inline constexpr int area_count = 42;

/// The area's name as it is stored and shown, for example "Birth Dates Access".
[[nodiscard]] QStringView area_name(Area area);

/// What the person at the keyboard may do.
class Rights
{
public:
    /// Everything granted and nothing restricted: a church without security.
    [[nodiscard]] static Rights all();
    [[nodiscard]] bool may(Area area) const { return m_granted[static_cast<std::size_t>(area)]; }
    void set(Area area, bool granted) { m_granted[static_cast<std::size_t>(area)] = granted; }

private:
    std::bitset<area_count> m_granted;
};

} // namespace kindrel::core
