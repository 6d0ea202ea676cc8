#include "output/output_fixture.h"
#include "output/reports/group_heads.h"
#include "output/reports/item_sections.h"
#include "people/family_store.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

people::LinkRow carried(int item, int type = 0)
{
    return {item, {}, type, {}, {}, false};
}

constexpr int active = static_cast<int>(people::MinistryState::active);
constexpr int potential = static_cast<int>(people::MinistryState::potential);

/// Ann and Ben, who carry the first and the third item of each list; Cid carries nothing.
people::FamilyFile naismith()
{
    auto made = family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s, u"Cid"_s});
    made.people[0].status = {carried(3), carried(1)};
    made.people[1].status = {carried(3)};
    made.people[0].ministries = {carried(1, potential), carried(3, active)};
    made.people[1].ministries = {carried(1, active), carried(1, potential)};
    made.people[0].groups = {carried(3)};
    made.people[1].groups = {carried(3), carried(1)};
    made.family_groups = {carried(3), carried(1)};
    return made;
}

people::FamilyFile abel()
{
    auto made = family(u"Abel"_s, {u"Niels"_s});
    made.people[0].status = {carried(3)};
    made.people[0].ministries = {carried(3, active)};
    made.people[0].groups = {carried(3)};
    made.family_groups = {carried(3)};
    return made;
}

class GroupReportTest : public ReportTest
{
protected:
    /// The pages' texts without those of head and foot.
    [[nodiscard]] QStringList page_lines(const char* key)
    {
        office.settings.title_church = office.settings.title_date = office.settings.title_filters = false;
        report = *output::find_report(QString::fromLatin1(key));
        QStringList lines;
        for (const auto& page : pages())
            lines += page.sliced(3).join(u" | "_s);
        return lines;
    }
    [[nodiscard]] std::string lines(const char* key) { return page_lines(key).join(u" || "_s).toStdString(); }
    /// Names, and nothing of what full_family() hides nor of what a group's details hold of its leaders.
    void expect_bare_pages()
    {
        for (const auto* key : {"k100", "k101", "k102", "k103", "k104"}) {
            const auto text = page_lines(key).join(u' ');
            EXPECT_TRUE(text.contains(u"Żółć-O’Brien, Zoë"_s)) << key;
            for (const auto& word : {u"1977"_s, u"mobile"_s, u"email"_s, u"addressphone"_s, u"street"_s, u"business"_s,
                                     u"suburb"_s, u"111"_s, u"222"_s, u"Hall St"_s})
                EXPECT_FALSE(text.contains(word)) << key << ' ' << word.toStdString();
        }
    }
    void save_details(const people::GroupDetails& details) { ASSERT_TRUE(people::save_group_details(office, details)); }
};

people::GroupDetails details_of_group(int key)
{
    people::GroupDetails details;
    details.group_id = key;
    details.Day = u"Tuesday"_s;
    details.Time = u"7:30"_s;
    details.Address = u"1 Hall St"_s;
    details.leader = u"Lee"_s;
    details.leader_phone = u"111"_s;
    details.host = u"Hal"_s;
    details.host_phone = u"222"_s;
    details.comments = u"Bring tea"_s;
    return details;
}

class ItemSectionsTest : public EngineTest
{
};
KINDREL_ON_BOTH_ENGINES(ItemSectionsTest);

} // namespace

TEST_F(GroupReportTest, EachItemListsItsPeopleOrFamiliesInTheOrderOfTheSetupList)
{
    add({naismith(), abel()});

    struct Case
    {
        const char* key;
        const char* lines;
    };
    for (const auto& [key, expected] : std::vector<Case>{
             {"k90", "status 1 - 1 | Naismith  Ann | status 3 - 3 | Naismith  Ann | Naismith  Ben | Abel  Niels"},
             {"k91", "ministry 1 (Active) - 1 | Naismith  Ben | ministry 1 (Potential) - 2 | Naismith  Ann | "
                     "Naismith  Ben | ministry 3 (Active) - 2 | Naismith  Ann | Abel  Niels"},
             {"k92", "family_group 1 - 1 | Naismith  Ann & Ben, Cid | family_group 3 - 2 | "
                     "Naismith  Ann & Ben, Cid | Abel  Niels"},
         })
        EXPECT_EQ(lines(key), expected) << key;
}

