#include "people/data_search.h"
#include "people/editor_fixture.h"
#include "people/person_files.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;
using core::Area;

namespace {

const DataPart& part(std::string_view name)
{
    const auto parts = data_parts();
    return *std::ranges::find(parts, name, &DataPart::name);
}

class DataSearchTest : public EditorTest
{
protected:
    FamilyFile keep(const FamilyFile& file) { return save_family(session(), file, desk->clock.today()); }
    [[nodiscard]] std::vector<DataEntry> found(std::string_view name)
    {
        return people_with(office(), part(name)).value();
    }
    /// "Zoë: 17/07/1977", a hidden one with a star.
    [[nodiscard]] QStringList lines(const char* name)
    {
        QStringList texts;
        for (const auto& entry : found(name))
            texts += entry.name + u": "_s + entry.value + (entry.hidden ? u"*"_s : QString());
        return texts;
    }
    /// Everything a family can have, files included.
    FamilyFile keep_everything(bool hidden)
    {
        const FamilyFile full = keep(full_family(hidden));
        session().execute(u"UPDATE [tbl_surname] SET [booked_out]=-1,[booked_out_person]='Olga';"_s);
        session().execute(u"INSERT INTO [tbl_visitation] ([surname_id],[visitor]) VALUES (?,'Ivan');"_s,
                          full.family.Surname_ID);
        for (const auto& file : files_of_family(full.family.Surname_ID))
            write_file_of(file);
        for (const auto& file : files_of_person(full.people[0].person_id))
            write_file_of(file);
        return full;
    }
    void write_file_of(const OwnFile& file) { DataFolder::write(office().paths.folder(file.folder) + file.name, "x"); }
};
KINDREL_ON_BOTH_ENGINES(DataSearchTest);

} // namespace

TEST_P(DataSearchTest, EveryPartFindsAFamilyThatHasEverythingAndNoneThatHasNothing)
{
    const auto full = keep_everything(true);
    add(u"Bare"_s, {u"Una"_s});
    for (const auto& one : data_parts()) {
        const auto entries = found(one.name);
        EXPECT_GE(entries.size(), 1U) << one.name;
        for (const auto& entry : entries) {
            EXPECT_EQ(entry.surname, full.family.surname) << one.name;
            EXPECT_FALSE(entry.value.isEmpty()) << one.name;
        }
    }
}

TEST_P(DataSearchTest, AnEntryIsShownAsTheChurchWritesIt)
{
    keep(full_family(false));
    struct Case
    {
        const char* part;
        QString value;
    };
    for (const auto& [name, value] :
         {Case{"Title", u"ZoëTitle"_s}, Case{"Birth Date", u"17/07/1977"_s}, Case{"School Year", u"-2"_s},
          Case{"Personal Dates", u"date_description 1: 29/02/XXXX; date_description 3: 01/01/2001"_s},
          Case{"Ministries", u"(Active) ministry 1; (Potential) ministry 1"_s},
          Case{"Flexi Fields", u"flexi 1: Zoëflexi"_s}, Case{"Status", u"status 2; status 1"_s},
          Case{"Residential Suburb", u"suburb 1 3999"_s}, Case{"Postal Suburb", u"suburb 2 3000"_s},
          Case{"Other Contacts", u"Neighbour: 555 1; Aunt: 555 2"_s},
          Case{"Events", u"06/05/2011: Moved here; 02/01/XXXX: An older one"_s},
          Case{"Family Groups", u"family_group 2; family_group 1"_s}})
        EXPECT_EQ(lines(name).value(0), u"Zoë Zoëothersurname: "_s + value) << name;
    EXPECT_EQ(lines("Title").size(), 3) << "Everybody who has one.";
    EXPECT_EQ(lines("Residential Suburb").size(), 1) << "A family is listed once.";
}

TEST_P(DataSearchTest, WhatIsHiddenIsFoundAndMarked)
{
    keep(full_family(true));
    for (const auto* name : {"Title",
                             "Preferred Given Name",
                             "Middle Name",
                             "Other Surname",
                             "Birth Date",
                             "Personal Mobile Phone",
                             "Personal E-mail",
                             "Business Phone",
                             "Business Fax",
                             "Business E-mail",
                             "Occupation",
                             "Residential Street",
                             "Residential Suburb",
                             "Map",
                             "Postal Street",
                             "Postal Suburb",
                             "Family Phone",
                             "Family Fax",
                             "Family Mobile Phone",
                             "Family E-mail"})
        EXPECT_TRUE(lines(name).value(0).startsWith(u"Zoë: "_s) && lines(name).value(0).endsWith(u'*')) << name;
    for (const auto* name : {"School Year", "Status", "P.I.N.", "Other Contacts"})
        EXPECT_FALSE(lines(name).value(0).endsWith(u'*')) << name;
}

