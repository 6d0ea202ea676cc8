#include "output/custom/custom_fixture.h"

#include "output/custom/custom_run.h"
#include "output/letters/letter_fields.h"
#include "output/page_reader.h"
#include "people/fields.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

constexpr int child = 5;
constexpr int married = 4;

people::LinkRow in_group(int group)
{
    return {group, {}, 0, {}, {}, false};
}

people::FamilyFile at(people::FamilyFile family, int suburb, const QString& phone = {})
{
    family.residential = people::Suburb{suburb, people::SuburbType::residential, {}, {}, {}};
    family.address.phone = phone;
    return family;
}

class CustomReportTest : public CustomTest
{
protected:
    /// Every field that a section of the kind can hold, a line each.
    [[nodiscard]] static QString all_fields(const QStringList& scopes_left_out)
    {
        QString lines;
        for (const auto& field : output::custom_fields()) {
            const auto name = QString::fromLatin1(field.name);
            const auto line = u"line \"%1=\" [%1]\n"_s.arg(name);
            const auto parsed = output::parse_layout(u"report per person\neach person\n"_s + line, {});
            if (parsed.faults.empty() && !scopes_left_out.contains(name))
                lines += line;
        }
        return lines;
    }
};

} // namespace

TEST_F(CustomReportTest, SectionsComeInTheirOrderAndAFamilysPeopleBeneathIt)
{
    list.criteria = u"everybody"_s;
    auto one = family(u"Naismith"_s, {u"Ann"_s});
    one.people = {person(u"Ann"_s, married), person(u"Cid"_s, child), person(u"Ben"_s, married)};
    add({one, family(u"Zuse"_s, {u"Konrad"_s})});

    const auto lines = printed(uR"layout(
title "Who is who"
page header
  line [report_title] ", " [page] " of " [pages]
page footer
  line "of " [church_name]
start
  line [today] " " [filters]
each family
  line [number] ". " [surname] ": " [Primary_&_Spouse_Name]
each person
  line [Name] " (" [role] ")"
end
  line [family_count] " families, " [person_count] " people"
)layout"_s);

    EXPECT_EQ(told(lines), told({u"Who is who, 1 of 1"_s, u"of St Aidan's"_s, u"15/05/2024 everybody"_s,
                                 u"1. Naismith: Ann & Ben"_s, u"Ann (Primary)"_s, u"Ben (Spouse)"_s, u"Cid (Child)"_s,
                                 u"2. Zuse: Konrad"_s, u"Konrad (Primary)"_s, u"2 families, 4 people"_s}));
}

TEST_F(CustomReportTest, AReportPerPersonFollowsTheListWhateverTheFamilies)
{
    add({family(u"Abel"_s, {u"Ann"_s, u"Ben"_s}), family(u"Zuse"_s, {u"Konrad"_s})});
    std::swap(list.members[1], list.members[2]);

    EXPECT_EQ(told(printed(u"each person\nline [surname] \", \" [Name]"_s, u"own.rpy"_s)),
              "Abel, Ann\nZuse, Konrad\nAbel, Ben");
}

TEST_F(CustomReportTest, AFamilysNamesAreThoseOfItsPeopleOnTheListInEveryKindOfReport)
{
    add({family(u"Abel"_s, {u"Ann"_s, u"Ben"_s, u"Cid"_s})});
    list.members.erase(list.members.begin());
    const auto names = u"line [Primary_&_Spouse_Name] \" / \" [Children_Names]"_s;

    EXPECT_EQ(told(printed(u"each family\n"_s + names)), "Ben / Cid");
    EXPECT_EQ(told(printed(u"each person\n"_s + names, u"own.rpy"_s)), "Ben / Cid\nBen / Cid");
    EXPECT_EQ(told(printed(u"group by [names]\neach person\nline [Name]"_s, u"own.rpy"_s)),
              "Ben\nBen\nCid\nCid\nBen\nCid");
}