TEST_F(GroupReportTest, TheSetupListsOrderIsThatOfItsPositionsAndThePeoplesThatOfTheList)
{
    add({naismith(), abel()});
    office.session->execute(u"UPDATE [tbl_status_setup] SET [position]=0 WHERE [status_id]=3;"_s);
    std::swap(list.members.front(), list.members.back());

    EXPECT_EQ(lines("k90"),
              "status 3 - 3 | Abel  Niels | Naismith  Ben | Naismith  Ann | status 1 - 1 | Naismith  Ann");
    EXPECT_EQ(lines("k92"), "family_group 1 - 1 | Naismith  Ann & Ben, Cid | family_group 3 - 2 | Abel  Niels | "
                            "Naismith  Ann & Ben, Cid");
}

TEST_F(GroupReportTest, OnlyPeopleOfTheListCount)
{
    add({naismith(), abel()});
    list.members.erase(list.members.begin());

    EXPECT_EQ(lines("k90"), "status 3 - 2 | Naismith  Ben | Abel  Niels");
}

TEST_F(GroupReportTest, WithoutAnyThePageSaysSo)
{
    add({family(u"Abel"_s, {u"Niels"_s})});

    EXPECT_EQ(lines("k90"), "Nobody has a status");
    EXPECT_EQ(lines("k91"), "Nobody has a ministry");
    EXPECT_EQ(lines("k92"), "No family is in a family group");
    for (const auto* key : {"k100", "k101", "k102", "k103", "k104"})
        EXPECT_EQ(lines(key), "There are no groups among these people");
}

TEST_F(GroupReportTest, EachGroupHasAPageWithItsHeadAndItsMembers)
{
    auto one = abel();
    one.address.phone = u"9555 1234"_s;
    one.address.res_street = u"12 Long Street"_s;
    auto& niels = one.people.front();
    niels.birthdate = core::Date{core::Date::unknown_year, 3, 12};
    niels.mobile_phone = u"0400 1"_s;
    niels.Personal_email = u"niels@example.org"_s;
    niels.middle_name = u"Henrik"_s;
    niels.groups = {carried(1), carried(3)};
    add({one});
    save_details(details_of_group(3));
    const QString head = u"Name | Address | Phone | Mobile | Email | Birth Date | "_s;
    const QString table = head + u"Abel, Niels | 12 Long Street, Unknown Suburb | 9555 1234 | 0400 1 | "
                                 "niels@example.org | 12/03/XXXX"_s;
    const auto card = u"Abel, Niels | 12 Long Street | Unknown Suburb | Family Ph: 9555 1234 | Mobile: 0400 1 | "
                      "Email: niels@example.org | Birth Date: 12/03/XXXX"_s;
    const auto personal = u"Family Ph: 9555 1234 | Birth Date: 12/03/XXXX | Middle Name: Henrik | Mobile: 0400 1 | "
                          "Email: niels@example.org"_s;
    const auto leader = u"Leader: Lee   Leader Phone: 111 | "_s;
    const auto meeting = u"Day: Tuesday   Time: 7:30 | Address: 1 Hall St | "_s;
    const auto rest = u"Host: Hal   Host Phone: 222 | Comments: Bring tea | "_s;

    struct Case
    {
        const char* key;
        QString head, members;
    };
    for (const auto& one_case : std::vector<Case>{
             {"k100", leader, table},
             {"k101", leader, card},
             {"k102", meeting + leader + rest, table},
             {"k103", meeting,
              u"Name | Address | Contacts | Abel, Niels | 12 Long Street | Unknown Suburb | "_s + personal},
             {"k104", meeting, u"Abel, Niels | 12 Long Street | Unknown Suburb | "_s + personal},
         })
        EXPECT_EQ(page_lines(one_case.key), QStringList({u"group 1 - 1 | "_s + one_case.members,
                                                         u"group 3 - 1 | "_s + one_case.head + one_case.members}))
            << one_case.key << lines(one_case.key);
}

