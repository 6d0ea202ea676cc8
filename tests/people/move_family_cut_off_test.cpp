#include "core/locks.h"
#include "core/removal.h"
#include "move_fixture.h"
#include "support/processes.h"

#include <random>

#include <unistd.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;

namespace {

/// What a cut in the power does to the program.
struct CutOff
{
};

MoveWatch cut_off_behind(MoveStep last)
{
    return [last](MoveStep step) {
        if (step == last)
            throw CutOff{};
    };
}

class MoveFamilyCutOffTest : public MoveTest
{
protected:
    void move_and_cut_off(const FamilyFile& file, MoveStep last)
    {
        EXPECT_THROW((void)churches->move(file, cut_off_behind(last)), CutOff);
        churches->close();
        churches->reopen();
    }
    [[nodiscard]] bool is_here(const FamilyFile& file)
    {
        return load_family(churches->here(), file.family.Surname_ID).has_value();
    }
    /// One whole family there with this surname, and nothing of any other.
    void expect_alone_there(const QString& surname, std::initializer_list<QString> names)
    {
        const auto key = number_of(churches->there(), u"SELECT [Surname_ID] FROM [tbl_surname];"_s);
        const auto file = load_family(churches->there(), static_cast<int>(key));
        ASSERT_TRUE(file);
        EXPECT_EQ(file->family.surname, surname);
        QStringList found;
        for (const auto& person : file->people)
            found += person.Name;
        EXPECT_EQ(found, QStringList(names));
        EXPECT_EQ(churches->families_there(), 1);
        EXPECT_EQ(number_of(churches->there(), u"SELECT COUNT(*) FROM [tbl_people];"_s), found.size());
        EXPECT_EQ(churches->files(2), TwoChurches::files_of(file->family.Surname_ID, file->people[0].person_id));
        EXPECT_EQ(churches->notes(), 0);
    }
};

} // namespace

KINDREL_ON_ALL_PAIRS_OF_ENGINES(MoveFamilyCutOffTest);

TEST_P(MoveFamilyCutOffTest, ASecondTryMendsTheFirstWhereverItWasCutOff)
{
    for (int step = 0; step < move_steps - 1; ++step) {
        SCOPED_TRACE(step);
        const auto last = static_cast<MoveStep>(step);
        const auto file = churches->add(full_family(false));
        const int first = file.people.front().person_id;
        move_and_cut_off(file, last);
        EXPECT_EQ(is_here(file), last < MoveStep::departed);
        EXPECT_EQ(churches->families_there(), last < MoveStep::arrived ? 0 : 1);

        if (is_here(file)) {
            churches->lay(1, portrait_of_person(first), "a newer one");
            churches->here().execute(u"UPDATE [tbl_surname] SET [surname]='Newly' WHERE [Surname_ID]=?;"_s,
                                     file.family.Surname_ID);
            auto newly = file;
            newly.family.surname = u"Newly"_s;
            EXPECT_TRUE(churches->move(newly));
        } else {
            EXPECT_TRUE(churches->move_without_question(file));
        }

        EXPECT_FALSE(is_here(file));
        EXPECT_EQ(churches->files(1), QStringList());
        const bool renewed = last < MoveStep::departed;
        expect_alone_there(renewed ? u"Newly"_s : file.family.surname, {u"Zoë"_s, u"Stanisław"_s, u"Kid"_s});
        EXPECT_EQ(number_of(churches->there(), u"SELECT COUNT(*) FROM [tbl_pin];"_s), 3);
        EXPECT_EQ(number_of(churches->there(), u"SELECT COUNT(*) FROM [tbl_group_history];"_s), 6);
        const auto key = static_cast<int>(number_of(churches->there(), u"SELECT [Surname_ID] FROM [tbl_surname];"_s));
        const auto arrived = load_family(churches->there(), key);
        EXPECT_EQ(churches->content(2, portrait_of_person(arrived->people[0].person_id)),
                  renewed ? "a newer one" : "photograph");
        EXPECT_EQ(key, 41 + step) << "The second try used up other keys.";
        // The next step begins with empty hands.
        core::remove_entities(churches->there(), core::Entity::surname, std::array{key});
        for (const auto& own : {portrait_of_family(key), portrait_of_person(arrived->people[0].person_id),
                                notebook_of_person(arrived->people[0].person_id)})
            remove_files(churches->paths(2), {own});
    }
}

