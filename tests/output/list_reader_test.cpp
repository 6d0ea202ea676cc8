#include "output/output_fixture.h"

#include "output/list_reader.h"
#include "people/family_store.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

class ListReaderTest : public ReportTest
{
protected:
    /// The surnames in the order in which they come, with the names on the list.
    [[nodiscard]] QStringList read()
    {
        QStringList families;
        completed =
            output::for_each_family({office, list}, progress,
                                    [&](const output::ListedFamily& listed) {
                                        QStringList names{listed.family.family().surname};
                                        for (const auto& part : {listed.household.adults, listed.household.children}) {
                                            for (const auto* person : part)
                                                names += person->Name;
                                        }
                                        families += names.join(u' ');
                                    },
                                    {});
        return families;
    }
    /// The first person of the first family as output sees it.
    [[nodiscard]] QString birth_date_and_pin()
    {
        QString seen;
        completed = output::for_each_family(
            {office, list}, progress,
            [&](const output::ListedFamily& listed) {
                const auto& person = listed.family.people().front();
                seen = (person.birthdate ? listed.family.shown(*person.birthdate) : u"none"_s) + u' ' +
                       person.personal_pin;
            },
            people::Part::details | people::Part::pins);
        return seen;
    }

    bool completed = false;
};

} // namespace

TEST_F(ListReaderTest, FamiliesComeOnceInTheOrderOfTheList)
{
    add({family(u"Zuse"_s, {u"Konrad"_s, u"Gisela"_s}), family(u"Abel"_s, {u"Niels"_s})});
    std::swap(list.members[1], list.members[2]);

    EXPECT_EQ(read(), QStringList({u"Zuse Konrad Gisela"_s, u"Abel Niels"_s}));
}

TEST_F(ListReaderTest, PeopleWhoAreNotOnTheListAreLeftOut)
{
    add({family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s, u"Cid"_s, u"Dot"_s})});
    list.members.erase(list.members.begin());
    list.members.erase(list.members.begin() + 1);

    EXPECT_EQ(read(), QStringList({u"Naismith Ben Dot"_s}));
}

TEST_F(ListReaderTest, AFamilyRemovedMeanwhileIsPassedOver)
{
    add({family(u"Abel"_s, {u"Niels"_s})});
    list.members.insert(list.members.begin(), {4711, 4711});

    EXPECT_EQ(read(), QStringList({u"Abel Niels"_s}));
}

TEST_F(ListReaderTest, ManyFamiliesComeWholeAndInOrder)
{
    std::vector<people::FamilyFile> families;
    QStringList expected;
    for (int number = 0; number < 1201; ++number) {
        const auto surname = u"Family%1"_s.arg(number);
        families.push_back(family(surname, {u"Ann"_s, u"Ben"_s}));
        expected += surname + u" Ann Ben"_s;
    }
    people::add_families(*office.session, families, clock.today());
    for (const auto& file : families) {
        for (const auto& person : file.people)
            list.members.push_back({person.person_id, file.family.Surname_ID});
    }

    EXPECT_EQ(read(), expected);
    EXPECT_EQ(progress.ends, 1);
}

TEST_F(ListReaderTest, BirthDatesAndPinsNeedTheirRights)
{
    auto one = full_family(false);
    one.people.front().birthdate = core::Date{core::Date::unknown_year, 3, 12};
    add({one});
    const auto pin = one.people.front().personal_pin;

    EXPECT_EQ(birth_date_and_pin(), u"12/03/XXXX "_s + pin);
    office.rights.set(core::Area::birth_dates, false);
    EXPECT_EQ(birth_date_and_pin(), u"none "_s + pin);
    office.rights.set(core::Area::pin_financial_only, false);
    office.rights.set(core::Area::full_financial, false);
    EXPECT_EQ(birth_date_and_pin(), u"none "_s);
}

} // namespace kindrel::test
