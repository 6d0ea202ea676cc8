#include "output/output_fixture.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

people::FamilyFile naismith()
{
    auto one = family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s, u"Cid"_s});
    one.address.res_street = u"12 Long Street"_s;
    one.address.res_street2 = u"Rear"_s;
    one.residential = people::Suburb{1, people::SuburbType::residential, {}, {}, {}};
    one.address.post_street = u"P.O. Box 7"_s;
    one.postal = people::Suburb{2, people::SuburbType::postal, {}, {}, {}};
    one.address.phone = u"9555 1234"_s;
    one.address.family_email = u"n@example.org"_s;
    return one;
}

class MiscellaneousTest : public ReportTest
{
protected:
    [[nodiscard]] std::string printed(QStringView key)
    {
        report = *output::find_report(key);
        office.settings.title_church = office.settings.title_date = office.settings.title_filters = false;
        return texts().sliced(3).join(u" | "_s).toStdString();
    }
};

const std::string brief_heading = "Surname | People | Address | Phone";
const std::string addresses_heading = "Family | Residential address | Postal address | Contacts";

} // namespace

TEST_F(MiscellaneousTest, TheBriefReportHasALineForEachFamily)
{
    add({family(u"Zuse"_s, {u"Konrad"_s}), naismith()});

    EXPECT_EQ(printed(u"Brief Report (Landscape)"),
              brief_heading + " | Zuse | Konrad | Unknown Suburb | "
                              "Naismith | Ann & Ben, Cid | 12 Long Street, Rear, suburb 1 3000 | 9555 1234");
}

TEST_F(MiscellaneousTest, TheTwoAddressesStandUnderTheirOwnHeadings)
{
    add({naismith()});
    EXPECT_EQ(printed(u"Residential/Postal Report"),
              addresses_heading + " | Naismith | Ann & Ben, Cid | 12 Long Street | Rear | suburb 1 3000 | "
                                  "P.O. Box 7 | suburb 2 3000 | Family Ph: 9555 1234 | Family Email: n@example.org");
}

TEST_F(MiscellaneousTest, AnAddressThatIsHiddenLeavesTheOtherStanding)
{
    auto one = naismith();
    one.address.res_hidden = true;
    add({one});

    EXPECT_EQ(printed(u"k120"), brief_heading + " | Naismith | Ann & Ben, Cid | 9555 1234");
    EXPECT_EQ(printed(u"k121"), addresses_heading + " | Naismith | Ann & Ben, Cid | P.O. Box 7 | suburb 2 3000 | "
                                                    "Family Ph: 9555 1234 | Family Email: n@example.org");
}

TEST_F(MiscellaneousTest, AStateOrACountryAloneIsNoPostalAddress)
{
    auto one = naismith();
    one.address.post_street.clear();
    one.postal.reset();
    one.address.post_state = u"VIC"_s;
    one.address.post_country = u"Australia"_s;
    add({one});
    for (const auto& key : {u"k121"_s, u"k122"_s, u"k137"_s}) {
        const auto all = printed(key);
        EXPECT_EQ(all.find("VIC"), std::string::npos) << all;
        EXPECT_EQ(all.find("Australia"), std::string::npos) << all;
    }
}

TEST_F(MiscellaneousTest, TheHeadingsStandOnEveryPage)
{
    std::vector<people::FamilyFile> families;
    for (int number = 0; number < 90; ++number)
        families.push_back(naismith());
    add(families);
    for (const auto& [key, heading] : {std::pair(u"k120"_s, u"Surname"_s), std::pair(u"k121"_s, u"Contacts"_s)}) {
        report = *output::find_report(key);
        const auto pages = this->pages();
        ASSERT_GT(pages.size(), 2u);
        for (const auto& page : pages)
            EXPECT_EQ(page.count(heading), 1) << key.toStdString();
    }
}

} // namespace kindrel::test