TEST_P(DataSearchTest, EachPartAsksForItsRight)
{
    keep_everything(false);
    struct Case
    {
        const char* part;
        std::vector<Area> without;
        QString refusal;
    };
    const auto no_access = [](Area area) {
        return u"Your password does not give access to \"%1\""_s.arg(core::area_name(area));
    };
    for (const auto& [name, without, refusal] :
         {Case{"Title", {Area::search_for_family}, no_access(Area::search_for_family)},
          Case{"Birth Date", {Area::birth_dates}, no_access(Area::birth_dates)},
          Case{"Visitation", {Area::visitation_tab}, no_access(Area::visitation_tab)},
          Case{"Personal Notes", {Area::personal_notes_in_notebook}, no_access(Area::personal_notes_in_notebook)},
          Case{"Family Notes", {Area::family_file_notebook}, no_access(Area::family_file_notebook)},
          Case{"P.I.N.",
               {Area::full_financial, Area::pin_financial_only},
               u"Your security setup does not allow you access to any of the P.I.N. functions"_s}}) {
        office().rights = core::Rights::all();
        EXPECT_TRUE(people_with(office(), part(name))) << name;
        for (const Area area : without)
            office().rights.set(area, false);
        dialogue().expect_box(refusal);
        EXPECT_FALSE(people_with(office(), part(name))) << name;
    }
    office().rights = core::Rights::all();
    office().rights.set(Area::full_financial, false);
    office().rights.set(Area::pin_financial_only, true);
    EXPECT_TRUE(people_with(office(), part("P.I.N."))) << "Either financial right will do.";
}

TEST_P(DataSearchTest, PhotographsAndNotesBelongToWhomTheirNamesSay)
{
    const auto adder = keep(family(u"Adder"_s, {u"Ann"_s, u"Ben"_s}));
    add(u"Nash"_s, {u"Carl"_s});
    write_file_of(portrait_of_person(adder.people[1].person_id));
    write_file_of(portrait_of_family(adder.family.Surname_ID));
    write_file_of({core::Folder::portrait, u"99999.jpg"_s});
    write_file_of({core::Folder::portrait, u"Thumbs.db"_s});

    const auto of_people = found("Portraits");
    ASSERT_EQ(of_people.size(), 1U);
    EXPECT_EQ(of_people[0].name, u"Ben"_s);
    const auto of_families = found("Family Portraits");
    ASSERT_EQ(of_families.size(), 1U);
    EXPECT_EQ(of_families[0].member.surname_id, adder.family.Surname_ID);
    EXPECT_EQ(lines("Personal Notes"), QStringList());
}

TEST_P(DataSearchTest, WhoIsNotSimplyActiveIsMarkedInEitherKindOfPart)
{
    auto adder = family(u"Adder"_s, {u"Ann"_s, u"Ben"_s});
    adder.people[0].Decease = true;
    adder.people[1].contact = true;
    adder.people[0].Title = adder.people[1].Title = u"Dr"_s;
    adder.address.phone = u"555"_s;
    keep(adder);

    EXPECT_EQ(lines("Title"), (QStringList{u"Ann (Deceased): Dr"_s, u"Ben (Contact): Dr"_s}));
    EXPECT_EQ(lines("Family Phone"), QStringList{u"Ann (Deceased): 555"_s});
    EXPECT_EQ(found("Title")[0].states, (PersonStates{.active = false, .deceased = true}));
    EXPECT_EQ(found("Title")[1].states, (PersonStates{.active = false, .contact = true}));
}

TEST_P(DataSearchTest, EntriesOrderByTheirDatesAndNumbersNotByTheirText)
{
    auto adder = family(u"Adder"_s, {u"Ann"_s, u"Ben"_s});
    adder.people[0].birthdate = core::Date{1977, 12, 30};
    adder.people[1].birthdate = core::Date{1978, 1, 2};
    adder.people[0].school_year = -2;
    adder.people[1].school_year = 3;
    keep(adder);
    for (const auto* name : {"Birth Date", "School Year"}) {
        const auto entries = found(name);
        ASSERT_EQ(entries.size(), 2U);
        EXPECT_LT(entries[0].order, entries[1].order) << name;
    }
    EXPECT_LT(u"02/01/1978"_s, found("Birth Date")[0].value) << "The texts order otherwise.";
}

TEST_P(DataSearchTest, AListToGoOnWithHasTheLivingAndTheFirstOfThemForAFamily)
{
    auto widowed = family(u"Adams"_s, {u"Ann"_s, u"Ben"_s}), gone = family(u"Lane"_s, {u"Cy"_s});
    for (auto* file : {&widowed, &gone}) {
        file->address.phone = u"555"_s;
        file->people[0].Decease = true;
        for (auto& person : file->people)
            person.Title = u"Dr"_s;
        *file = keep(*file);
    }
    for (const auto* name : {"Family Phone", "Title"}) {
        const auto list = living_with(session(), part(name), found(name));
        ASSERT_EQ(list.members.size(), 1U) << name;
        EXPECT_EQ(list.members[0].person_id, widowed.people[1].person_id) << name;
        EXPECT_TRUE(list.criteria.endsWith(u", without the deceased")) << name;
    }
}

} // namespace kindrel::test
