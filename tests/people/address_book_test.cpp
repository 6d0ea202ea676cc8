#include "people/address_book.h"
#include "people/family_store.h"
#include "people/working_list.h"
#include "support/families.h"
#include "support/test_church.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;

class AddressBookTest : public EngineTest
{
protected:
    void add(const QString& surname, FileStatus status, const std::function<void(FamilyFile&)>& change = {})
    {
        auto file = family(surname, {u"Ann"_s, u"Ben"_s});
        file.family.Condition = status;
        file.people[0].preferred_name = u"Nan"_s;
        file.address.phone = u"555"_s;
        file.address.res_street = u"1 High St"_s;
        if (change)
            change(file);
        (void)save_family(session(), file, QDate(2026, 11, 22));
    }
    [[nodiscard]] QStringList surnames(FamilyList list)
    {
        QStringList found;
        for (const auto& entry : read_address_book(session(), list, false))
            found += entry.surname;
        return found;
    }
};
KINDREL_ON_BOTH_ENGINES(AddressBookTest);

TEST_P(AddressBookTest, EachListHoldsItsFamiliesBySurnameWithoutAccents)
{
    add(u"Zebra"_s, FileStatus::active);
    add(u"Žak"_s, FileStatus::active);
    add(u"adams"_s, FileStatus::active);
    add(u"Private"_s, FileStatus::privacy);
    add(u"Hopeful"_s, FileStatus::prospect);
    add(u"Former"_s, FileStatus::archive);
    add(u"Lent"_s, FileStatus::active, [](FamilyFile& file) { file.family.booked_out = true; });
    add(u"Returned"_s, FileStatus::active, [](FamilyFile& file) { file.family.active_in_book = true; });

    EXPECT_EQ(surnames(FamilyList::active), (QStringList{u"adams"_s, u"Lent"_s, u"Returned"_s, u"Žak"_s, u"Zebra"_s}));
    EXPECT_EQ(surnames(FamilyList::privacy), QStringList{u"Private"_s});
    EXPECT_EQ(surnames(FamilyList::active_and_privacy).size(), 6);
    EXPECT_EQ(surnames(FamilyList::prospect), QStringList{u"Hopeful"_s});
    EXPECT_EQ(surnames(FamilyList::archive), QStringList{u"Former"_s});
    EXPECT_EQ(surnames(FamilyList::booked_out), QStringList{u"Lent"_s});
    EXPECT_EQ(surnames(FamilyList::booked_in), QStringList{u"Returned"_s});
    EXPECT_EQ(surnames(FamilyList::all).size(), 8);
}

TEST_P(AddressBookTest, ADeadPrimaryGivesWayToTheFirstLivingPerson)
{
    add(u"Half"_s, FileStatus::active, [](FamilyFile& file) { file.people[0].Decease = true; });
    add(u"Nobody"_s, FileStatus::active, [](FamilyFile& file) {
        for (auto& dead : file.people)
            dead.Decease = true;
    });

    const auto active = read_address_book(session(), FamilyList::active, true);
    ASSERT_EQ(active.size(), 1U);
    EXPECT_EQ(active[0].name, u"Ben"_s);
    const auto everybody = read_address_book(session(), FamilyList::all, true);
    ASSERT_EQ(everybody.size(), 2U);
    EXPECT_EQ(everybody[0].name, u"Nan"_s);
}

TEST_P(AddressBookTest, HiddenAddressAndPhoneStayOutOfTheList)
{
    add(u"Open"_s, FileStatus::active);
    add(u"Shut"_s, FileStatus::active,
        [](FamilyFile& file) { file.address.res_hidden = file.address.phone_hidden = true; });

    const auto list = read_address_book(session(), FamilyList::active, false);
    ASSERT_EQ(list.size(), 2U);
    EXPECT_EQ(list[0].phone + list[0].street, u"5551 High St"_s);
    EXPECT_EQ(list[1].phone + list[1].street, QString());
}

TEST_P(AddressBookTest, AFamilyGroupNarrowsEachOfTheLists)
{
    add_setup_items(session());
    for (const bool in_group : {false, true}) {
        const auto carry = [in_group](FamilyFile& file) {
            file.family_groups.resize(in_group ? 2 : 1);
            for (int item = 0; LinkRow & row : file.family_groups)
                row.item = ++item;
        };
        const QString mark = in_group ? u"in"_s : u"out"_s;
        for (const auto status : {FileStatus::active, FileStatus::privacy, FileStatus::prospect, FileStatus::archive})
            add(mark, status, carry);
        add(mark, FileStatus::active, [&](FamilyFile& file) {
            carry(file);
            file.family.booked_out = file.family.active_in_book = true;
        });
    }
    for (int list = 0; list < family_list_count; ++list) {
        const auto whole = read_address_book(session(), FamilyList(list), false).size();
        const auto narrowed = read_address_book(session(), FamilyList(list), false, 2);
        EXPECT_EQ(narrowed.size() * 2, whole) << list;
        ASSERT_FALSE(narrowed.empty()) << list;
        EXPECT_TRUE(std::ranges::all_of(narrowed, [](const auto& entry) { return entry.surname == u"in"_s; })) << list;
        EXPECT_TRUE(read_address_book(session(), FamilyList(list), false, 3).empty()) << list;
    }
}

TEST_P(AddressBookTest, TotalsCountFamiliesWhoeverLives)
{
    EXPECT_EQ(family_totals(session()).front().count, 0);
    add(u"Alive"_s, FileStatus::active);
    add(u"Private"_s, FileStatus::privacy);
    add(u"Dead"_s, FileStatus::active, [](FamilyFile& file) {
        for (auto& dead : file.people)
            dead.Decease = true;
    });

    QStringList totals;
    for (const auto& total : family_totals(session()))
        totals += u"%1 %2"_s.arg(total.caption).arg(total.count);
    EXPECT_EQ(totals,
              (QStringList{u"Family File Total = 3"_s, u"Active Families 2"_s, u"Prospect Families 0"_s,
                           u"Archive Families 0"_s, u"Privacy Request by Family 1"_s, u"Active & Privacy Requested 3"_s,
                           u"Families Booked Out 0"_s, u"Families Booked In 0"_s}));
}

TEST_P(AddressBookTest, AWorkingListKeepsItsOrderWhenLent)
{
    const WorkingList list{{{30, 3}, {10, 1}, {31, 3}}, {}};
    EXPECT_EQ(list.families(), (std::vector<int>{3, 1}));

    lend(session(), list);

    EXPECT_EQ(number_of(session(), u"SELECT [person_id] FROM [work_people] WHERE [place]=2;"_s), 10);
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [work_people];"_s), 3);
}

} // namespace kindrel::test
