#include "output/output_fixture.h"

#include <map>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

constexpr int married = 4;
constexpr int child = 5;
constexpr int single = 1;

/// What a report says of the people of full_family(), or when they hide it all.
struct Kind
{
    const char* key;
    QString headings;
    QString lines;
    QString none;
};

const QString people = u"Zoë, Stanisław, Kid"_s;

const std::vector<Kind> kinds{
    {"k70", u"Family | Name | Birth Date"_s, u"Zoë | 17/07/1977 | Stanisław | 17/07/1977 | Kid | 17/07/1977"_s,
     u"There are no birth dates among these people"_s},
    {"k71", u"Family | Name | Occupations"_s, u"Zoë | occupation 2 | Stanisław | occupation 2 | Kid | occupation 2"_s,
     u"There are no occupations among these people"_s},
    {"k72", u"Family | Name | Status"_s,
     u"Zoë | status 2, status 1 | Stanisław | status 2, status 1 | Kid | status 2, status 1"_s,
     u"There are no statuses among these people"_s},
    {"k73", u"Family | Name | Groups"_s,
     u"Zoë | group 3, group 1 | Stanisław | group 3, group 1 | Kid | group 3, group 1"_s,
     u"There are no groups among these people"_s},
    {"k74", u"Family | Name | Active Ministries | Potential Ministries"_s,
     u"Zoë | ministry 1 | ministry 1 | Stanisław | ministry 1 | ministry 1 | Kid | ministry 1 | ministry 1"_s,
     u"There are no ministries among these people"_s},
    {"k75", u"Family | Name | Description | Date | Tagged"_s,
     u"Zoë | date_description 1 | 29/02/XXXX | date_description 3 | 01/01/2001 | "
     "Stanisław | date_description 1 | 29/02/XXXX | date_description 3 | 01/01/2001 | "
     "Kid | date_description 1 | 29/02/XXXX | date_description 3 | 01/01/2001"_s,
     u"There are no individual dates among these people"_s},
    {"k76", u"Family | Name | Flexi Field | Value | Tagged"_s,
     u"Zoë | flexi 1 | Zoëflexi | Yes | Stanisław | flexi 1 | Stanisławflexi | Yes | Kid | flexi 1 | Kidflexi | Yes"_s,
     u"There are no flexi fields among these people"_s},
    {"k77", u"Family | People | Contact | Phone"_s, people + u" | Neighbour | 555 1 | Aunt | 555 2"_s,
     u"There are no other contacts among these families"_s},
    {"k78", u"Family | People | Family Groups"_s, people + u" | family_group 2, family_group 1"_s,
     u"There are no family groups among these families"_s},
    {"k79", u"Family | People | Date | Event"_s, people + u" | 06/05/2011 | Moved here | 02/01/XXXX | An older one"_s,
     u"There are no events among these families"_s},
    {"k80", u"Family | People | Description | Date | Tagged"_s, people + u" | date_description 2 | 08/08/1988 | Yes"_s,
     u"There are no family dates among these families"_s},
    {"k81", u"Family | People | Date | Visitor | Comments"_s,
     people + u" | 03/02/2020 | A visitor | All well. | Come again."_s, u"There are no visits among these families"_s},
    {"k82", u"Family | Name | Address | Kind"_s,
     u"addressfamilyemail | Family Email | (Home) | Zoë | ZoëPersonalemail | Email | Zoëbusinessemail | Business Email | "
     "Stanisław | StanisławPersonalemail | Email | Stanisławbusinessemail | Business Email | "
     "Kid | KidPersonalemail | Email | Kidbusinessemail | Business Email"_s,
     u"There are no e-mail addresses among these people"_s},
    {"k84", u"Family | Name | Preferred Name"_s,
     u"Zoë | Zoëpreferred | Stanisław | Stanisławpreferred | Kid | Kidpreferred"_s,
     u"There are no preferred names among these people"_s},
    {"k85", u"Family | Name | School Year"_s, u"Zoë | Kinder | Stanisław | Kinder | Kid | Kinder"_s,
     u"There are no school years among these people"_s},
};