TEST_F(CustomReportTest, CaptionsOfEmptyFieldsVanishWithThem)
{
    auto one = at(family(u"Abel"_s, {u"Ann"_s}), 1, u"9555"_s);
    add({one, family(u"Zuse"_s, {u"Konrad"_s})});
    struct Case
    {
        QString line;
        QStringList with, without; ///< What the full and the empty family print.
    };
    const std::vector<Case> cases{
        {u"line \"Phone: \" [phone]"_s, {u"Phone: 9555"_s}, {}},
        {u"line always \"Phone: \" [phone]"_s, {u"Phone: 9555"_s}, {u"Phone: "_s}},
        {u"line [surname] \", \" [phone] \" at home\""_s, {u"Abel, 9555 at home"_s}, {u"Zuse"_s}},
        {u"line [phone] \" - \" [surname]"_s, {u"9555 - Abel"_s}, {u"Zuse"_s}},
        {u"line [phone] \"  of \" [surname]"_s, {u"9555  of Abel"_s}, {u"of Zuse"_s}},
        {u"line [surname] { \" (\" [suburb] \")\" } \"!\""_s, {u"Abel (suburb 1)!"_s}, {u"Zuse"_s}},
        {u"line [phone] tab [surname]"_s, {u"9555 | Abel"_s}, {u"Zuse"_s}},
        {u"line [today] \" \" [phone]"_s, {u"15/05/2024 9555"_s}, {}},
        {u"if [phone] line \"rings\"\nunless [phone] line \"silent\""_s, {u"rings"_s}, {u"silent"_s}},
        {u"line \"plain\""_s, {u"plain"_s}, {u"plain"_s}},
    };
    for (const auto& one_case : cases)
        EXPECT_EQ(told(printed(u"each family\n"_s + one_case.line)), told(one_case.with + one_case.without))
            << one_case.line.toStdString();
}

TEST_F(CustomReportTest, ListsAreJoinedAsTheLayoutSays)
{
    add({full_family(false)});
    list.members.resize(1);
    struct Case
    {
        QString field;
        QStringList lines;
    };
    const std::vector<Case> cases{
        {u"[groups]"_s, {u"group 3, group 1"_s}},
        {u"[groups lines]"_s, {u"group 3"_s, u"group 1"_s}},
        {u"[groups joined \" / \"]"_s, {u"group 3 / group 1"_s}},
        {u"[groups \"GROUP 3\"]"_s, {u"group 3"_s}},
        {u"[groups \"group 2\"]"_s, {}},
        {u"[dates]"_s, {u"date_description 1 29/02/XXXX, date_description 3 01/01/2001"_s}},
        {u"[dates \"date_description 3\"]"_s, {u"01/01/2001"_s}},
        {u"[flexi \"flexi 1\"]"_s, {u"Zoëflexi"_s}},
        {u"[active_ministries]"_s, {u"ministry 1"_s}},
        {u"[ministries]"_s, {u"ministry 1, ministry 1 (potential)"_s}},
        {u"[other_contacts \"Aunt\"]"_s, {u"555 2"_s}},
        {u"[events]"_s, {u"06/05/2011 Moved here, 02/01/XXXX An older one"_s}},
        {u"[age]"_s, {u"46"_s}},
        {u"[school_year]"_s, {u"Kinder"_s}},
        {u"[address lines]"_s,
         {u"addressresstreet"_s, u"addressresstreet2"_s, u"suburb 1 addressresstate 3999"_s, u"addressrescountry"_s}},
    };
    for (const auto& one : cases)
        EXPECT_EQ(told(printed(u"each person\nline "_s + one.field, u"own.rpy"_s)), told(one.lines))
            << one.field.toStdString();
}

TEST_F(CustomReportTest, NamesAndTitlesReadAsTheMergeFieldsOfLettersDo)
{
    auto one_title = family(u"Naismith"_s, {u"𝒪li"_s, u"ben"_s, u"Cid"_s, u"Dot"_s, u"Eve"_s});
    one_title.people[0].Title = u"Mrs"_s;
    auto two_titles = one_title;
    two_titles.people[1].Title = u"Mr"_s;
    for (const auto& file : {one_title, two_titles, family(u"Hale"_s, {u"Ann"_s})}) {
        list.members.clear();
        add({file});
        const auto disclosed = people::disclose(file, {});
        const output::LetterFamily to{disclosed, people::household_of(disclosed.people())};
        for (const auto& field : output::letter_fields()) {
            const auto name = QStringView(field.text).toString();
            if (name.contains(u"Name"_s) || name.contains(u"Title"_s)) {
                EXPECT_EQ(told(printed(u"each family\nline "_s + name)), field.value(to).toStdString())
                    << name.toStdString();
            }
        }
    }
}

