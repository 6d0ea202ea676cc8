#include "people/family_store.h"
#include "people/group_history.h"
#include "support/families.h"
#include "support/processes.h"
#include "support/test_church.h"

#include <random>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;
using core::Date;

namespace {

const QDate today(2026, 11, 22);

std::string told(const FamilyFile& file)
{
    return u"%1 with %2 people, edited %3"_s.arg(file.family.surname)
        .arg(file.people.size())
        .arg(file.family.last_edit.value_or(Date{}).stored())
        .toStdString();
}

} // namespace

class FamilyStoreTest : public EngineTest
{
protected:
    void SetUp() override
    {
        EngineTest::SetUp();
        if (church)
            add_setup_items(session());
    }
    [[nodiscard]] FamilyFile stored(const FamilyFile& file)
    {
        const auto found = load_family(session(), file.family.Surname_ID);
        EXPECT_TRUE(found);
        return found.value_or(FamilyFile{});
    }
};
KINDREL_ON_BOTH_ENGINES(FamilyStoreTest);

TEST_P(FamilyStoreTest, EverythingThatIsSavedIsLoadedAgain)
{
    for (const bool hidden : {false, true}) {
        session().execute(u"DELETE FROM [tbl_pin];"_s);
        const auto saved = save_family(session(), full_family(hidden), today);
        EXPECT_EQ(stored(saved), saved);
        EXPECT_EQ(saved.family.last_edit, Date::from(today));
        EXPECT_EQ(saved.family.created, (Date{1999, 12, 31})) << "A known day of creation was replaced.";
    }
}

TEST_P(FamilyStoreTest, AChangedFamilyIsStoredAsItIsAndLeavesNoRemains)
{
    auto file = save_family(session(), full_family(false), today);
    const int gone = file.people[1].person_id;
    file.family.surname = u"Smith"_s;
    file.people.erase(file.people.begin() + 1);
    std::swap(file.people[0], file.people[1]);
    file.people[0].groups.clear();
    file.people[1].status = {file.people[1].status[1]};
    file.people.push_back(person(u"New"_s, 6));
    file.postal.reset();
    file.events.pop_back();

    const auto saved = save_family(session(), file, QDate(2026, 12, 1));

    EXPECT_EQ(stored(saved), saved);
    EXPECT_EQ(saved.family.Primary_name, u"Kid"_s);
    EXPECT_EQ(saved.people[2].position, 3);
    for (const auto* table : {"tbl_people", "tbl_personal_details", "tbl_status", "tbl_group", "tbl_flexi", "tbl_pin",
                              "tbl_group_history"}) {
        EXPECT_EQ(
            number_of(session(),
                      u"SELECT COUNT(*) FROM [%1] WHERE [person_id]=%2;"_s.arg(QString::fromLatin1(table)).arg(gone)),
            0)
            << table;
    }
}

TEST_P(FamilyStoreTest, JoiningAndLeavingAGroupIsWrittenIntoItsHistory)
{
    auto file = save_family(session(), full_family(false), today);
    auto& groups = file.people[0].groups;
    groups.erase(groups.begin());
    groups.push_back({2, {}, 0, {}, {}, false});
    const QDate later(2026, 12, 1);

    file = save_family(session(), file, later);
    file = save_family(session(), file, QDate(2026, 12, 25));

    QStringList history;
    for (const auto& entry : read_group_history(session(), file.family.Surname_ID)) {
        if (entry.person_id == file.people[0].person_id)
            history += u"%1 %2 %3 %4"_s.arg(entry.group, entry.date_in.value_or(Date{}).stored(),
                                            entry.date_out.value_or(Date{}).stored(),
                                            entry.completed ? u"left"_s : u"there"_s);
    }
    history.sort();
    EXPECT_EQ(history, (QStringList{u"group 1 2026-11-22  there"_s, u"group 2 2026-12-01  there"_s,
                                    u"group 3 2026-11-22 2026-12-01 left"_s}));
}

TEST_P(FamilyStoreTest, ManyFamiliesComeInTheOrderAskedForAndMissingOnesAreLeftOut)
{
    std::vector<FamilyFile> files;
    for (int number = 0; number < 30; ++number)
        files.push_back(number % 2 ? full_family(false) : family(u"Family %1"_s.arg(number), {u"A"_s, u"B"_s}));
    for (auto& file : files) {
        for (auto& member : file.people)
            member.personal_pin.clear();
    }
    add_families(session(), files, today);
    std::vector<int> keys{9999};
    for (auto file = files.rbegin(); file != files.rend(); ++file)
        keys.push_back(file->family.Surname_ID);
    keys.push_back(keys[1]);

    const auto loaded = load_families(session(), keys);

    ASSERT_EQ(loaded.size(), files.size());
    for (std::size_t i = 0; i < loaded.size(); ++i)
        EXPECT_EQ(loaded[i], files[files.size() - 1 - i]) << told(loaded[i]);
}

TEST_P(FamilyStoreTest, ASaveThatFailsWritesNothing)
{
    const auto before = save_family(session(), full_family(false), today);
    auto other = family(u"Other"_s, {u"Ann"_s});
    other.people[0].personal_pin = u"77"_s;
    (void)save_family(session(), other, today);
    auto clash = before;
    clash.family.surname = u"Changed"_s;
    clash.people[0].personal_pin = u"77"_s;

    EXPECT_THROW((void)save_family(session(), clash, QDate(2027, 1, 1)), core::DatabaseError);

    EXPECT_EQ(stored(before), before);
}

TEST_P(FamilyStoreTest, AFamilyThatIsGoneIsNotBroughtBackByASave)
{
    const auto file = save_family(session(), family(u"Gone"_s, {u"Ann"_s}), today);
    session().execute(u"DELETE FROM [tbl_surname];"_s);
    session().execute(u"DELETE FROM [tbl_people];"_s);

    EXPECT_THROW((void)save_family(session(), file, today), core::DatabaseError);

    EXPECT_FALSE(load_family(session(), file.family.Surname_ID));
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_people];"_s), 0);
}

TEST_P(FamilyStoreTest, ASaveKilledAtAnyMomentLeavesTheOldOrTheNewFamily)
{
    const auto old_file = save_family(session(), full_family(false), today);
    auto new_file = old_file;
    new_file.family.surname = u"New"_s;
    new_file.people.pop_back();
    new_file.people[0].groups.clear();
    new_file.events.clear();
    new_file = save_family(session(), new_file, today);
    church->close();
    std::mt19937 random(20261122);
    for (int round = 0; round < 40; ++round) {
        run_and_kill(
            [&](const Ready& ready) {
                const auto own = church->another();
                ready();
                for (;;) {
                    (void)save_family(*own, old_file, today);
                    (void)save_family(*own, new_file, today);
                }
            },
            std::chrono::microseconds(random() % 30000));
        church->reopen();
        auto found = stored(old_file);
        // The dropped child comes back under the key it had.
        EXPECT_TRUE(found == old_file || found == new_file) << told(found);
        church->close();
    }
    church->reopen();
}

} // namespace kindrel::test
