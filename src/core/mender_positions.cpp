#include "core/mender_checks.h"

#include <algorithm>
#include <array>

// The places of people in their families and of items in the user's lists.
namespace kindrel::core::mender_checks {

using namespace Qt::StringLiterals;

namespace {

enum class Places { without_gaps, all_different };

struct Ordered
{
    const char16_t *table, *key;
    const char16_t* within; ///< The fields that part the lists, with commas; empty: one list.
    Places places = Places::all_different;
};
constexpr std::array ordered{
    Ordered{u"tbl_people", u"person_id", u"[Surname_ID]", Places::without_gaps},
    Ordered{u"tbl_status_setup", u"status_id", u""},
    Ordered{u"tbl_group_setup", u"group_id", u""},
    Ordered{u"tbl_ministry_setup", u"ministry_id", u""},
    Ordered{u"tbl_individual_date_setup", u"in_date_id", u""},
    Ordered{u"tbl_flexi_setup", u"flexi_id", u""},
    Ordered{u"tbl_family_group_setup", u"family_group_id", u""},
    Ordered{u"tbl_family_date_setup", u"fam_date_id", u""},
    Ordered{u"tbl_occupation_setup", u"occupation_id", u""},
    Ordered{u"tbl_suburb_setup", u"suburb_id", u""},
    Ordered{u"tbl_roll_project", u"roll_project_id", u""},
    Ordered{u"tbl_finance_project", u"finance_project_id", u""},
    Ordered{u"tbl_weekly_project", u"weekly_project_id", u""},
    Ordered{u"tbl_weekly_group", u"group_id", u"[weekly_project_id],[group_type]"},
    Ordered{u"tbl_roster_project", u"roster_project_id", u""},
    Ordered{u"tbl_roster_duty", u"duty_id", u"[roster_project_id]"},
    Ordered{u"tbl_wardline_compliance", u"compliance_id", u""},
    Ordered{u"tbl_wardline_risk", u"risk_id", u"[compliance_id]"},
    Ordered{u"tbl_wardline_status", u"status_id", u"[compliance_id]"},
    Ordered{u"tbl_wardline_reviews", u"reviews_id", u"[compliance_id]"},
    Ordered{u"tbl_wardline_procedure", u"procedure_id", u"[compliance_id]"},
    Ordered{u"tbl_wardline_event", u"event_id", u"[compliance_id]"},
    Ordered{u"tbl_wardline_comment", u"comment_id", u"[compliance_id]"},
};

bool in_one_list(const Ordered& list)
{
    return QStringView(list.within).isEmpty();
}

/// The lists in disorder: the fields that part them, one row for each list.
QString disorder(const Ordered& list)
{
    const QString within = in_one_list(list) ? QString() : u" GROUP BY %1"_s.arg(QStringView(list.within));
    const QString gaps =
        list.places == Places::without_gaps ? u" OR MIN([position])<>1 OR MAX([position])<>COUNT(*)"_s : QString();
    return u"SELECT %1 FROM [%2]%3 HAVING COUNT(DISTINCT [position])<>COUNT(*) OR MIN([position])<1%4"_s.arg(
        in_one_list(list) ? u"COUNT(*)"_s : QStringView(list.within).toString(), QStringView(list.table), within, gaps);
}

/// The rows of those lists, one list behind the other, as they stand in it.
QString rows_in_disorder(const Ordered& list)
{
    QString where;
    if (!in_one_list(list)) {
        QStringList same;
        for (const auto& field : QStringView(list.within).split(u','))
            same += u"d.%1=o.%1"_s.arg(field);
        where = u" WHERE EXISTS (SELECT 1 FROM (%1) d WHERE %2)"_s.arg(disorder(list), same.join(u" AND "));
    }
    const QString apart = in_one_list(list) ? u"0"_s : QStringView(list.within).toString();
    const QString order = in_one_list(list) ? QString() : apart + u',';
    return u"SELECT o.[%1],o.[position],%2 FROM [%3] o%4 ORDER BY %5[position],[%1];"_s.arg(
        QStringView(list.key), apart, QStringView(list.table), where, order);
}

int lists_in_disorder(Session& session, const Ordered& list)
{
    return number_from(session, u"SELECT COUNT(*) FROM (%1) d;"_s.arg(disorder(list)));
}

/// Key and place of the rows whose place is not the one that counting gives.
std::vector<std::vector<Value>> right_places(Session& session, const Ordered& list)
{
    auto rows = session.select(rows_in_disorder(list));
    const int columns = rows.column_count();
    std::vector<std::vector<Value>> wrong;
    std::vector<qint64> apart;
    qint64 place = 0;
    for (const Row& row : rows) {
        std::vector<qint64> here;
        for (int index = 2; index < columns; ++index)
            here.push_back(row.number(Column{index}));
        place = here == apart ? place + 1 : 1;
        apart = here;
        if (row.number(Column{1}) != place)
            wrong.push_back({row.value(Column{0}), place});
    }
    return wrong;
}

} // namespace

Findings examine_positions(MenderPlace& place)
{
    Findings findings;
    for (const auto& list : ordered) {
        const int count = lists_in_disorder(*place.session, list);
        if (count == 0)
            continue;
        const QString words =
            list.places == Places::without_gaps
                ? u"The people of %1 are not numbered from 1 without gaps and doubles."_s.arg(
                      counted(count, u"family"_s, u"families"_s))
                : u"Two entries of the list '%1' stand at one place."_s.arg(in_words(QStringView(list.table)));
        findings.push_back({u"positions"_s, words, count, Cure::mend,
                            u"The places are numbered again in the order in which they stand."_s});
    }
    return findings;
}

void mend_positions(MenderPlace& place)
{
    for (const auto& list : ordered) {
        if (lists_in_disorder(*place.session, list) == 0)
            continue;
        place.session->fill_temporary(u"mender_places"_s, {u"key"_s, u"place"_s}, right_places(*place.session, list));
        place.session->execute(
            u"UPDATE [%1] SET [position]=(SELECT r.[place] FROM [mender_places] r WHERE r.[key]=[%1].[%2]) "
            "WHERE [%2] IN (SELECT [key] FROM [mender_places]);"_s.arg(QStringView(list.table), QStringView(list.key)));
    }
}

} // namespace kindrel::core::mender_checks
