#include "output/output_fixture.h"
#include "output/reports/group_history_lines.h"
#include "people/family_store.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

struct Stay
{
    int person_id, group_id;
    const char* group; ///< The name it had when it was removed.
    const char* in;
    const char* out;
};

/// Group 9 is no longer in the list of groups.
const std::vector<Stay> stays{
    {2, 3, nullptr, "2020-01-01", "2021-02-03"}, {1, 3, nullptr, "2019-05-06", nullptr},
    {1, 1, nullptr, "2001-01-01", "2002-02-02"}, {1, 9, "Old Choir", "1990-01-01", "1999-09-09"},
    {2, 9, "Old Choir", nullptr, "1999-09-09"},  {1, 3, nullptr, "2010-01-01", "2011-01-01"},
};

void store(core::Session& session)
{
    const auto text = [](const char* words) {
        return core::to_value(QString::fromUtf8(words));
    };
    std::vector<std::vector<core::Value>> rows;
    for (qint64 key = 0; const auto& stay : stays)
        rows.push_back({++key, core::to_value(stay.person_id), core::to_value(stay.group_id), text(stay.group),
                        text(stay.in), text(stay.out), core::to_value(stay.out != nullptr)});
    session.insert(
        u"tbl_group_history"_s,
        {u"history_id"_s, u"person_id"_s, u"group_id"_s, u"group"_s, u"date_in"_s, u"date_out"_s, u"completed"_s},
        rows);
}

class GroupHistoryReportTest : public ReportTest
{
protected:
    [[nodiscard]] std::string lines(const char* key)
    {
        office.settings.title_church = office.settings.title_date = office.settings.title_filters = false;
        report = *output::find_report(QString::fromLatin1(key));
        return texts().sliced(3).join(u" | "_s).toStdString();
    }
};

class GroupHistoryLinesTest : public EngineTest
{
};
KINDREL_ON_BOTH_ENGINES(GroupHistoryLinesTest);

} // namespace

TEST_F(GroupHistoryReportTest, PeopleComeInTheListsOrderWithTheirGroupsByTheDayOfJoining)
{
    add({family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s, u"Cid"_s})});
    store(*office.session);
    std::swap(list.members[0], list.members[1]);

    EXPECT_EQ(lines("k110"), "Name | Group | Date In | Date Out | "
                             "Naismith, Ben | Old Choir | 09/09/1999 | group 3 | 01/01/2020 | 03/02/2021 | "
                             "Naismith, Ann | Old Choir | 01/01/1990 | 09/09/1999 | "
                             "group 1 | 01/01/2001 | 02/02/2002 | group 3 | 01/01/2010 | 01/01/2011 | "
                             "group 3 | 06/05/2019");
}

TEST_F(GroupHistoryReportTest, GroupsComeInTheOrderOfTheirListAndThoseRemovedFromItLast)
{
    add({family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s, u"Cid"_s})});
    store(*office.session);
    office.session->execute(u"UPDATE [tbl_group_setup] SET [position]=0 WHERE [group_id]=3;"_s);
    const std::string head = "Surname | Name | Date In | Date Out | ";

    EXPECT_EQ(lines("k111"), "group 3 | " + head +
                                 "Naismith | Ann | 01/01/2010 | 01/01/2011 | Naismith | Ann | 06/05/2019 | "
                                 "Naismith | Ben | 01/01/2020 | 03/02/2021 | group 1 | " +
                                 head + "Naismith | Ann | 01/01/2001 | 02/02/2002 | Old Choir | " + head +
                                 "Naismith | Ann | 01/01/1990 | 09/09/1999 | Naismith | Ben | 09/09/1999");
}

TEST_F(GroupHistoryReportTest, OnlyTheListsPeopleAreToldAndByTheNamesTheyMayBearInPrint)
{
    office.settings.use_preferred_names = true;
    auto one = family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s});
    one.people[0].preferred_name = u"Nan"_s;
    one.people[0].Preferred_Name_hidden = true;
    one.people[1].preferred_name = u"Benny"_s;
    add({one});
    store(*office.session);

    const auto both = lines("k111");
    EXPECT_NE(both.find("Naismith | Ann"), std::string::npos) << both;
    EXPECT_NE(both.find("Naismith | Benny"), std::string::npos) << both;
    EXPECT_EQ(both.find("Nan"), std::string::npos) << both;
    list.members.erase(list.members.begin());
    EXPECT_EQ(lines("k110"), "Name | Group | Date In | Date Out | Naismith, Benny | Old Choir | 09/09/1999 | "
                             "group 3 | 01/01/2020 | 03/02/2021");
}

TEST_F(GroupHistoryReportTest, WithoutASurnameTheNameStandsWithoutAComma)
{
    add({family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s})});
    store(*office.session);
    office.session->execute(u"UPDATE [tbl_surname] SET [surname]='';"_s);
    list.members.erase(list.members.begin());

    EXPECT_EQ(lines("k110"), "Name | Group | Date In | Date Out | Ben | Old Choir | 09/09/1999 | "
                             "group 3 | 01/01/2020 | 03/02/2021");
}

TEST_F(GroupHistoryReportTest, WithoutHistoryThePageSaysSo)
{
    add({family(u"Abel"_s, {u"Niels"_s})});

    EXPECT_EQ(lines("k110"), "There is no group history of these people");
    EXPECT_EQ(lines("k111"), "There is no group history of these people");
}

TEST_F(GroupHistoryReportTest, ThePersonWhoseEntriesWouldBePartedBeginsTheNextPage)
{
    std::vector<people::FamilyFile> families;
    for (int number = 0; number < 30; ++number)
        families.push_back(family(u"Abel"_s, {u"Niels%1x"_s.arg(number)}));
    add(families);
    std::vector<std::vector<core::Value>> rows;
    for (qint64 key = 1; key <= 120; ++key)
        rows.push_back({key, (key - 1) / 4 + 1, qint64{1 + key % 3}, qint64{0}});
    office.session->insert(u"tbl_group_history"_s, {u"history_id"_s, u"person_id"_s, u"group_id"_s, u"completed"_s},
                           rows);
    report = *output::find_report(u"k110");

    const auto pages = this->pages();

    ASSERT_GT(pages.size(), 1u);
    for (const auto& page : pages)
        EXPECT_EQ(page.filter(u"group "_s).size(), 4 * page.filter(u"Abel, "_s).size());
}

TEST_P(GroupHistoryLinesTest, EntriesWithoutADayOfJoiningComeFirst)
{
    add_setup_items(session());
    people::WorkingList list;
    const auto stored =
        people::save_family(session(), family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s, u"Cid"_s}), QDate(2026, 11, 22));
    for (const auto& person : stored.people)
        list.members.insert(list.members.begin(), {person.person_id, stored.family.Surname_ID});
    store(session());
    const auto told = [&](output::HistoryOrder order) {
        QStringList lines;
        for (const auto& line : output::read_history_lines(session(), list, order))
            lines += QString::number(line.member.person_id) + u' ' + line.group + u' ' +
                     (line.date_in ? line.date_in->stored().first(4) : u"-"_s);
        return lines.join(u", "_s);
    };

    EXPECT_EQ(told(output::HistoryOrder::people), u"2 Old Choir -, 2 group 3 2020, 1 Old Choir 1990, 1 group 1 2001, "
                                                  "1 group 3 2010, 1 group 3 2019"_s);
    EXPECT_EQ(told(output::HistoryOrder::groups), u"1 group 1 2001, 2 group 3 2020, 1 group 3 2010, 1 group 3 2019, "
                                                  "2 Old Choir -, 1 Old Choir 1990"_s);
}

} // namespace kindrel::test
