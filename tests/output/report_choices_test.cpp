#include "output/output_fixture.h"

#include "core/files.h"
#include "output/report_choices.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

class ReportChoicesTest : public ReportTest
{
protected:
    ReportChoicesTest() { add({full_family(false)}); }

    void lay(core::Folder folder, const QString& name, const QByteArray& content)
    {
        core::make_folder(office.paths.folder(folder));
        core::write_file(office.paths.folder(folder) + name, content);
    }
    [[nodiscard]] output::ReportChoice choice(const QString& leaf)
    {
        for (auto& each : output::report_choices(office)) {
            if (each.leaf == leaf)
                return each;
        }
        throw std::runtime_error("There is no " + leaf.toStdString());
    }
    [[nodiscard]] std::optional<pages::Page> first_page(const QString& leaf)
    {
        return output::first_page(choice(leaf), {office, list, options});
    }
};

const QByteArray sound_layout = "report per person\ntitle \"Who\"\neach person\nline [surname]\n";
const QByteArray faulty_layout = "report per person\ntitle \"Broken\"\neach person\nline [no such field]\n";

} // namespace

TEST_F(ReportChoicesTest, TheChurchsOwnLayoutsAndLettersFollowTheCatalogueUnderTheirTitles)
{
    lay(core::Folder::custom, u"who.rpy"_s, sound_layout);
    lay(core::Folder::letter, u"Welcome.ltr"_s, "{\\rtf1 Dear [Primary_Name]}");
    office.plugins.letters = {{u"thanks.ltr"_s, u"Thanks"_s}};

    const auto choices = output::report_choices(office);

    const auto own = std::span(choices).subspan(output::catalogue().size());
    ASSERT_EQ(own.size(), 3u);
    EXPECT_EQ(own[0].family + u'|' + own[0].leaf, u"Custom Reports|Who"_s);
    EXPECT_EQ(own[0].description, u"Run a custom report made within Kindrel"_s);
    EXPECT_EQ(own[1].family + u'|' + own[1].leaf, u"Custom Letters|Welcome"_s);
    EXPECT_EQ(own[1].description, u"Run a report using a custom letter made within Kindrel"_s);
    EXPECT_EQ(own[2].leaf, u"Thanks (Plugin Letters)"_s);
    EXPECT_EQ(own[2].description, u"Run a plugin custom letter"_s);
}

TEST_F(ReportChoicesTest, APlugInIsMarkedAsOneInTheTreeAndNotOnItsPages)
{
    lay(core::Folder::plugin_reports, u"who.rpy"_s, "report per person\neach person\nline [report_title]\n");
    office.plugins.reports = {{u"who.rpy"_s, u"Who is who"_s}};

    const auto page = first_page(u"Who is who (Plugin Reports)"_s);

    ASSERT_TRUE(page);
    const auto texts = pages::texts_of(*page, 1);
    EXPECT_TRUE(texts.contains(u"Who is who"_s)) << texts.join(u'|').toStdString();
    EXPECT_FALSE(texts.join(u'|').contains(u"Plugin"_s)) << texts.join(u'|').toStdString();
}

TEST_F(ReportChoicesTest, EveryReportAndOwnLayoutHasAPictureOfItsFirstPage)
{
    lay(core::Folder::custom, u"who.rpy"_s, sound_layout);
    lay(core::Folder::letter, u"Welcome.ltr"_s, "{\\rtf1 Dear [Primary_Name]}");

    for (const auto& each : output::report_choices(office)) {
        const auto page = output::first_page(each, {office, list, options});
        ASSERT_TRUE(page) << each.leaf.toStdString();
        EXPECT_EQ(page->number, 1);
        EXPECT_FALSE(page->items.empty()) << each.leaf.toStdString();
    }
}

TEST_F(ReportChoicesTest, WhatWouldBeRefusedHasNoPictureAndShowsNoBox)
{
    lay(core::Folder::custom, u"broken.rpy"_s, faulty_layout);
    EXPECT_FALSE(first_page(u"Broken"_s));
    lay(core::Folder::custom, u"who.rpy"_s, sound_layout);
    const auto who = choice(u"Who"_s);
    EXPECT_TRUE(output::first_page(who, {office, list, options}));
    lay(core::Folder::custom, u"who.rpy"_s, faulty_layout); // It broke while the tree was open.
    EXPECT_FALSE(output::first_page(who, {office, list, options}));
    lay(core::Folder::custom, u"who.rpy"_s, sound_layout);

    office.rights.set(core::Area::visitation_tab, false);
    EXPECT_FALSE(first_page(u"Visitation Report"_s));
    EXPECT_TRUE(first_page(u"Status Report"_s));

    office.rights.set(core::Area::report_outputs, false);
    EXPECT_FALSE(first_page(u"Directory 1"_s));
    EXPECT_FALSE(first_page(u"Who"_s));
    list.members.clear();
    office.rights = core::Rights::all();
    EXPECT_FALSE(first_page(u"Directory 1"_s));
}

TEST_F(ReportChoicesTest, NoPictureShowsABoxWhereEverybodyOnTheListIsGone)
{
    for (const auto& table : {u"tbl_people"_s, u"tbl_surname"_s})
        office.session->execute(u"DELETE FROM [%1];"_s.arg(table));

    for (const auto& each : output::report_choices(office))
        static_cast<void>(output::first_page(each, {office, list, options}));
    for (const auto& leaf : {u"Mailing Labels"_s, u"Name Tag Labels"_s})
        EXPECT_FALSE(first_page(leaf));
}

TEST_F(ReportChoicesTest, APictureEndsTheRunWithItsPage)
{
    std::vector<people::FamilyFile> families(200, family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s}));
    add(families);
    int pages = 0;
    auto directory = choice(u"Directory 1"_s);
    directory.draw = [&](const output::ReportInput& input, core::Progress& run, pages::PageSpool& spool) {
        const bool done = directory.run(input, run, spool);
        pages = spool.page_count();
        return done;
    };

    EXPECT_TRUE(output::first_page(directory, {office, list, options}));
    EXPECT_EQ(pages, 1);
}

} // namespace kindrel::test