TEST_F(CustomReportTest, GroupsStandUnderTheirHeadingsInOrderWithTheOthersLast)
{
    add({at(family(u"Zuse"_s, {u"Konrad"_s}), 3), family(u"Ångström"_s, {u"Bo"_s}),
         at(family(u"Abel"_s, {u"Ann"_s}), 1), at(family(u"Naismith"_s, {u"Cid"_s, u"Dot"_s}), 3)});

    EXPECT_EQ(told(printed(u"group by [suburb]\neach family\nline [number] [surname]\nend of group\n"
                           "line [family_count] \"/\" [person_count]\nend\nline [family_count] \" in all\""_s)),
              "suburb 1\n1Abel\n1/1\nsuburb 3\n1Zuse\n2Naismith\n2/3\nOthers\n1Ångström\n1/1\n4 in all");
    EXPECT_EQ(told(printed(u"group by [letter] leave out others\neach family\nline [surname]"_s)),
              "A\nÅngström\nAbel\nN\nNaismith\nZ\nZuse");
    EXPECT_EQ(pages_of(u"group by [suburb] new page leave out others\neach family\nline [surname]"_s).size(), 2u);
}

TEST_F(CustomReportTest, PeopleStandInEachOfTheirGroupsInTheOrderOfTheSetupList)
{
    office.session->execute(u"UPDATE [tbl_group_setup] SET [position]=4-[position];"_s);
    auto one = family(u"Abel"_s, {u"Ann"_s, u"Ben"_s, u"Cid"_s});
    one.people[0].groups = {in_group(1), in_group(3)};
    one.people[1].groups = {in_group(1)};
    add({one});

    EXPECT_EQ(told(printed(u"group by [groups]\neach person\nline [Name]\nend\nline [person_count]"_s, u"own.rpy"_s)),
              "group 3\nAnn\ngroup 1\nAnn\nBen\nOthers\nCid\n3");
    EXPECT_EQ(
        told(printed(u"group by [groups \"group 1\"] leave out others\neach person\nline [Name]"_s, u"own.rpy"_s)),
        "group 1\nAnn\nBen");
}

TEST_F(CustomReportTest, GroupsOfDaysAndNumbersFollowTheCalendarAndNotTheAlphabet)
{
    auto one = family(u"Abel"_s, {u"Ann"_s, u"Ben"_s, u"Cid"_s, u"Dot"_s});
    const core::Date days[]{{2001, 2, 10}, {1999, 12, 20}, {2001, 3, 5}, {core::Date::unknown_year, 7, 1}};
    for (std::size_t place = 0; place < std::size(days); ++place) {
        one.people[place].birthdate = days[place];
        one.people[place].dates = {{1, {}, 0, days[place], {}, false}};
    }
    add({one, family(u"Zuse"_s, {u"Eve"_s})});

    for (const auto& field : {u"[birthdate]"_s, u"[dates \"date_description 1\"]"_s})
        EXPECT_EQ(
            told(printed(u"group by "_s + field + u" leave out others\neach person\nline [Name]"_s, u"own.rpy"_s)),
            "01/07/XXXX\nDot\n20/12/1999\nBen\n10/02/2001\nAnn\n05/03/2001\nCid")
            << field.toStdString();

    auto crowd = family(u"Long"_s, {u"Jo"_s});
    crowd.people.resize(10, crowd.people.front());
    list.members.clear();
    add({crowd, family(u"Short"_s, {u"Al"_s, u"Bo"_s})});
    EXPECT_EQ(told(printed(u"group by [people_in_family]\neach family\nline [surname]"_s)), "2\nShort\n10\nLong");
}

TEST_F(CustomReportTest, RowsStandInColumnsUnderHeadingsThatEachPageRepeats)
{
    std::vector<people::FamilyFile> families;
    for (int number = 0; number < 90; ++number)
        families.push_back(at(family(u"Family%1"_s.arg(number), {u"Ann"_s}), 1, number == 1 ? QString() : u"9555"_s));
    add(families);

    const auto pages = pages_of(u"table rows striped\ncolumn \"Name\"\ncolumn \"Phone\" width 90 right\n"
                                "each family\nrow [surname] | \"Ph \" [phone]"_s);

    ASSERT_GT(pages.size(), 1u);
    for (const auto& page : pages)
        EXPECT_EQ(page.front(), u"Name | Phone"_s);
    EXPECT_EQ(pages.front()[1], u"Family0 | Ph 9555"_s);
    EXPECT_EQ(pages.front()[2], u"Family1"_s);
}

