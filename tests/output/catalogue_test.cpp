#include "output/output_fixture.h"

#include <QSet>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

class RunReportTest : public ReportTest
{
};

} // namespace

TEST(CatalogueTest, EveryReportIsFoundByItsKeyAndByItsName)
{
    QSet<QString> names;
    for (const auto& report : output::catalogue()) {
        for (const auto& name : {QString::fromUtf8(report.key), QString::fromUtf8(report.leaf)}) {
            EXPECT_EQ(output::find_report(name.toUpper()), &report) << name.toStdString();
            names += name.toLower();
        }
    }
    EXPECT_EQ(names.size(), qsizetype(2 * output::catalogue().size())) << "two reports share a key or a name";
    EXPECT_EQ(output::find_report(u"Directory"), nullptr);
}

TEST_F(RunReportTest, AnEmptyListIsToldAndNothingIsWritten)
{
    dialogue.expect_box(u"No people found for creating a report"_s);
    pages::PageSpool spool;

    EXPECT_FALSE(run(spool));
    EXPECT_EQ(spool.page_count(), 0);
}

TEST_F(RunReportTest, WithoutTheRightNothingIsWritten)
{
    add({full_family(false)});
    office.rights.set(core::Area::report_outputs, false);
    dialogue.expect_box(u"Your password does not give access to \"Report Outputs\""_s);
    pages::PageSpool spool;

    EXPECT_FALSE(run(spool));
    EXPECT_EQ(spool.page_count(), 0);
}

TEST_F(RunReportTest, ACancelledRunLeavesTheSpoolOpen)
{
    add({full_family(false)});
    progress.cancel_at = 1;
    pages::PageSpool spool;

    EXPECT_FALSE(run(spool));
    EXPECT_FALSE(spool.finished());
    EXPECT_EQ(progress.question, u"Are you sure that you wish to cancel this report?"_s);
    EXPECT_EQ(progress.ends, 1);
}

TEST_F(RunReportTest, ACompletedRunClosesTheSpool)
{
    add({full_family(false)});
    pages::PageSpool spool;

    EXPECT_TRUE(run(spool));
    EXPECT_TRUE(spool.finished());
    EXPECT_EQ(spool.page_count(), 1);
    EXPECT_EQ(progress.ends, 1);
}

} // namespace kindrel::test