TEST_P(MoveFamilyCutOffTest, PeopleWhoLeaveOrJoinBetweenTwoTriesAreNotMixedUp)
{
    auto file = churches->add(family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s, u"Cleo"_s}));
    const auto other = churches->add(family(u"Other"_s, {u"Dan"_s}));
    const int ben = file.people[1].person_id;
    churches->lay(1, portrait_of_person(ben), "Ben");
    move_and_cut_off(file, MoveStep::arrived);
    churches->here().execute(u"UPDATE [tbl_people] SET [Surname_ID]=?,[position]=2 WHERE [person_id]=?;"_s,
                             other.family.Surname_ID, ben);
    file.people.erase(file.people.begin() + 1);
    file.people.push_back(person(u"Eve"_s, 5));
    file = save_family(churches->here(), file, churches->clock.today());

    EXPECT_TRUE(churches->move(file));

    expect_alone_there(u"Naismith"_s, {u"Ann"_s, u"Cleo"_s, u"Eve"_s});
    EXPECT_EQ(load_family(churches->here(), other.family.Surname_ID)->people.size(), 2);
    EXPECT_EQ(churches->content(1, portrait_of_person(ben)), "Ben") << "A photograph of somebody who stayed is gone.";
}

TEST_P(MoveFamilyCutOffTest, TheNextMoveClearsUpBehindAFamilyThatWasDeletedMeanwhile)
{
    const auto file = churches->add(family(u"Naismith"_s, {u"Ann"_s}));
    move_and_cut_off(file, MoveStep::files_copied);
    EXPECT_FALSE(churches->files(2).isEmpty());
    core::remove_entities(churches->here(), core::Entity::surname, std::array{file.family.Surname_ID});

    EXPECT_TRUE(churches->move(churches->add(family(u"Other"_s, {u"Dan"_s}))));

    expect_alone_there(u"Other"_s, {u"Dan"_s});
    EXPECT_EQ(churches->files(1), QStringList());
}

TEST_P(MoveFamilyCutOffTest, AFamilyThatIsChangedDuringTheMoveStays)
{
    const auto file = churches->add(family(u"Naismith"_s, {u"Ann"_s}));
    const auto change = [&](MoveStep step) {
        if (step == MoveStep::arrived)
            churches->connect(1)->execute(u"UPDATE [tbl_address] SET [phone]='555' WHERE [surname_id]=?;"_s,
                                          file.family.Surname_ID);
    };
    churches->dialogue.expect_confirm(TwoChurches::question(file), core::Answer::yes);
    churches->dialogue.expect_box(u"The Naismith family stays here for now, as another user changed it meanwhile"_s);
    EXPECT_FALSE(churches->move_without_question(file, change));
    EXPECT_TRUE(is_here(file));

    EXPECT_TRUE(churches->move(file));

    expect_alone_there(u"Naismith"_s, {u"Ann"_s});
    EXPECT_EQ(load_family(churches->there(), 41)->address.phone, u"555"_s);
}

TEST_P(MoveFamilyCutOffTest, WhatAnEarlierTryBroughtIsNotTakenFromSomebodyWhoWorksOnIt)
{
    const auto file = churches->add(family(u"Naismith"_s, {u"Ann"_s}));
    move_and_cut_off(file, MoveStep::arrived);
    FakeWorkstation other;
    other.machine = u"office-2"_s;
    core::Locks locks(churches->there(), other, churches->clock);
    ASSERT_TRUE(locks.take(core::LockKind::family, core::LockKey(41)));
    churches->dialogue.expect_box(
        u"Unable to move the Naismith family as somebody is working on it in 'Church2'"_s,
        u"An earlier try has brought it there already. Family file 'Naismith, Ann' is held by the workstation "
        "'office-2' since 10:30 on 15/05/2024."_s);
    EXPECT_FALSE(churches->move_without_question(file));
    locks.release(core::LockKind::family, core::LockKey(41));

    EXPECT_TRUE(churches->move(file));
    EXPECT_EQ(churches->dialogue.seen().back().more.section(u'\n', -1),
              u"An earlier try has brought the family there already. It is written anew from here; what was changed "
              "there since is lost."_s);
}

