#include "output/output_fixture.h"

#include "people/fields.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using people::Address;

namespace {

/// What Directory 1 prints of one switch's values.
struct Switch
{
    bool Address::*hidden;
    QStringList words;
};

const std::vector<Switch> switches{
    {&Address::res_hidden,
     {u"addressresstreet"_s, u"addressresstreet2"_s, u"suburb 1"_s, u"addressresstate"_s, u"3999"_s,
      u"addressrescountry"_s, u"Map: addressresmap"_s, u"Ref: addressresref"_s}},
    {&Address::phone_hidden, {u"Family Ph: addressphone"_s}},
    {&Address::family_fax_hidden, {u"Family Fax: addressfamilyfax"_s}},
    {&Address::family_email_hidden, {u"Family Email: addressfamilyemail"_s}},
};

class DirectoryHidingTest : public ReportTest
{
};

} // namespace

TEST_F(DirectoryHidingTest, NoHiddenValueIsInThePdfAndItsCaptionIsLeftOut)
{
    office.settings.use_preferred_names = true;
    const auto family = full_family(true);
    add({family});

    const auto text = pdf_text();

    ASSERT_TRUE(text.contains(u"Zoë & Stanisław"_s)) << text.toStdString();
    for (const auto& word : hidden_words(family))
        EXPECT_FALSE(text.contains(word)) << word.toStdString();
    for (const auto& caption : {u"Family Ph:"_s, u"Family Fax:"_s, u"Family Email:"_s, u"Map:"_s, u"Ref:"_s})
        EXPECT_FALSE(text.contains(caption)) << caption.toStdString();
}

TEST_F(DirectoryHidingTest, TheSameFamilyWithoutHiddenValuesShowsThemWithTheirCaptions)
{
    office.settings.use_preferred_names = true;
    add({full_family(false)});

    const auto text = pdf_text();

    EXPECT_TRUE(text.contains(u"Zoëpreferred & Stanisławpreferred"_s)) << text.toStdString();
    for (const auto& one : switches) {
        for (const auto& word : one.words)
            EXPECT_TRUE(text.contains(word)) << word.toStdString();
    }
}

TEST_F(DirectoryHidingTest, EachSwitchHidesItsOwnValuesAlone)
{
    for (const auto& set : switches) {
        list.members.clear();
        auto family = full_family(false);
        family.address.*set.hidden = true;
        for (auto& person : family.people)
            person.personal_pin.clear();
        add({family});

        const auto text = texts().join(u'\n');

        for (const auto& one : switches) {
            for (const auto& word : one.words)
                EXPECT_EQ(text.contains(word), one.hidden != set.hidden) << word.toStdString();
        }
    }
}

TEST_F(DirectoryHidingTest, AHiddenAddressIsNotCalledUnknown)
{
    auto family = full_family(false);
    family.address.res_hidden = true;
    family.residential.reset();
    add({family});

    EXPECT_FALSE(pdf_text().contains(u"Unknown"_s));
}

} // namespace kindrel::test
