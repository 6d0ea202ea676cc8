#pragma once

#include "people/setup_fixture.h"
#include "registers/weekly_analysis.h"

namespace kindrel::test {

/// A figure of a category: whole for attendance, dollars for money.
struct GivenFigure
{
    core::Date date;
    int category;
    double figure;
};

/// Two weekly projects with figures: 1, "Sunday", with the categories 1 "Morning" and 2 "Evening" of attendance and 3
/// "Offering" of money; 2, "Youth", with category 4 "Youth".
class WeeklyFigures
{
public:
    explicit WeeklyFigures(core::Session& session) : m_session(session)
    {
        project(1, QStringLiteral("Sunday"));
        project(2, QStringLiteral("Youth"));
        category(1, QStringLiteral("Morning"), registers::FigureKind::attendance);
        category(2, QStringLiteral("Evening"), registers::FigureKind::attendance);
        category(3, QStringLiteral("Offering"), registers::FigureKind::money);
        category(4, QStringLiteral("Youth"), registers::FigureKind::attendance, 2);
    }

    void project(int key, const QString& name)
    {
        m_session.execute(QStringLiteral("INSERT INTO [tbl_weekly_project] ([weekly_project_id],[weekly_project],"
                                         "[position]) VALUES (?,?,?);"),
                          key, name, key);
    }
    void category(int key, const QString& name, registers::FigureKind kind, int of_project = 1)
    {
        m_session.execute(QStringLiteral("INSERT INTO [tbl_weekly_group] ([group_id],[group],[position],[group_type],"
                                         "[weekly_project_id]) VALUES (?,?,?,?,?);"),
                          key, name, key, kind, of_project);
    }
    void add(const std::vector<GivenFigure>& figures, int of_project = 1)
    {
        for (const auto& given : figures)
            m_session.execute(
                QStringLiteral("INSERT INTO [tbl_weekly_amount] ([date_id],[group_id],[amount]) VALUES (?,?,?);"),
                date_key(given.date, of_project), given.category, qRound64(given.figure * 10000));
    }

private:
    int date_key(const core::Date& date, int of_project)
    {
        const int key = ((of_project * 10000 + date.year) * 12 + date.month) * 31 + date.day;
        m_session.execute(QStringLiteral("INSERT INTO [tbl_weekly_date] ([weekly_date_id],[weekly_date],"
                                         "[weekly_project_id]) SELECT ?,?,? WHERE NOT EXISTS (SELECT * FROM "
                                         "[tbl_weekly_date] WHERE [weekly_date_id]=?);"),
                          key, date, of_project, key);
        return key;
    }

    core::Session& m_session;
};

} // namespace kindrel::test