TEST_F(GroupReportTest, WhatIsHiddenOrWithheldIsNotOnTheGroupsPages)
{
    for (const bool hidden : {true, false}) {
        list.members.clear();
        auto one = full_family(hidden);
        for (auto& person : one.people) {
            person.personal_pin.clear();
            if (!hidden)
                person.other_surname.clear();
        }
        add({one});
        if (!hidden) {
            options.withheld.set();
            save_details(details_of_group(3));
        }
        expect_bare_pages();
    }
}

TEST_F(GroupReportTest, AGroupThatNoLongerMeetsHasNoPage)
{
    add({naismith()});
    office.session->execute(u"UPDATE [tbl_group_setup] SET [not_active]=-1 WHERE [group_id]=3;"_s);

    const auto pages = page_lines("k101");

    ASSERT_EQ(pages.size(), 1);
    EXPECT_TRUE(pages.front().startsWith(u"group 1 - 1 | Naismith, Ben"_s));
}

TEST_F(GroupReportTest, ALongGroupRunsOnUnderItsNameAndLosesNobody)
{
    std::vector<people::FamilyFile> families;
    for (int number = 0; number < 121; ++number) {
        auto one = family(u"Abel"_s, {u"Niels%1x"_s.arg(number)});
        one.people.front().groups = {carried(2), carried(3)};
        families.push_back(one);
    }
    add(families);

    for (const auto* key : {"k100", "k101"}) {
        const auto pages = page_lines(key);
        const auto all = pages.join(u' ');
        for (int number = 0; number < 121; ++number)
            EXPECT_EQ(all.count(u"Niels%1x"_s.arg(number)), 2) << key << number;
        EXPECT_EQ(pages.filter(u"group 2 - 121"_s).size() * 2, pages.size()) << key;
        EXPECT_TRUE(pages.at(1).startsWith(u"group 2 - 121 (continued)"_s)) << key;
    }
}

TEST_P(ItemSectionsTest, SectionsComeInTheListsOrderWithEachCarrierOnce)
{
    add_setup_items(session());
    people::WorkingList list;
    for (const auto& file : {naismith(), abel()}) {
        const auto stored = people::save_family(session(), file, QDate(2026, 11, 22));
        for (const auto& person : stored.people)
            list.members.insert(list.members.begin(), {person.person_id, stored.family.Surname_ID});
    }
    const auto told = [&](people::SetupKind kind) {
        QStringList sections;
        for (const auto& section : output::read_item_sections(session(), list, kind)) {
            QStringList members;
            for (const auto& member : section.members)
                members += QString::number(member.surname_id) + u'/' + QString::number(member.person_id);
            sections += output::title_of(section) + u": "_s + members.join(u' ');
        }
        return sections;
    };

    EXPECT_EQ(told(people::SetupKind::status), QStringList({u"status 1 - 1: 1/1"_s, u"status 3 - 3: 2/4 1/2 1/1"_s}));
    EXPECT_EQ(told(people::SetupKind::ministries),
              QStringList({u"ministry 1 (Active) - 1: 1/2"_s, u"ministry 1 (Potential) - 2: 1/2 1/1"_s,
                           u"ministry 3 (Active) - 2: 2/4 1/1"_s}));
    EXPECT_EQ(told(people::SetupKind::family_groups),
              QStringList({u"family_group 1 - 1: 1/1"_s, u"family_group 3 - 2: 2/4 1/1"_s}));
}

TEST_P(ItemSectionsTest, TheDetailsOfAllGroupsAreReadByTheirKeys)
{
    session().execute(u"INSERT INTO [tbl_group_details] ([group_id],[leader],[Day]) VALUES (7,'Lee','Friday');"_s);
    session().execute(u"INSERT INTO [tbl_group_details] ([group_id],[host]) VALUES (9,'Hal');"_s);

    const auto details = output::read_group_details(session());

    EXPECT_EQ(details.size(), 2);
    EXPECT_EQ(details.value(7).leader + details.value(7).Day, u"LeeFriday"_s);
    EXPECT_EQ(details.value(9).host, u"Hal"_s);
}

} // namespace kindrel::test
