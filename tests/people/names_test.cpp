#include "people/disclosed.h"
#include "people/fields.h"
#include "people/names.h"
#include "people/sort_key.h"
#include "support/families.h"

#include <gtest/gtest.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;
using core::Date;

namespace {

QStringList names_of(const std::vector<const Person*>& people)
{
    QStringList names;
    for (const auto* found : people)
        names += found->Name;
    return names;
}

std::vector<Person> household(std::initializer_list<std::pair<QString, int>> members)
{
    std::vector<Person> made;
    for (const auto& [name, marital] : members)
        made.push_back(person(name, marital));
    return made;
}

} // namespace

TEST(NamesTest, AllMarkersStandInTheirOrder)
{
    auto flagged = person(u"Ann"_s);
    EXPECT_EQ(markers(flagged, Markers::full), QString());
    flagged.Active = flagged.Decease = flagged.Privacy = flagged.Prospect = flagged.archive = flagged.contact = true;

    EXPECT_EQ(markers(flagged, Markers::full), u" (Privacy) (Prospect) (Archive) (Contact) (Deceased)"_s);
    EXPECT_EQ(markers(flagged, Markers::shortened), u"(Pr)(Pros)(Arch)(Con)(Dec)"_s);
}

TEST(NamesTest, ThePreferredNameStandsOnlyWhereItIsWantedThereAndOpen)
{
    auto named = person(u"Margaret"_s);
    EXPECT_EQ(display_name(named, true), u"Margaret"_s);
    named.preferred_name = u"Peggy"_s;
    EXPECT_EQ(display_name(named, true), u"Peggy"_s);
    EXPECT_EQ(display_name(named, false), u"Margaret"_s);
    named.Preferred_Name_hidden = true;
    EXPECT_EQ(display_name(named, true), u"Margaret"_s);
}

TEST(NamesTest, PrimarySpouseAndChildrenAreToldByTheirCodes)
{
    const auto couple = household({{u"Ann"_s, 4}, {u"Kid"_s, 5}, {u"Son"_s, 1}, {u"Ben"_s, 4}, {u"Tot"_s, 7}});
    const auto family = household_of(couple);
    EXPECT_EQ(family.primary->Name, u"Ann"_s);
    ASSERT_NE(family.spouse, nullptr);
    EXPECT_EQ(family.spouse->Name, u"Ben"_s);
    EXPECT_EQ(names_of(family.adults), (QStringList{u"Ann"_s, u"Ben"_s, u"Son"_s}));
    EXPECT_EQ(names_of(family.children), (QStringList{u"Kid"_s, u"Tot"_s}));

    const auto parent = household({{u"Ann"_s, 12}, {u"Son"_s, 1}, {u"Kid"_s, 6}});
    EXPECT_EQ(household_of(parent).spouse, nullptr);
    EXPECT_EQ(names_of(household_of(parent).adults), (QStringList{u"Ann"_s, u"Son"_s}));
    EXPECT_EQ(household_of({}).primary, nullptr);
}

TEST(NamesTest, SchoolYearsSkipZero)
{
    EXPECT_EQ(next_school_year(-2), -1);
    EXPECT_EQ(next_school_year(-1), 1);
    EXPECT_EQ(next_school_year(1), 2);
}

TEST(NamesTest, TheSummaryTellsTheFamilyInLines)
{
    auto file = family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s, u"Kid"_s, u"Tot"_s});
    file.address.res_street = u"1 High St"_s;
    file.address.res_map = u"59"_s;
    file.address.res_ref = u"B12"_s;
    file.address.phone = u"555 1234"_s;
    file.residential = Suburb{1, SuburbType::residential, u"3999"_s, u"Carlton"_s, u"3053"_s};
    EXPECT_EQ(family_summary(file, false), u"Ann & Ben Naismith\r\nChildren: Kid, Tot\r\n1 High St\r\nCarlton 3999\r\n"
                                           "Map: 59 Ref: B12\r\nPhone: 555 1234"_s);
    file.address.res_hidden = file.address.phone_hidden = true;
    file.people.resize(1);
    EXPECT_EQ(family_summary(file, false),
              u"Ann Naismith\r\n(Unlisted Address)\r\nMap: 59 Ref: B12\r\n(Unlisted Phone: 555 1234)"_s);
    file.address = {};
    file.residential.reset();
    EXPECT_EQ(family_summary(file, false), u"Ann Naismith\r\nUnknown Suburb"_s);
}

TEST(NamesTest, ABookedOutFamilySaysWhoHoldsItAndWhetherItMayBeEdited)
{
    Family lent;
    EXPECT_EQ(booked_out_note(lent, core::DayOrder::day_first), QString());
    lent.booked_out = true;
    lent.booked_out_person = u"Joan"_s;
    lent.booked_out_date = Date{2026, 1, 31};
    EXPECT_EQ(booked_out_note(lent, core::DayOrder::day_first),
              u" (Booked out to Joan on 31/01/2026) (Unable to Edit this Family file)"_s);
    lent.active_in_book = true;
    EXPECT_TRUE(booked_out_note(lent, core::DayOrder::day_first).endsWith(u" (Edit mode is enabled on this file)"_s));
}

TEST(NamesTest, SortKeysKnowNoAccentsAndNoCase)
{
    const std::vector<std::pair<QString, QString>> cases{
        {u"Žižek"_s, u"ZIZEK"_s},     {u"Łódź"_s, u"LODZ"_s},
        {u"o’brien"_s, u"O'BRIEN"_s}, {u"Østergård"_s, u"OSTERGARD"_s},
        {u" Groß "_s, u"GROSS"_s},    {u"Nguyễn"_s, u"NGUYEN"_s},
        {u"李"_s, u"李"_s},           {{}, {}},
    };
    for (const auto& [text, key] : cases)
        EXPECT_EQ(sort_key(text), key) << text.toStdString();
}

TEST(DisclosedTest, WhatIsHiddenOrNotPermittedIsBlank)
{
    const auto open = disclose(full_family(false), {.use_preferred_names = true});
    EXPECT_EQ(open.name(open.people()[0]), u"Zoëpreferred"_s);
    EXPECT_FALSE(open.people()[0].business_phone.isEmpty());
    EXPECT_TRUE(open.people()[0].birthdate);
    ASSERT_NE(open.residential(), nullptr);

    const auto closed = disclose(full_family(true), {.use_preferred_names = true});
    EXPECT_EQ(closed.name(closed.people()[0]), u"Zoë"_s);
    EXPECT_EQ(closed.residential(), nullptr);
    EXPECT_EQ(closed.postal(), nullptr);
    EXPECT_TRUE(closed.people()[0].occupations.empty());
    for (const auto& field : detail_fields()) {
        const auto* text = std::get_if<QString Person::*>(&field.member);
        EXPECT_TRUE(!text || (closed.people()[0].**text).isEmpty()) << field.name;
    }
    for (const auto& field : address_fields()) {
        const auto* text = std::get_if<QString Address::*>(&field.member);
        const bool stays = !text || std::string_view(field.name) == "audio_note";
        EXPECT_TRUE(stays || (closed.address().**text).isEmpty()) << field.name;
    }
    EXPECT_FALSE(closed.people()[0].birthdate);

    const auto barred = disclose(full_family(false), {.birth_dates = false, .pins = false});
    EXPECT_FALSE(barred.people()[0].birthdate);
    EXPECT_EQ(barred.people()[0].personal_pin, QString());
}

} // namespace kindrel::test
