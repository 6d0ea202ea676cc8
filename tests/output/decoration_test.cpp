#include "output/output_fixture.h"

#include <QImage>
#include <QRegularExpression>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Settings;

namespace {

constexpr auto vision = u"Love God, love people";

class DecorationTest : public ReportTest
{
protected:
    DecorationTest()
    {
        add({family(u"Abel"_s, {u"Niels"_s})});
        list.criteria = u"Active Families"_s;
        office.settings.vision = QStringView(vision).toString();
        office.settings.footer_vision = u"First line"_s;
        office.settings.footer_vision_line2 = u"Second line"_s;
    }
    /// All items of one kind on the only page.
    template <class Kind>
    [[nodiscard]] std::vector<Kind> items()
    {
        pages::PageSpool spool;
        EXPECT_TRUE(run(spool));
        std::vector<Kind> found;
        for (const auto& item : spool.page(1).items) {
            if (const auto* one = std::get_if<Kind>(&item))
                found.push_back(*one);
        }
        return found;
    }
    [[nodiscard]] pages::TextItem item_of(const QString& text)
    {
        for (const auto& item : items<pages::TextItem>()) {
            if (item.text == text)
                return item;
        }
        ADD_FAILURE() << text.toStdString();
        return {};
    }
};

} // namespace

TEST_F(DecorationTest, EachPartIsPrintedOnlyWhereItIsSwitchedOn)
{
    struct Part
    {
        bool Settings::*on;
        QStringList texts;
    };
    const std::vector<Part> parts{
        {&Settings::title_church, {u"St Aidan's"_s}},
        {&Settings::title_date, {u"Report Date - 15/05/2024"_s}},
        {&Settings::title_filters, {u"Filters in Use = Active Families"_s}},
        {&Settings::Include_vision_reports, {QStringView(vision).toString()}},
        {&Settings::include_vision_footer, {u"First line"_s, u"Second line"_s}},
    };
    for (const auto& set : parts) {
        for (const auto& part : parts)
            office.settings.*part.on = part.on == set.on;
        const auto all = texts();
        EXPECT_TRUE(all.contains(u"Church Directory"_s));
        for (const auto& part : parts) {
            for (const auto& text : part.texts)
                EXPECT_EQ(all.contains(text), part.on == set.on) << text.toStdString();
        }
    }
}

TEST_F(DecorationTest, ChurchesThatWriteTheMonthFirstDateTheirReportsSo)
{
    office.settings.title_date = true;
    office.settings.American_date = true;

    EXPECT_TRUE(texts().contains(u"Report Date - 05/15/2024"_s));
}

TEST_F(DecorationTest, AListWithoutCriteriaHasNoFilterLine)
{
    office.settings.title_filters = true;
    list.criteria.clear();

    EXPECT_FALSE(texts().join(u'\n').contains(u"Filters in Use"_s));
}

TEST_F(DecorationTest, ManyFiltersAreToldInThreeLinesAndAnEllipsis)
{
    office.settings.title_filters = true;
    QStringList groups;
    for (int number = 1; number <= 300; ++number)
        groups += u"in group %1"_s.arg(number);
    list.criteria = groups.join(u" or "_s);

    const auto all = texts();

    const auto first = all.indexOf(QRegularExpression(u"^Filters in Use = in group 1 .*"_s));
    ASSERT_GE(first, 0);
    EXPECT_TRUE(all[first + 2].endsWith(u" \u2026"_s)) << all[first + 2].toStdString();
    EXPECT_FALSE(all[first + 3].contains(u"in group"_s)) << all[first + 3].toStdString();
}

TEST_F(DecorationTest, TheVisionStatementHasTheChurchsFontSizeAndFormat)
{
    auto& settings = office.settings;
    settings.Include_vision_reports = true;
    settings.vision_font = u"Liberation Serif"_s;
    settings.vision_font_size = 14;
    const auto text = QStringView(vision).toString();
    for (int format = 0; format <= 3; ++format) {
        settings.vision_format = format;
        const auto style = item_of(text).style;
        EXPECT_EQ(style.family, u"Liberation Serif"_s);
        EXPECT_EQ(style.size, 14);
        EXPECT_EQ(style.bold, format == 1 || format == 3) << format;
        EXPECT_EQ(style.italic, format == 2 || format == 3) << format;
    }
}

TEST_F(DecorationTest, TheVisionStatementStandsWhereTheChurchAlignsIt)
{
    office.settings.Include_vision_reports = true;
    std::array<qreal, 3> left{};
    for (int alignment = 0; alignment < 3; ++alignment) {
        office.settings.vision_alignment = alignment;
        left[std::size_t(alignment)] = item_of(QStringView(vision).toString()).at.x();
    }
    EXPECT_LT(left[0], left[1]);
    EXPECT_NEAR(left[1] - left[0], left[2] - left[1], 0.5);
}

TEST_F(DecorationTest, LinesAreDrawnAsTheChurchAsksForThem)
{
    office.settings.Include_vision_reports = true;
    const auto lines = [&] {
        return items<pages::LineItem>();
    };
    const auto bare = lines();

    office.settings.vision_line = true;
    const auto thin = lines();
    office.settings.vision_thick_line = true;
    const auto thick = lines();
    office.settings.footer_line = true;
    const auto with_footer = lines();

    ASSERT_EQ(thin.size(), bare.size() + 1);
    ASSERT_EQ(thick.size(), thin.size());
    EXPECT_GT(thick[bare.size()].thickness, thin[bare.size()].thickness);
    EXPECT_EQ(with_footer.size(), thick.size() + 1);
}

TEST_F(DecorationTest, TheLogoIsPrintedWhereItIsSwitchedOn)
{
    office.logo = church.folder() + u"/logo.png"_s;
    QImage picture(200, 100, QImage::Format_RGB32);
    picture.fill(Qt::darkGreen);
    ASSERT_TRUE(picture.save(office.logo));

    EXPECT_TRUE(items<pages::PictureItem>().empty());
    office.settings.title_logo = true;
    const auto logos = items<pages::PictureItem>();
    ASSERT_EQ(logos.size(), 1u);
    EXPECT_NEAR(logos[0].where.width(), 2 * logos[0].where.height(), 0.01);
    office.logo = church.folder() + u"/gone.png"_s;
    EXPECT_TRUE(items<pages::PictureItem>().empty());
}

TEST_F(DecorationTest, EveryPageTellsItsNumberAndTheTotal)
{
    add(std::vector(80, family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s, u"Cid"_s})));

    const auto pages = this->pages();

    ASSERT_GT(pages.size(), 1u);
    for (std::size_t i = 0; i < pages.size(); ++i)
        EXPECT_TRUE(pages[i].contains(u"Page: %1 of %2"_s.arg(i + 1).arg(pages.size()))) << i;
}

} // namespace kindrel::test