TEST_F(CustomReportTest, NoHiddenWordIsPrintedWhateverTheLayoutAsksFor)
{
    office.rights.set(core::Area::full_financial, false);
    office.rights.set(core::Area::pin_financial_only, false);
    office.rights.set(core::Area::visitation_tab, false);
    const auto hidden = full_family(true);
    add({hidden});

    const auto text = printed(u"group by [suburb]\neach person\n"_s + all_fields({}), u"own.rpy"_s).join(u'\n');

    ASSERT_TRUE(text.contains(u"surname=Żółć-O’Brien"_s)) << text.toStdString();
    QStringList words{u"suburb 1"_s, u"suburb 2"_s, u"3999"_s,         u"3000"_s,
                      u"1977"_s,     u"age="_s,     u"occupation 2"_s, u"A visitor"_s};
    for (const auto& field : people::address_fields()) {
        const auto* words_of = std::get_if<QString people::Address::*>(&field.member);
        if (words_of && std::string_view(field.name) != "audio_note")
            words += hidden.address.**words_of;
    }
    for (const auto& one : hidden.people) {
        words += {one.preferred_name, u"personal_pin="_s + one.personal_pin};
        for (const auto& field : people::detail_fields()) {
            if (const auto* word = std::get_if<QString people::Person::*>(&field.member))
                words += one.**word;
        }
    }
    for (const auto& word : words)
        EXPECT_FALSE(text.contains(word)) << word.toStdString();
}

TEST_F(CustomReportTest, EveryFieldOfAFullFamilyPrintsSomething)
{
    auto full = full_family(false);
    full.people[1].Active = full.people[1].Prospect = full.people[1].archive = true;
    add({full});
    office.session->execute(u"UPDATE [tbl_surname] SET [booked_out_person]='Ed',[booked_out_date]='2020-01-01';"_s);
    list.criteria = u"everybody"_s;

    const auto layout = u"title \"All\"\ngroup by [letter]\neach person\n"_s + all_fields({});
    const auto text = u'\n' + printed(layout, u"own.rpy"_s).join(u'\n');

    for (const auto& field : output::custom_fields()) {
        const auto name = QString::fromLatin1(field.name);
        if (layout.contains(u'[' + name + u']')) {
            EXPECT_TRUE(text.contains(u'\n' + name + u'=')) << field.name << text.toStdString();
        }
    }
}

TEST_F(CustomReportTest, ALayoutAsksForNoMoreThanItPrints)
{
    using people::Part;
    const auto extent = [](const QString& lines) {
        return output::extent_of(output::parse_layout(lines, output::LayoutKind::people).layout);
    };

    EXPECT_EQ(extent(u"each person\nline [surname] [Name]"_s), people::Extent());
    EXPECT_EQ(extent(u"each person\nif [status] line [phone]"_s), people::Extent(Part::status | Part::address));
    EXPECT_EQ(extent(u"table\ncolumn \"\"\neach person\nrow [birthdate]"_s), people::Extent(Part::details));
}

TEST_F(CustomReportTest, AFamilyOfSeventeenAndTextsOfAnyLengthArePrintedWhole)
{
    auto one = family(u"Wolfeschlegelsteinhausenbergerdorff"_s, {u"Ann"_s, u"Ben"_s});
    for (int number = 3; number <= people::most_people; ++number)
        one.people.push_back(person(u"Child%1x"_s.arg(number), child));
    one.events = {{core::Date{2011, 5, 6}, u"word "_s.repeated(50).trimmed()}};
    add({one});
    const auto columns = u"columns 4\ntable grid\ncolumn \"\" width 20\ncolumn \"\"\n"_s;

    const auto text = printed(columns + u"each family\nline heading [surname]\nline [events]\nrow | [names]\n"
                                        "each person\nline [Name]"_s)
                          .join(u' ');

    EXPECT_EQ(QString(text).remove(u' ').count(u"Wolfeschlegelsteinhausenbergerdorff"_s), 1);
    EXPECT_EQ(text.count(u"word"_s), 50);
    for (const auto& member : one.people)
        EXPECT_EQ(text.count(member.Name), 2) << member.Name.toStdString();
}