class FamilyDataTest : public ReportTest
{
protected:
    /// The texts below the head of the page, on one line; what is broken after a comma is put together again.
    [[nodiscard]] std::string lines(const char* key)
    {
        office.settings.title_church = office.settings.title_date = office.settings.title_filters = false;
        report = *output::find_report(QString::fromLatin1(key));
        const auto all = texts();
        EXPECT_EQ(all.value(2), u"Page: 1 of 1"_s) << key;
        return all.sliced(3).join(u" | "_s).replace(u", | "_s, u", "_s).toStdString();
    }
    void expect_none(const QStringList& keys)
    {
        for (const auto& kind : kinds) {
            if (keys.contains(QLatin1StringView(kind.key))) {
                EXPECT_EQ(lines(kind.key), kind.none.toStdString()) << kind.key;
            }
        }
    }
};

} // namespace

TEST_F(FamilyDataTest, EachReportListsItsOneKindOfDataAndLeavesOutWhoHasNone)
{
    auto full = full_family(false);
    full.people.push_back(person(u"Xi"_s, child));
    full.address.family_email_description = u"Home"_s;
    add({family(u"Abel"_s, {u"Niels"_s}), full});
    for (const auto& kind : kinds) {
        auto expected = kind.headings + u" | Żółć-O’Brien | "_s + kind.lines;
        expected.replace(people, people + u", Xi"_s);
        EXPECT_EQ(lines(kind.key), expected.toStdString()) << kind.key;
    }
}

TEST_F(FamilyDataTest, WhenNobodyHasAnyThePageSaysSo)
{
    add({family(u"Abel"_s, {u"Niels"_s})});

    for (const auto& kind : kinds)
        EXPECT_EQ(lines(kind.key), kind.none.toStdString()) << kind.key;
}

TEST_F(FamilyDataTest, WhatIsHiddenCountsAsNotThere)
{
    office.settings.use_preferred_names = true;
    add({full_family(true)});

    expect_none({u"k70"_s, u"k71"_s, u"k82"_s, u"k84"_s});
}

TEST_F(FamilyDataTest, BirthDatesNeedTheirRightAndCanBeWithheld)
{
    add({full_family(false)});
    options.withheld.set(static_cast<std::size_t>(people::Detail::birth_dates));
    expect_none({u"k70"_s});
    options.withheld.reset();
    office.rights.set(core::Area::birth_dates, false);
    dialogue.expect_box(u"Your password does not give access to \"Birth Dates Access\""_s);
    report = *output::find_report(u"k70");
    pages::PageSpool spool;
    EXPECT_FALSE(run(spool));
}

TEST_F(FamilyDataTest, WhatAPersonWithoutANameHasIsNotPutDownToTheOneAbove)
{
    auto one = family(u"Abel"_s, {u"Niels"_s, u"Ida"_s});
    for (auto& person : one.people)
        person.school_year = person.Name == u"Ida" ? 4 : 3;
    one.people.back().Name.clear();
    add({one});

    report = *output::find_report(u"k85");
    pages::PageSpool spool;
    ASSERT_TRUE(run(spool));
    std::map<QString, qreal> heights;
    for (const auto& item : spool.page(1).items) {
        if (const auto* text = std::get_if<pages::TextItem>(&item))
            heights[text->text] = text->at.y();
    }
    EXPECT_EQ(heights[u"Niels"_s], heights[u"3"_s]);
    EXPECT_GT(heights[u"4"_s], heights[u"3"_s] + 12) << "a row of its own";
}

TEST_F(FamilyDataTest, APreferredNameStandsBesideTheGivenOneEvenWherePeopleAreListedByIt)
{
    office.settings.use_preferred_names = true;
    auto one = family(u"Abel"_s, {u"Niels"_s});
    one.people.front().preferred_name = u"Nick"_s;
    one.people.front().school_year = 3;
    add({one});

    EXPECT_EQ(lines("k84"), "Family | Name | Preferred Name | Abel | Niels | Nick");
    EXPECT_EQ(lines("k85"), "Family | Name | School Year | Abel | Nick | 3");
}

