#include "people/address_book.h"
#include "people/editor_fixture.h"
#include "people/text_search.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;

namespace {

constexpr auto none_found = u"Unable to find any families matching the search criteria entered";

class TextSearchTest : public EditorTest
{
protected:
    void keep(FamilyFile file) { (void)save_family(session(), file, desk->clock.today()); }
    [[nodiscard]] std::vector<int> everybody()
    {
        std::vector<int> keys;
        for (const auto& entry : read_address_book(session(), FamilyList::all, false))
            keys.push_back(entry.Surname_ID);
        return keys;
    }
    /// The surnames in the order in which they are found, to the message at the end.
    [[nodiscard]] QStringList found(const QString& text, SearchFields fields)
    {
        dialogue().expect_box(QString::fromUtf16(none_found));
        TextSearch search(office());
        QStringList surnames;
        while (const auto match = search.next(text, fields, everybody()))
            surnames += stored(match->surname_id).family.surname;
        return surnames;
    }
};
KINDREL_ON_BOTH_ENGINES(TextSearchTest);

} // namespace

TEST_P(TextSearchTest, ATextIsFoundAnywhereInAFieldWhateverItsCase)
{
    for (const auto& surname : {u"Smith"_s, u"Jones"_s, u"Naismith"_s})
        add(surname, {u"Ann"_s});
    EXPECT_EQ(found(u"smi"_s, SearchFields::all), (QStringList{u"Naismith"_s, u"Smith"_s}));
    EXPECT_EQ(found(u"  SMI "_s, SearchFields::names), (QStringList{u"Naismith"_s, u"Smith"_s}));
    EXPECT_EQ(found(u"sm*"_s, SearchFields::all), QStringList()) << "There are no wildcards.";
}

TEST_P(TextSearchTest, EachModeLooksAtItsOwnFields)
{
    auto file = family(u"Adder"_s, {u"Una"_s});
    auto& una = file.people[0];
    una.preferred_name = u"q-preferred"_s;
    una.other_surname = u"q-other"_s;
    una.middle_name = u"q-middle"_s;
    una.mobile_phone = u"q-mobile"_s;
    una.Personal_email = u"q-email"_s;
    una.business_phone = u"q-business"_s;
    una.business_fax = u"q-bfax"_s;
    una.business_email = u"q-bmail"_s;
    auto& address = file.address;
    address.res_street = u"q-street"_s;
    address.res_street2 = u"q-second"_s;
    address.res_state = u"q-state"_s;
    address.res_country = u"q-country"_s;
    address.res_map = u"q-map"_s;
    address.res_ref = u"q-ref"_s;
    address.post_street = u"q-pstreet"_s;
    address.post_street2 = u"q-psecond"_s;
    address.post_state = u"q-pstate"_s;
    address.post_country = u"q-pcountry"_s;
    address.phone = u"q-phone"_s;
    address.family_fax = u"q-ffax"_s;
    address.family_mobile = u"q-fmobile"_s;
    address.family_email = u"q-fmail"_s;
    keep(file);
    struct Case
    {
        const char* word;
        bool in_names, in_all;
    };
    constexpr std::array cases{
        Case{"una", true, true},         Case{"adder", true, true},        Case{"q-other", true, true},
        Case{"q-middle", true, true},    Case{"q-preferred", true, false}, Case{"q-phone", false, true},
        Case{"q-ffax", false, true},     Case{"q-fmail", false, true},     Case{"q-mobile", false, true},
        Case{"q-email", false, true},    Case{"q-business", false, true},  Case{"q-bfax", false, true},
        Case{"q-bmail", false, true},    Case{"q-street", false, true},    Case{"q-second", false, true},
        Case{"q-state", false, true},    Case{"q-country", false, true},   Case{"q-map", false, true},
        Case{"q-pstreet", false, true},  Case{"q-psecond", false, true},   Case{"q-pstate", false, true},
        Case{"q-pcountry", false, true}, Case{"q-ref", false, false},      Case{"q-fmobile", false, false}};
    for (const auto& [word, in_names, in_all] : cases) {
        EXPECT_EQ(found(QString::fromLatin1(word), SearchFields::names).size(), in_names) << word;
        EXPECT_EQ(found(QString::fromLatin1(word), SearchFields::all).size(), in_all) << word;
    }
}