TEST_F(CustomReportTest, StylesSetFontSizeInkAndTheAlignmentOfTheLinesThatBeginWithThem)
{
    add({family(u"Abel"_s, {u"Ann"_s})});
    options.text_percent = 200;
    const auto custom = lay(u"own.rpt"_s, u"decoration no\ntext 8\nstyle name size 10 bold colour #123abc right\n"
                                          "each family\nline name [surname]\nline [surname]"_s);
    pages::PageSpool spool;
    ASSERT_TRUE(output::run_custom_report(custom, {office, list, options}, progress, spool));

    const auto page = spool.page(1);
    const auto& styled = std::get<pages::TextItem>(page.items.at(0));
    EXPECT_EQ(styled.style.size, 20);
    EXPECT_TRUE(styled.style.bold);
    EXPECT_EQ(styled.style.colour, QRgb(0xff123abc));
    EXPECT_NEAR(styled.at.x() + styled.width, page.size.width() - 42, 0.5);
    EXPECT_EQ(std::get<pages::TextItem>(page.items.at(1)).style.size, 16);
}

TEST_F(CustomReportTest, OneToAPageGivesEachFamilyItsOwnPages)
{
    add({family(u"Abel"_s, {u"Ann"_s}), family(u"Baker"_s, {u"Bo"_s}), family(u"Zuse"_s, {u"Konrad"_s})});

    const auto pages = pages_of(u"one to a page\neach family\nline [surname]\nend\nline \"the end\""_s);

    ASSERT_EQ(pages.size(), 3u);
    EXPECT_EQ(told(pages[2]), "Zuse\nthe end");
    EXPECT_EQ(pages_of(u"one to a page\ngroup by [letter] new page\neach family\nline [surname]"_s).size(), 3u);
}

TEST_F(CustomReportTest, OneToAPageBeginsTheTableAnewOnEachOfThem)
{
    add({at(family(u"Abel"_s, {u"Ann"_s}), 1, u"9555"_s), at(family(u"Zuse"_s, {u"Konrad"_s}), 1, u"9666"_s)});

    const auto pages = pages_of(u"one to a page\ntable\ncolumn \"Phone\"\neach family\nline [surname]\nrow [phone]"_s);

    ASSERT_EQ(pages.size(), 2u);
    EXPECT_EQ(told(pages[0]), "Abel\nPhone\n9555");
    EXPECT_EQ(told(pages[1]), "Zuse\nPhone\n9666");
}

TEST_F(CustomReportTest, PortraitsAreFramedWhenMissingAndTheNarrowestBarcodesCanBeScanned)
{
    add({family(u"Abel"_s, {u"Ann"_s})});
    const int id = 9876543;
    office.session->execute(u"UPDATE [tbl_people] SET [person_id]=?;"_s, id);
    list.members.front().person_id = id;
    const auto custom = lay(u"own.rpy"_s, u"decoration no\neach person\nportrait 80 by 100 right\nbarcode 85 by 30"_s);
    pages::PageSpool spool;
    ASSERT_TRUE(output::run_custom_report(custom, {office, list, options}, progress, spool));

    const auto page = spool.page(1);
    const auto& portrait = std::get<pages::PictureItem>(page.items.at(0));
    EXPECT_EQ(portrait.where.size(), QSizeF(80, 100));
    EXPECT_NEAR(portrait.where.right(), page.size.width() - 42, 0.01);
    EXPECT_EQ(scanned(page), QStringList(u"9876543$"_s));
}

TEST_F(CustomReportTest, OwnHeadersAndFootersStandBesideThoseOfTheChurch)
{
    add({family(u"Abel"_s, {u"Ann"_s})});
    const auto custom =
        lay(u"own.rpt"_s, u"title \"Phones\"\npage header\nline \"above\"\npage footer\nline \"below\"\n"
                          "each family\nline [surname]"_s);
    pages::PageSpool spool;
    ASSERT_TRUE(output::run_custom_report(custom, {office, list, options}, progress, spool));

    const auto lines = read_back(spool).front();
    EXPECT_EQ(lines.front().section(u" | "_s, 0, 0), u"Phones"_s);
    EXPECT_TRUE(lines.contains(u"above"_s) && lines.contains(u"below"_s)) << told(lines);
    EXPECT_TRUE(lines.contains(u"Phones | Page: 1 of 1"_s)) << told(lines);
}

