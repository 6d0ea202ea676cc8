#include "output/output_fixture.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Date;

namespace {

people::LinkRow carried(int item)
{
    return {item, {}, 0, {}, {}, false};
}

/// A family with a piece of everything, one adult of which carries all that a person can.
people::FamilyFile naismith()
{
    auto one = family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s});
    one.address.res_street = u"12 Long Street"_s;
    one.address.post_street = u"P.O. Box 7"_s;
    one.address.phone = u"9555 1234"_s;
    one.other_contacts = {{u"Aunt"_s, u"555 2"_s}, {u"Neighbour"_s, {}}};
    one.family_groups = {carried(2), carried(1)};
    one.family_dates = {carried(3)};
    one.family_dates[0].date = Date{1988, 8, 8};
    one.events = {{Date{2011, 5, 6}, u"Moved here"_s}};
    one.visits = {{Date{2020, 2, 3}, u"A visitor"_s, u"All well"_s}};

    auto& ann = one.people[0];
    ann.Title = u"Dr"_s;
    ann.Privacy = true;
    ann.preferred_name = u"Annie"_s;
    ann.mobile_phone = u"0412 333"_s;
    ann.occupations = {carried(1)};
    ann.status = {carried(2), carried(3)};
    ann.groups = {carried(3)};
    ann.ministries = {carried(1), carried(2)};
    ann.ministries[0].type = static_cast<int>(people::MinistryState::active);
    ann.ministries[1].type = static_cast<int>(people::MinistryState::potential);
    ann.dates = {carried(1)};
    ann.dates[0].tagged = true;
    ann.dates[0].date = Date{Date::unknown_year, 2, 29};
    ann.flexi = {carried(2)};
    ann.flexi[0].field = u"blue"_s;
    ann.flexi[0].tagged = true;
    ann.personal_pin = u"4711"_s;
    return one;
}

class AllInformationTest : public ReportTest
{
protected:
    AllInformationTest()
    {
        report = *output::find_report(u"All Information Report");
        office.settings.title_church = office.settings.title_date = office.settings.title_filters = false;
    }
    /// The texts behind the lines of header and footer and the family's dates of creation and change.
    [[nodiscard]] std::string printed() { return texts().sliced(3).join(u" | "_s).toStdString(); }
    [[nodiscard]] QString file_state() const
    {
        const auto today = Date::from(clock.today()).shown(office.day_order());
        return u"File status: Active   File Created: %1   Last Edit: %1"_s.arg(today);
    }
};

} // namespace

TEST_F(AllInformationTest, EverythingOfAFamilyStandsUnderItsCaption)
{
    add({naismith()});

    const QStringList expected{u"Naismith"_s,
                               file_state(),
                               u"Residential address | 12 Long Street | Unknown Suburb"_s,
                               u"Postal address | P.O. Box 7"_s,
                               u"Family Ph: 9555 1234"_s,
                               u"Other contacts | Aunt: 555 2 | Neighbour"_s,
                               u"Family groups | family_group 2, family_group 1"_s,
                               u"Family dates | date_description 3: 08/08/1988"_s,
                               u"Events | 06/05/2011  Moved here"_s,
                               u"Visits | 03/02/2020  A visitor  All well"_s,
                               u"Dr Ann (Privacy) | Married, With Child"_s,
                               u"Mobile: 0412 333"_s,
                               u"Preferred name | Annie"_s,
                               u"Occupations | occupation 1"_s,
                               u"Statuses | status 2, status 3"_s,
                               u"Groups | group 3"_s,
                               u"Active ministries | ministry 1"_s,
                               u"Potential ministries | ministry 2"_s,
                               u"Dates | date_description 1: 29/02/XXXX (Tagged)"_s,
                               u"Flexi fields | flexi 2: blue (Tagged)"_s,
                               u"P.I.N. | 4711"_s,
                               u"Ben | Married, With Child"_s};
    EXPECT_EQ(printed(), expected.join(u" | "_s).toStdString());
}

TEST_F(AllInformationTest, WhatIsNotThereLeavesNoCaption)
{
    add({family(u"Abel"_s, {u"Niels"_s})});

    EXPECT_EQ(
        printed(),
        u"Abel | %1 | Residential address | Unknown Suburb | Niels | Single Adult"_s.arg(file_state()).toStdString());
}

TEST_F(AllInformationTest, APinIsPrintedOnlyToWhoMaySeePins)
{
    add({naismith()});
    office.rights.set(core::Area::full_financial, false);
    office.rights.set(core::Area::pin_financial_only, true);
    EXPECT_TRUE(pdf_text().contains(u"4711"_s));

    office.rights.set(core::Area::pin_financial_only, false);
    const auto text = pdf_text();
    EXPECT_FALSE(text.contains(u"4711"_s));
    EXPECT_FALSE(text.contains(u"P.I.N."_s));
}

TEST_F(AllInformationTest, WhoIsListedUnderAPreferredNameKeepsTheOther)
{
    office.settings.use_preferred_names = true;
    add({naismith()});

    const auto all = texts();

    EXPECT_TRUE(all.contains(u"Dr Annie (Privacy)"_s));
    EXPECT_EQ(all.value(all.indexOf(u"Name"_s) + 1), u"Ann"_s);
    EXPECT_FALSE(all.contains(u"Preferred name"_s));
}

TEST_F(AllInformationTest, AFamilyThatRunsOnIsNamedAgainOnTheNextPage)
{
    auto large = naismith();
    large.people[0].personal_pin.clear();
    while (large.people.size() < people::most_people)
        large.people.push_back(large.people.front());
    add({large});

    const auto pages = this->pages();

    ASSERT_GT(pages.size(), 2u);
    for (std::size_t page = 1; page < pages.size(); ++page)
        EXPECT_TRUE(pages[page].contains(u"Naismith (continued)"_s)) << page;
}

} // namespace kindrel::test