TEST_P(MoveFamilyCutOffTest, AFamilyOnItsWayToOneChurchDoesNotGoToAnother)
{
    const auto file = churches->add(family(u"Naismith"_s, {u"Ann"_s}));
    move_and_cut_off(file, MoveStep::arrived);
    DataFolder::make_church(churches->paths(3).folder(core::Folder::church));
    churches->dialogue.expect_box(
        u"Unable to move the Naismith family to 'Church3' as it is on its way to 'Church2'"_s);
    EXPECT_FALSE(move_family(churches->office, file.family.Surname_ID, 3, churches->progress));

    EXPECT_TRUE(churches->move(file));
    expect_alone_there(u"Naismith"_s, {u"Ann"_s});
}

TEST_P(MoveFamilyCutOffTest, FilesThatCannotBeRemovedDoNotHoldUpTheMove)
{
    const auto file = churches->add(family(u"Naismith"_s, {u"Ann"_s}));
    churches->dialogue.expect_confirm(TwoChurches::question(file), core::Answer::yes);
    churches->dialogue.expect_box(u"The Naismith family has been moved, but its photographs and notebook pages could "
                                  "not be removed here"_s,
                                  u"The next move to 'Church2' tries again. Unable to remove it"_s);
    EXPECT_TRUE(churches->move_without_question(file, [](MoveStep step) {
        if (step == MoveStep::files_removed)
            throw core::FileError(u"Unable to remove it"_s);
    }));
    EXPECT_FALSE(is_here(file));
    EXPECT_GT(churches->notes(), 0);

    EXPECT_TRUE(churches->move(churches->add(family(u"Other"_s, {u"Dan"_s}))));
    EXPECT_EQ(churches->notes(), 0);
    EXPECT_EQ(churches->families_there(), 2);
}

TEST(MoveFamilyKillTest, AKilledMoveLosesNothingAndTheNextOneMendsIt)
{
    TwoChurches churches(core::EngineKind::sqlite, core::EngineKind::sqlite);
    std::mt19937 random(20261123);
    constexpr int rounds = 30;
    QStringList expected;
    for (int round = 0; round < rounds; ++round) {
        auto file = full_family(false);
        for (auto& person : file.people)
            person.personal_pin.prepend(QString::number(round + 1));
        file = churches.add(file);
        churches.close();
        run_and_kill(
            [&](const Ready& ready) {
                churches.reopen();
                ready();
                (void)churches.move(file);
                for (;;)
                    pause();
            },
            std::chrono::microseconds(random() % 15000));
        churches.reopen();
        const bool here = load_family(churches.here(), file.family.Surname_ID).has_value();
        ASSERT_TRUE(here || churches.families_there() == round + 1) << "The family is lost.";
        if (here) {
            EXPECT_TRUE(churches.move(file));
        } else if (churches.notes() > 0) {
            EXPECT_TRUE(churches.move_without_question(file));
        }

        EXPECT_FALSE(load_family(churches.here(), file.family.Surname_ID));
        EXPECT_EQ(churches.files(1), QStringList());
        EXPECT_EQ(churches.families_there(), round + 1);
        EXPECT_EQ(churches.notes(), 0);
        const auto key =
            static_cast<int>(number_of(churches.there(), u"SELECT MAX([Surname_ID]) FROM [tbl_surname];"_s));
        const auto arrived = load_family(churches.there(), key);
        ASSERT_TRUE(arrived);
        EXPECT_EQ(arrived->people.size(), file.people.size());
        expected += TwoChurches::files_of(key, arrived->people.front().person_id);
        expected.sort();
        EXPECT_EQ(churches.files(2), expected);
    }
}

} // namespace kindrel::test
