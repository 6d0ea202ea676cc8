#include "people/editor_fixture.h"
#include "people/sorting.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Date;
using people::DateSearch;
using people::FamilyType;
using people::right_for;
using people::SortBy;
using people::SortOrder;

namespace {

/// Four families whose dates and suburbs lead to different orders.
class SortingTest : public EditorTest
{
protected:
    void SetUp() override
    {
        EditorTest::SetUp();
        if (!church)
            return;
        store(u"Zeller"_s, {{u"Ann"_s, Date{1990, 3, 20}, 1, {}}}, 2, Date{2024, 2, 1}, Date{1980, 6, 1});
        store(u"Adams"_s, {{u"Ben"_s, Date{1985, 12, 1}, 4, {}}, {u"Cy"_s, Date{2015, 3, 4}, 6, u"Young"_s}}, 1,
              Date{2023, 2, 1}, Date{1800, 5, 9});
        store(u"Moss"_s, {{u"Di"_s, {}, 11, {}}}, 0, {}, {});
        store(u"Lane"_s, {{u"Eve"_s, Date{2024, 1, 2}, 2, {}}, {u"Fay"_s, Date{1800, 3, 8}, 5, {}}}, 3,
              Date{2024, 1, 1}, Date{2001, 5, 9});
        all = people::active_families(session());
    }
    struct Given
    {
        QString name;
        std::optional<Date> birth;
        int marital;
        QString other_surname;
    };
    void store(const QString& surname, const std::vector<Given>& given, int suburb, std::optional<Date> visit,
               std::optional<Date> event)
    {
        auto file = family(surname, {});
        for (const auto& [name, birth, marital, other] : given) {
            auto& added = file.people.emplace_back(person(name, marital));
            added.birthdate = birth;
            added.other_surname = other;
            added.dates = {{2, {}, 0, birth, {}, false}};
        }
        if (suburb)
            file.residential =
                people::Suburb{suburb, people::SuburbType::residential, u"%1000"_s.arg(9 - suburb), {}, {}};
        if (visit)
            file.visits = {{Date{2020, 1, 1}, {}, {}}, {visit, {}, {}}};
        if (event)
            file.events = {{Date{2023, 7, 1}, u"Moved"_s}, {event, u"Wedding"_s}};
        (void)people::save_family(session(), file, office().clock.today());
    }
    /// First letters of the people in order.
    [[nodiscard]] QString order(const SortOrder& wanted)
    {
        QString found;
        for (const auto& member : people::sorted(session(), all, wanted, office().clock.today()).members) {
            auto rows = session().select(u"SELECT [Name] FROM [tbl_people] WHERE [person_id]=?;"_s, member.person_id);
            found += rows.first()->text(core::Column{0}).front();
        }
        return found;
    }

    people::WorkingList all;
};
KINDREL_ON_BOTH_ENGINES(SortingTest);

} // namespace

TEST(SortRightTest, BirthDatesAndVisitsAloneAskForTheirRight)
{
    using core::Area;
    for (const auto& [by, right] :
         std::initializer_list<std::pair<SortBy, std::optional<Area>>>{{SortBy::birth_date, Area::birth_dates},
                                                                       {SortBy::visitation, Area::visitation_tab},
                                                                       {SortBy::family, {}},
                                                                       {SortBy::family_events, {}},
                                                                       {SortBy::personal_date, {}}})
        EXPECT_EQ(right_for(by), right) << people::sort_label(by).toStdString();
}

TEST_P(SortingTest, EveryOrderStandsAsItsScreenSays)
{
    EXPECT_EQ(order({}), u"BCEFDA");
    EXPECT_EQ(order({.by = SortBy::individual}), u"BEFDCA");
    EXPECT_EQ(order({.by = SortBy::suburb}), u"BCAEFD");
    EXPECT_EQ(order({.by = SortBy::postcode}), u"EFABCD");
    EXPECT_EQ(order({.by = SortBy::birth_date}), u"ECFABD");
    EXPECT_EQ(order({.by = SortBy::visitation}), u"BCEFAD");
    EXPECT_EQ(order({.by = SortBy::family_events}), u"BCEFAD");
    EXPECT_EQ(order({.by = SortBy::personal_date, .item = 2}), u"ECFABD");
    EXPECT_EQ(order({.by = SortBy::personal_date, .item = 3}), u"BCEFDA");
}

TEST_P(SortingTest, ADateSearchKeepsWhoHasADateThatFits)
{
    SortOrder birth{.by = SortBy::birth_date, .search = DateSearch::month, .month = 3};
    EXPECT_EQ(order(birth), u"CFA");
    birth.search = DateSearch::ages; // Of this year's child and of one without a year no age is known.
    birth.ages = {{0, 120}};
    EXPECT_EQ(order(birth), u"BAC");
    birth.ages = {{9, 34}};
    EXPECT_EQ(order(birth), u"AC");
    birth.search = DateSearch::dates;
    birth.dates = {{Date{1985, 12, 1}, Date{2015, 3, 4}}};
    EXPECT_EQ(order(birth), u"BAC");
    EXPECT_EQ(
        order({.by = SortBy::visitation, .search = DateSearch::dates, .dates = {{Date{2020, 1, 1}, Date{2020, 1, 1}}}}),
        u"BCEFA");
}

TEST_P(SortingTest, FamilyTypesNarrowByTheirCodes)
{
    EXPECT_EQ(order({.type = FamilyType::single_adult}), u"A");
    EXPECT_EQ(order({.type = FamilyType::single_parent}), u"ED");
    EXPECT_EQ(order({.type = FamilyType::married_with_child}), u"B");
    EXPECT_EQ(order({.by = SortBy::birth_date, .type = FamilyType::widower_with_child}), u"D");
}

TEST(SortOrderTest, ASearchAsksForItsValue)
{
    const auto asks = [](DateSearch search) {
        return people::sort_refusal({.by = SortBy::birth_date, .search = search}).value().text;
    };
    EXPECT_EQ(asks(DateSearch::month), u"Please select a month for the date search");
    EXPECT_EQ(asks(DateSearch::ages), u"Please enter the ages you wish to conduct the date search for");
    EXPECT_EQ(asks(DateSearch::dates), u"Please enter the dates you wish to conduct the date search for");
    EXPECT_FALSE(people::sort_refusal({.by = SortBy::suburb, .search = DateSearch::month}));
    EXPECT_EQ(
        people::sort_sentence(
            {.by = SortBy::birth_date, .search = DateSearch::month, .month = 3, .type = FamilyType::married_with_child},
            core::DayOrder::day_first),
        u"by Birth Date in March, Married, With Child only");
}

} // namespace kindrel::test
