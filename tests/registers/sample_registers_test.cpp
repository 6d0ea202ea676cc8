#include "core/references.h"
#include "register_fixture.h"
#include "sample/church.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using registers::Kind;
using registers::WeeklyRegister;

TEST(SampleRegisters, HoldTwoYearsOfSundaysAndPointNowhereElse)
{
    TestChurch church(core::EngineKind::sqlite);
    sample::fill_church(church.session(), {.families = 20, .seed = 3, .today = {2024, 5, 15}}, {}, {});
    SetupOffice desk(church);
    WeeklyRegister weekly(desk.office);
    ASSERT_TRUE(weekly.enter());
    EXPECT_EQ(weekly.dates().size(), 104u);
    EXPECT_EQ(weekly.dates().front().date, (core::Date{2024, 5, 12}));
    EXPECT_EQ(weekly.date_note({2024, 5, 13}), u"13/05/2024 is a Monday, but most dates of this project are Sundays.");
    ASSERT_TRUE(weekly.open(weekly.dates().front().key));
    EXPECT_GT(weekly.total(registers::FigureKind::attendance), registers::whole(100));
    EXPECT_GT(weekly.total(registers::FigureKind::money), registers::whole(1000));
    EXPECT_TRUE(weekly.leave());

    const auto count = [&](const QString& of) {
        return number_of(church.session(), u"SELECT COUNT(*) FROM "_s + of);
    };
    EXPECT_EQ(count(u"[tbl_roll_project] p JOIN [tbl_roll_setup] s ON s.[roll_project_id]=p.[roll_project_id] WHERE "
                    "[service2] IS NOT NULL"_s),
              2);
    EXPECT_EQ(count(u"[tbl_finance_project]"_s), 1);
    EXPECT_EQ(count(u"[tbl_weekly_memo]"_s), 8);
    for (const auto& home : core::homes()) {
        const auto table = QString::fromLatin1(home.table);
        if (table.startsWith(u"tbl_roll"_s) || table.startsWith(u"tbl_weekly"_s) ||
            table.startsWith(u"tbl_finance"_s)) {
            EXPECT_EQ(count(u"[%1] WHERE [%2] > (SELECT MAX([id_found]) FROM [%3])"_s.arg(
                          table, QString::fromLatin1(home.field), core::counter_table(home.entity).toString())),
                      0)
                << home.table;
        }
    }
    EXPECT_EQ(count(u"[tbl_weekly_amount] WHERE [group_id] NOT IN (SELECT [group_id] FROM [tbl_weekly_group])"_s), 0);
}

} // namespace kindrel::test
