#include "output/output_fixture.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using output::HeadParts;

namespace {

class RunOptionsTest : public ReportTest
{
protected:
    RunOptionsTest() { list.criteria = u"Active Families"_s; }
    [[nodiscard]] double size_of(const QString& text)
    {
        pages::PageSpool spool;
        EXPECT_TRUE(run(spool));
        for (const auto& item : spool.page(1).items) {
            const auto* found = std::get_if<pages::TextItem>(&item);
            if (found && found->text.contains(text))
                return found->style.size;
        }
        ADD_FAILURE() << text.toStdString();
        return 0;
    }
};

} // namespace

TEST_F(RunOptionsTest, TheRunsOwnTitleAndHeadGoBeforeThoseOfReportAndChurch)
{
    add({family(u"Abel"_s, {u"Niels"_s})});
    list.criteria = u"Active Families"_s;
    office.settings.title_date = true;
    EXPECT_TRUE(texts().contains(u"Report Date - 15/05/2024"_s));

    options.title = u"Camp in May"_s;
    options.head = HeadParts{.filters = true, .church = true};

    const auto now = texts();
    EXPECT_TRUE(now.contains(u"Camp in May"_s));
    EXPECT_FALSE(now.contains(u"Church Directory"_s));
    EXPECT_TRUE(now.contains(u"Filters in Use = Active Families"_s));
    EXPECT_TRUE(now.contains(u"St Aidan's"_s));
    EXPECT_FALSE(now.contains(u"Report Date - 15/05/2024"_s));
}

TEST_F(RunOptionsTest, TextGrowsAndShrinksWithItsPercentage)
{
    add({family(u"Abel"_s, {u"Niels"_s})});
    const double usual = size_of(u"Niels"_s);
    options.text_percent = 120;
    EXPECT_NEAR(size_of(u"Niels"_s), usual * 1.2, 0.01);
}

TEST_F(RunOptionsTest, WithheldDetailsAreLeftOutLikeHiddenOnes)
{
    const auto open = full_family(false);
    add({open});
    EXPECT_TRUE(pdf_text().contains(open.address.res_street));
    EXPECT_TRUE(pdf_text().contains(open.address.phone));

    options.withheld.set(static_cast<std::size_t>(people::Detail::addresses));
    EXPECT_FALSE(pdf_text().contains(open.address.res_street));
    EXPECT_TRUE(pdf_text().contains(open.address.phone));
    options.withheld.set(static_cast<std::size_t>(people::Detail::phones));
    EXPECT_FALSE(pdf_text().contains(open.address.phone));
}

} // namespace kindrel::test