TEST_P(TextSearchTest, TwoPeopleOfAFamilyFindItOnceByTheFirstOfThem)
{
    const int first = add(u"Adder"_s, {u"Rosemary"_s, u"Rose"_s});
    const int second = add(u"Nash"_s, {u"Rosa"_s});
    TextSearch search(office());

    const auto match = search.next(u"ros"_s, SearchFields::all, everybody());
    ASSERT_TRUE(match);
    EXPECT_EQ(*match, (TextMatch{first, stored(first).people[0].person_id, u"given name", u"Rosemary"_s}));
    EXPECT_TRUE(search.under_way());
    EXPECT_EQ(search.next(u"ros"_s, SearchFields::all, everybody())->surname_id, second);
    dialogue().expect_box(QString::fromUtf16(none_found));
    EXPECT_FALSE(search.next(u"ros"_s, SearchFields::all, everybody()));
    EXPECT_FALSE(search.under_way());
    EXPECT_EQ(search.next(u"ros"_s, SearchFields::all, everybody())->surname_id, first) << "From the beginning again.";
}

TEST_P(TextSearchTest, AnythingElseAskedForStartsTheSearchAnew)
{
    const int ann = add(u"Adder"_s, {u"Ann"_s});
    const int anna = add(u"Nash"_s, {u"Anna"_s});
    const auto first_then = [&](const QString& text, SearchFields fields, const std::vector<int>& listed) {
        TextSearch search(office());
        EXPECT_EQ(search.next(u"ann"_s, SearchFields::all, everybody())->surname_id, ann);
        return search.next(text, fields, listed)->surname_id;
    };
    EXPECT_EQ(first_then(u"ann"_s, SearchFields::all, everybody()), anna);
    EXPECT_EQ(first_then(u"an"_s, SearchFields::all, everybody()), ann);
    EXPECT_EQ(first_then(u"ann"_s, SearchFields::names, everybody()), ann);
    EXPECT_EQ(first_then(u"ann"_s, SearchFields::all, {ann}), ann);
}

TEST_P(TextSearchTest, AnotherOrderOfTheSameFamiliesLetsTheSearchGoOn)
{
    const int ann = add(u"Adder"_s, {u"Ann"_s});
    const int anna = add(u"Nash"_s, {u"Anna"_s});
    TextSearch search(office());
    EXPECT_EQ(search.next(u"ann"_s, SearchFields::all, {ann, anna})->surname_id, ann);
    EXPECT_EQ(search.next(u"ann"_s, SearchFields::all, {anna, ann})->surname_id, anna);
}

TEST_P(TextSearchTest, AMatchSaysWhoWasFoundAndWhere)
{
    auto file = family(u"Rotherham"_s, {u"Deborah"_s, u"Jasmine"_s});
    file.people[1].other_surname = u"q-other"_s;
    file.people[1].business_email = u"q-mail"_s;
    file.address.post_street2 = u"q-line"_s;
    keep(file);
    for (const auto& [text, words] : std::initializer_list<std::pair<QString, QString>>{
             {u"smin"_s, u"Found in the given name of Jasmine"_s},
             {u"q-other"_s, u"Found in the other surname of Jasmine"_s},
             {u"q-mail"_s, u"Found in the business e-mail of Jasmine"_s},
             {u"rother"_s, u"Found in the surname of the family"_s},
             {u"q-line"_s, u"Found in the second line of the postal street of the family"_s}}) {
        TextSearch search(office());
        EXPECT_EQ(found_words(*search.next(text, SearchFields::all, everybody())), words);
    }
}

TEST_P(TextSearchTest, FamiliesThatAreNotListedArePassedOver)
{
    add(u"Adder"_s, {u"Ann"_s});
    const int listed = add(u"Nash"_s, {u"Ann"_s});
    TextSearch search(office());
    EXPECT_EQ(search.next(u"ann"_s, SearchFields::all, {listed})->surname_id, listed);
}

TEST_P(TextSearchTest, WhatCannotBeSearchedForIsRefusedInWords)
{
    struct Case
    {
        QString text;
        bool with_families;
        bool with_right;
        QString refusal;
    };
    const int ann = add(u"Adder"_s, {u"Ann"_s});
    for (const auto& [text, with_families, with_right, refusal] :
         {Case{u" \t "_s, true, true, u"Please enter what you would like to search for first"_s},
          Case{u"ann"_s, false, true, u"Unable to do a search as no families exist"_s},
          Case{u"ann"_s, true, false, u"Your password does not give access to \"Search for Family\""_s}}) {
        office().rights.set(core::Area::search_for_family, with_right);
        dialogue().expect_box(refusal);
        TextSearch search(office());
        EXPECT_FALSE(search.next(text, SearchFields::all, with_families ? std::vector{ann} : std::vector<int>{}));
    }
    dialogue().expect_box(u"No families exist for opening"_s);
    EXPECT_FALSE(can_open(office(), 0));
}

} // namespace kindrel::test