TEST_F(FamilyDataTest, FilesTellWhenTheyWereCreatedAndLastEdited)
{
    add({family(u"Abel"_s, {u"Niels"_s}), family(u"Zuse"_s, {u"Konrad"_s, u"Gisela"_s})});
    office.session->execute(u"UPDATE [tbl_surname] SET [created]='1999-12-31' WHERE [surname]='Abel';"_s);
    office.session->execute(u"UPDATE [tbl_surname] SET [created]=NULL WHERE [surname]='Zuse';"_s);

    EXPECT_EQ(lines("k83"), "Family | People | Created | Last Edited | Abel | Niels | 31/12/1999 | 15/05/2024 | "
                            "Zuse | Konrad, Gisela | 15/05/2024");
}

TEST_F(FamilyDataTest, FamiliesKeepTheListsOrderAndAdultsComeBeforeChildren)
{
    auto naismith = family(u"Naismith"_s, {u"Ann"_s});
    naismith.people = {person(u"Ann"_s, married), person(u"Cid"_s, child), person(u"Edna"_s, single),
                       person(u"Ben"_s, married), person(u"Away"_s, child)};
    for (auto& one : naismith.people)
        one.school_year = 1;
    auto abel = family(u"Abel"_s, {u"Niels"_s});
    abel.people.front().school_year = 2;
    add({naismith, abel});
    list.members.erase(list.members.begin() + 4);
    std::swap(list.members[0], list.members[4]);

    EXPECT_EQ(lines("k85"), "Family | Name | School Year | Abel | Niels | 2 | "
                            "Naismith | Ann | 1 | Ben | 1 | Edna | 1 | Cid | 1");
}

TEST_F(FamilyDataTest, VisitsNeedTheRightToTheirTab)
{
    add({full_family(false)});
    report = *output::find_report(u"k81");
    office.rights.set(core::Area::visitation_tab, false);
    dialogue.expect_box(u"Your password does not give access to \"Visitation Tab on family file\""_s);
    pages::PageSpool spool;

    EXPECT_FALSE(run(spool));
    EXPECT_FALSE(spool.finished());
}

TEST_F(FamilyDataTest, AFamilyStaysTogetherAndTheHeadingsStandOnEveryPage)
{
    std::vector<people::FamilyFile> families;
    for (int number = 0; number < 60; ++number) {
        auto one = family(u"Family%1"_s.arg(1000 + number), {u"Ann"_s, u"Ben"_s, u"Cid"_s});
        for (auto& person : one.people) {
            person.Name += QString::number(1000 + number);
            person.school_year = 7;
        }
        families.push_back(one);
    }
    add(families);
    report = *output::find_report(u"k85");

    const auto pages = this->pages();

    ASSERT_GT(pages.size(), 2u);
    for (const auto& texts : pages) {
        EXPECT_EQ(texts.count(u"School Year"_s), 1);
        for (int mark = 1000; mark < 1060; ++mark)
            EXPECT_EQ(texts.join(u'\n').count(QString::number(mark)) % 4, 0) << mark;
    }
}

TEST_F(FamilyDataTest, LongCommentsAreWrappedAndRunOverPagesWhole)
{
    auto one = family(u"Abel"_s, {u"Niels"_s});
    QStringList words;
    for (int number = 0; number < 3000; ++number)
        words += u"word%1x"_s.arg(number);
    one.visits = {{core::Date{2020, 2, 3}, u"A visitor"_s, words.join(u' ')}};
    add({one});
    report = *output::find_report(u"k81");

    const auto text = pdf_text();

    for (const auto& word : words)
        EXPECT_TRUE(text.contains(word)) << word.toStdString();
}

} // namespace kindrel::test