TEST_F(CustomReportTest, ALayoutWithFaultsIsRefusedWithAllOfThemInOneBox)
{
    add({family(u"Abel"_s, {u"Ann"_s})});
    const auto custom = lay(u"own.rpt"_s, u"each family\nline [surnam]\nlin"_s);
    dialogue.expect_box(u"The layout \"own.rpt\" cannot be used until this is put right:"_s,
                        u"Line 2: there is no field \"surnam\"; did you mean \"surname\"?\n"
                        "Line 3: no line begins with \"lin\"; did you mean \"line\"?"_s);
    pages::PageSpool spool;

    EXPECT_FALSE(output::run_custom_report(custom, {office, list, options}, progress, spool));
    EXPECT_FALSE(spool.finished());
}

TEST_F(CustomReportTest, NobodyARightMissingAndAReceiptAreRefusedAndCancellingStops)
{
    const auto custom = lay(u"own.rpt"_s, u"group by [letter]\ntable\ncolumn \"\"\neach family\nrow [surname]"_s);
    const auto run_of = [&](const output::CustomReport& own) {
        pages::PageSpool spool;
        return output::run_custom_report(own, {office, list, options}, progress, spool) || spool.finished();
    };
    dialogue.expect_box(u"No people found for creating a report"_s);
    EXPECT_FALSE(run_of(custom));

    add({family(u"Abel"_s, {u"Ann"_s})});
    for (const int step : {1, 2}) {
        progress.taken = 0;
        progress.cancel_at = step;
        EXPECT_FALSE(run_of(custom)) << step;
    }
    progress.cancel_at = 0;
    dialogue.expect_box(u"\"thanks.rpt\" is a receipt. Receipts are made from what people gave."_s);
    EXPECT_FALSE(run_of(lay(u"thanks.rpt"_s, u"receipt\neach giver\nline [total]"_s)));
    office.rights.set(core::Area::report_outputs, false);
    dialogue.expect_box(u"Your password does not give access to \"Report Outputs\""_s);
    EXPECT_FALSE(run_of(custom));
}

TEST_F(CustomReportTest, WhateverHasNoFaultsCanBeRun)
{
    add({full_family(false), family(u"Abel"_s, {u"Ann"_s, u"Ben"_s})});
    const auto layout = uR"layout(columns 2
decoration no
table grid
column "" width 60
column "Phone"
group by [groups] new page
page header
  line [page] " - " [report_title]
each person
  line heading [Name] { " (" [suburb] ")" } tab small [groups lines]
  row [phone] | [events lines] tab "x"
  portrait 60 by 60
end of group
  row [person_count]
)layout"_s;
    std::mt19937 chance(4);
    int run_through = 0;
    for (int round = 0; round < 2000; ++round) {
        const auto text = damaged(layout, chance);
        if (!output::parse_layout(text, output::LayoutKind::people).faults.empty() || text.contains(u"receipt"))
            continue;
        pages::PageSpool spool;
        ++run_through;
        EXPECT_TRUE(output::run_custom_report(lay(u"own.rpy"_s, text), {office, list, options}, progress, spool))
            << text.toStdString();
    }
    EXPECT_GT(run_through, 20);
}

TEST_F(CustomReportTest, TheListHoldsTheChurchsOwnReportsAndThePlugInsByTitle)
{
    lay(u"b.RPT"_s, u"title \"zebra\"\neach family\nline [surname]"_s);
    lay(u"untitled.rpy"_s, u"\xffff"_s);
    lay(u"thanks.rct"_s, u"title \"Thanks\"\neach giver\nline [total]"_s);
    lay(u"letter.txt"_s, u"title \"no\""_s);
    office.plugins.reports = {{u"c.rpt"_s, u"Årsrapport"_s}, {u"part.sub"_s, u"A part"_s}};

    QStringList titles;
    for (const auto& own : output::custom_reports(office))
        titles += own.title;

    EXPECT_EQ(told(titles), "Årsrapport\nuntitled\nzebra");
    ASSERT_EQ(output::custom_receipts(office).size(), 1u);
    EXPECT_EQ(output::custom_receipts(office).front().title, u"Thanks"_s);
}

} // namespace kindrel::test
