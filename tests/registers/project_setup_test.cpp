#include "registers/project_setup.h"

#include "register_fixture.h"
#include "registers/projects.h"
#include "support/processes.h"

#include <QSet>

#include <random>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Answer;
using registers::CategoryItem;
using registers::FigureKind;
using registers::Kind;
using registers::ProjectSetup;

namespace {

const QString records = u"', please note all records attached to this %1 will be removed once you delete this project. "
                        "Do you wish to continue?"_s;
const QString choose_to_remove = u"Please choose which item you wish to remove first"_s;
const QString add_first = u"Unable to remove any items until you first add a new item"_s;
const QString no_service = u"You must enter at least one Roll service description for each Roll project"_s;
const QString no_category = u"You have set up a Weekly Project name without either adding a financial or attendance "
                            "category, please add at least one before exiting this area."_s;

QString question(const QString& what, const QString& name)
{
    return u"Please confirm that you wish to remove this "_s + what + u" '"_s + name + records.arg(what);
}

QStringList names(const auto& list)
{
    QStringList found;
    for (const auto& item : list)
        found += item.name;
    return found;
}

class ProjectSetupTest : public RegisterTest
{
protected:
    [[nodiscard]] ProjectSetup open() { return ProjectSetup(office()); }
    [[nodiscard]] QStringList stored(Kind kind)
    {
        return names(registers::read_projects(session(), registers::register_kind(kind)));
    }
    /// Two roll projects, each with a service, and two finance projects.
    void add_projects()
    {
        auto setup = open();
        for (const auto& name : {u"Worship"_s, u"Scouts"_s}) {
            ASSERT_TRUE(setup.add(Kind::roll, name));
            ASSERT_TRUE(setup.set_service(setup.list(Kind::roll).size() - 1, 0, u"Meeting"_s));
        }
        ASSERT_TRUE(setup.add(Kind::finance, u"General"_s));
        ASSERT_TRUE(setup.add(Kind::finance, u"Building"_s));
        ASSERT_TRUE(setup.save());
    }
    /// Roll project 1 has a date with two marks and a note, a lock and the remembered places.
    void give_records()
    {
        session().run_script(u"INSERT INTO [tbl_roll_date] ([roll_date_id],[roll_date],[roll_project_id]) VALUES "
                             "(1,'2024-05-12',1),(2,'2024-05-12',2);"
                             "INSERT INTO [tbl_roll_attendance] ([roll_date_id],[person_id],[Attendance]) VALUES "
                             "(1,1,192),(1,2,-1),(2,1,192);"
                             "INSERT INTO [tbl_roll_memo] ([roll_date_id],[Notes]) VALUES (1,'Rain');"
                             "INSERT INTO [tbl_roll_locked] ([roll_locked]) VALUES (1);"
                             "UPDATE [tbl_project_position] SET [roll_add_position]=1,[roll_output_position]=2;"_s);
    }
};

} // namespace

KINDREL_ON_BOTH_ENGINES(ProjectSetupTest);

TEST_P(ProjectSetupTest, EverythingThatIsSetUpIsReadBackByTheNextWorkstation)
{
    auto setup = open();
    ASSERT_TRUE(setup.add(Kind::roll, u"  Worship  "_s));
    ASSERT_TRUE(setup.set_service(0, 0, u"Morning"_s));
    ASSERT_TRUE(setup.set_service(0, 6, u"Evening"_s));
    ASSERT_TRUE(setup.set_absence(0, 3, u"Sick"_s));
    ASSERT_TRUE(setup.set_include(0, 3, true));
    ASSERT_TRUE(setup.add(Kind::finance, u"General"_s));
    ASSERT_TRUE(setup.add(Kind::weekly, u"Figures"_s));
    ASSERT_TRUE(setup.add_category(2, FigureKind::attendance, u"Crèche"_s));
    ASSERT_TRUE(setup.add_category(2, FigureKind::money, u"Loose offering"_s));
    EXPECT_TRUE(setup.altered());
    ASSERT_TRUE(setup.save());
    EXPECT_FALSE(setup.altered());

    const ProjectSetup theirs(other->office);
    for (const auto kind : registers::kinds)
        EXPECT_EQ(theirs.list(kind).items(), setup.list(kind).items());
    EXPECT_EQ(theirs.list(Kind::roll)[0].name, u"Worship");
    EXPECT_EQ(theirs.list(Kind::roll)[0].services[6], u"Evening");
    EXPECT_TRUE(theirs.list(Kind::roll)[0].include[3]);
    EXPECT_EQ(names(theirs.list(Kind::weekly)), QStringList({u"Sunday"_s, u"Youth"_s, u"Figures"_s}));
    EXPECT_EQ(theirs.categories(2, FigureKind::attendance), (std::vector{CategoryItem{5, u"Crèche"_s}}));
    EXPECT_EQ(count(u"[tbl_weekly_group] WHERE [group_type]=2 AND [position]=1 AND [weekly_project_id]=3"_s), 1);
}

TEST_P(ProjectSetupTest, AProjectIsNotLeftWithoutAServiceOrACategory)
{
    auto setup = open();
    ASSERT_TRUE(setup.add(Kind::weekly, u"Figures"_s));
    dialogue().expect_box(no_category);
    EXPECT_FALSE(setup.check());
    EXPECT_EQ(setup.faulty()->kind, Kind::weekly);
    EXPECT_EQ(setup.faulty()->project, 2);

    ASSERT_TRUE(setup.add(Kind::roll, u"Worship"_s));
    ASSERT_TRUE(setup.set_absence(0, 0, u"Sick"_s));
    dialogue().expect_box(no_service);
    EXPECT_FALSE(setup.save());
    EXPECT_EQ(setup.faulty()->kind, Kind::roll);
    EXPECT_EQ(stored(Kind::weekly).size() + stored(Kind::roll).size(), 2) << "An incomplete project was stored.";
    ASSERT_TRUE(setup.set_service(0, 2, u"Third"_s));
    ASSERT_TRUE(setup.add_category(2, FigureKind::money, u"Offering"_s));
    EXPECT_TRUE(setup.check());
    EXPECT_FALSE(setup.faulty());
}

TEST_P(ProjectSetupTest, ItemsMoveWithinTheirListAndNoFurther)
{
    add_projects();
    auto setup = open();
    dialogue().expect_box(u"This is the highest position this item can be moved to"_s);
    EXPECT_FALSE(setup.move_up(Kind::roll, 0));
    dialogue().expect_box(u"This is the lowest position this item can be moved to"_s);
    EXPECT_FALSE(setup.move_down(Kind::roll, 1));
    dialogue().expect_box(u"Please select an item for moving"_s);
    EXPECT_FALSE(setup.move_up(Kind::roll, -1));
    dialogue().expect_box(u"Please choose which item you wish to move first"_s);
    EXPECT_FALSE(setup.move_category_up(0, FigureKind::attendance, -1));
    dialogue().expect_box(u"This is the highest position this item can be moved to"_s);
    EXPECT_FALSE(setup.move_category_up(0, FigureKind::attendance, 0));
    EXPECT_FALSE(setup.altered());

    EXPECT_TRUE(setup.move_down(Kind::finance, 0));
    EXPECT_TRUE(setup.move_up(Kind::roll, 1));
    EXPECT_TRUE(setup.move_category_down(0, FigureKind::attendance, 0));
    ASSERT_TRUE(setup.save());
    EXPECT_EQ(stored(Kind::finance), QStringList({u"Building"_s, u"General"_s}));
    EXPECT_EQ(stored(Kind::roll), QStringList({u"Scouts"_s, u"Worship"_s}));
    EXPECT_EQ(names(open().categories(0, FigureKind::attendance)), QStringList({u"Evening"_s, u"Morning"_s}));
    EXPECT_EQ(number_of(session(), u"SELECT SUM([position]) FROM [tbl_roll_project];"_s), 3);
}

TEST_P(ProjectSetupTest, ARemovedProjectTakesItsRecordsLockAndRememberedPlaceAlong)
{
    add_projects();
    give_records();
    auto setup = open();
    dialogue().expect_confirm(question(u"Roll project"_s, u"Worship"_s), Answer::no, Answer::no);
    EXPECT_FALSE(setup.remove(Kind::roll, 0));
    EXPECT_EQ(dialogue().seen().back().more, u"1 date, 2 marks and 1 note go with it.");
    dialogue().expect_confirm(question(u"Roll project"_s, u"Worship"_s), Answer::yes, Answer::no);
    EXPECT_TRUE(setup.remove(Kind::roll, 0));
    EXPECT_EQ(count(u"[tbl_roll_date]"_s), 2) << "Nothing goes before it is saved.";
    ASSERT_TRUE(setup.save());

    EXPECT_EQ(stored(Kind::roll), QStringList(u"Scouts"_s));
    EXPECT_EQ(count(u"[tbl_roll_date]"_s), 1);
    EXPECT_EQ(count(u"[tbl_roll_attendance]"_s), 1);
    EXPECT_EQ(count(u"[tbl_roll_setup]"_s), 1);
    EXPECT_EQ(count(u"[tbl_roll_memo]"_s) + count(u"[tbl_roll_locked]"_s), 0);
    EXPECT_EQ(count(u"[tbl_project_position] WHERE [roll_add_position] IS NULL AND [roll_output_position]=2"_s), 1);
}

TEST_P(ProjectSetupTest, ARemovedCategoryTakesItsFiguresAlongAndNoOthers)
{
    start_with({first});
    type(*weekly, {u"10", u"20", u"30"});
    ASSERT_TRUE(weekly->save());
    ASSERT_TRUE(weekly->leave());
    auto setup = open();
    dialogue().expect_confirm(question(u"item"_s, u"Morning"_s), Answer::yes, Answer::no);
    EXPECT_TRUE(setup.remove_category(0, FigureKind::attendance, 0));
    EXPECT_EQ(dialogue().seen().back().more, u"1 figure goes with it.");
    dialogue().expect_confirm(question(u"item"_s, u"Youth"_s), Answer::yes, Answer::no);
    EXPECT_TRUE(setup.remove(Kind::weekly, 1));
    ASSERT_TRUE(setup.save());

    EXPECT_EQ(count(u"[tbl_weekly_amount]"_s), 2);
    EXPECT_EQ(count(u"[tbl_weekly_group]"_s), 2);
    EXPECT_EQ(RegisterTest::stored(first), u"2:20 3:$30.00");
}

TEST_P(ProjectSetupTest, AServiceOrReasonWithMarksIsEmptiedOnceThatIsConfirmed)
{
    add_projects();
    {
        auto setup = open();
        ASSERT_TRUE(setup.set_service(0, 1, u"Evening"_s));
        ASSERT_TRUE(setup.set_absence(0, 1, u"Sick"_s));
        ASSERT_TRUE(setup.set_absence(0, 2, u"Away"_s));
        ASSERT_TRUE(setup.save());
    }
    give_records(); // 192: the first service. Of project 2 there is one too.
    session().run_script(u"INSERT INTO [tbl_roll_attendance] ([roll_date_id],[person_id],[Attendance]) VALUES "
                         "(1,3,224),(1,4,-2),(2,4,-2);"
                         "INSERT INTO [tbl_roll_visitors] ([roll_date_id],[service_id],[visitors]) VALUES (1,2,9);"_s);
    struct Case
    {
        bool (ProjectSetup::*set)(int, int, const QString&);
        int place;
        QString what, told;
    };
    auto setup = open();
    const auto service = &ProjectSetup::set_service;
    for (const auto& [set, place, what, told] :
         {Case{service, 0, u"service 'Meeting'"_s, u"2 marks cannot be seen without it, until a service"_s},
          Case{service, 1, u"service 'Evening'"_s,
               u"1 mark and 1 visitor figure cannot be seen without it, until a service"_s},
          Case{&ProjectSetup::set_absence, 1, u"reason for being absent 'Sick'"_s,
               u"1 mark cannot be seen without it, until a reason"_s}}) {
        const auto asked = u"Please confirm that you wish to remove this %1. Do you wish to continue?"_s.arg(what);
        for (const auto answer : {Answer::no, Answer::yes}) {
            dialogue().expect_confirm(asked, answer, Answer::no);
            EXPECT_EQ((setup.*set)(0, place, u" "_s), answer == Answer::yes);
            EXPECT_EQ(dialogue().seen().back().more, told + u" has a name in its place again."_s);
        }
    }
    EXPECT_TRUE(setup.set_absence(0, 2, {})) << "It has no marks.";
    EXPECT_TRUE(setup.set_service(0, 0, u"Early"_s));
    ASSERT_TRUE(setup.save());
    const auto stays = open().list(Kind::roll)[0];
    EXPECT_EQ(stays.services, (decltype(stays.services){u"Early"_s}));
    EXPECT_EQ(stays.absences, decltype(stays.absences){});
    EXPECT_EQ(count(u"[tbl_roll_attendance]"_s), 6) << "The marks stay.";
}

TEST_P(ProjectSetupTest, WhatCannotBeDoneIsSaidAndChangesNothing)
{
    auto setup = open();
    const auto no_roll = u"You need to select a Roll project before adding any information to it"_s;
    for (int act = 0; act < 3; ++act)
        dialogue().expect_box(no_roll);
    EXPECT_FALSE(setup.set_service(-1, 0, u"Morning"_s));
    EXPECT_FALSE(setup.set_absence(-1, 0, u"Sick"_s));
    EXPECT_FALSE(setup.set_include(-1, 0, true));
    dialogue().expect_box(u"You must choose a weekly project before attempting to add anything to it"_s);
    EXPECT_FALSE(setup.add_category(-1, FigureKind::money, u"Offering"_s));
    dialogue().expect_box(add_first);
    EXPECT_FALSE(setup.remove(Kind::finance, -1));
    dialogue().expect_box(choose_to_remove);
    EXPECT_FALSE(setup.remove(Kind::weekly, -1));
    dialogue().expect_box(u"Unable to remove an item until you select one"_s);
    EXPECT_FALSE(setup.remove_category(0, FigureKind::money, -1));
    dialogue().expect_box(add_first);
    EXPECT_FALSE(setup.remove_category(1, FigureKind::money, 0));
    dialogue().expect_box(u"This item already exists in the list"_s, u"Sunday"_s);
    EXPECT_FALSE(setup.add(Kind::weekly, u" sunday"_s));
    dialogue().expect_box(u"This item already exists in the list"_s, u"Morning"_s);
    EXPECT_FALSE(setup.rename_category(0, FigureKind::attendance, 1, u"MORNING"_s));
    dialogue().expect_box(u"Please enter an item before attempting to add a new item to the list"_s);
    EXPECT_FALSE(setup.add(Kind::roll, u"  "_s));
    dialogue().expect_box(u"Please enter an item"_s);
    EXPECT_FALSE(setup.rename(Kind::weekly, 0, {}));
    EXPECT_FALSE(setup.altered());
    EXPECT_TRUE(setup.add_category(0, FigureKind::money, u"Morning"_s)) << "Heads and money are counted apart.";
}

TEST_P(ProjectSetupTest, TwoHundredCategoriesAreTheMostAProjectHolds)
{
    auto setup = open();
    for (int number = 4; number <= 200; ++number)
        ASSERT_TRUE(setup.add_category(0, FigureKind::money, u"Fund %1"_s.arg(number)));
    dialogue().expect_box(u"A weekly project can have no more than 200 categories"_s);
    EXPECT_FALSE(setup.add_category(0, FigureKind::attendance, u"One more"_s));
    ASSERT_TRUE(setup.save());
    EXPECT_EQ(count(u"[tbl_weekly_group] WHERE [weekly_project_id]=1"_s), 200);
}

TEST_P(ProjectSetupTest, ThePresetsOfARollProjectOutliveASave)
{
    add_projects();
    session().execute(u"UPDATE [tbl_roll_setup] SET [mouse_service1]=-1,[append_mode]=-1;"_s);
    auto setup = open();
    ASSERT_TRUE(setup.rename(Kind::roll, 0, u"Sunday Worship"_s));
    ASSERT_TRUE(setup.set_service(0, 1, u"Evening"_s));
    ASSERT_TRUE(setup.save());
    EXPECT_EQ(count(u"[tbl_roll_setup] WHERE [mouse_service1]=-1 AND [append_mode]=-1"_s), 2);
    EXPECT_EQ(count(u"[tbl_roll_setup] WHERE [service1]='Meeting' AND [service2]='Evening'"_s), 1);
}

TEST_P(ProjectSetupTest, ProjectsThatOthersChangedMeanwhileAreNotOverwritten)
{
    auto mine = open();
    ProjectSetup theirs(other->office);
    ASSERT_TRUE(theirs.rename_category(0, FigureKind::money, 0, u"Tithes"_s));
    ASSERT_TRUE(theirs.save());
    ASSERT_TRUE(mine.add_category(0, FigureKind::money, u"Bequests"_s));
    ASSERT_TRUE(mine.add(Kind::finance, u"General"_s));

    dialogue().expect_box(u"The projects have been changed by another user while they were open here."_s);
    EXPECT_FALSE(mine.save());
    EXPECT_EQ(names(open().categories(0, FigureKind::money)), QStringList(u"Tithes"_s));
    EXPECT_EQ(stored(Kind::finance), QStringList()) << "A part of a refused save was stored.";
}

TEST_P(ProjectSetupTest, WithoutTheRightNothingIsSaved)
{
    auto setup = open();
    ASSERT_TRUE(setup.add(Kind::finance, u"General"_s));
    office().rights.set(core::Area::project_setup, false);
    dialogue().expect_box(
        u"Your password does not give access to \"%1\""_s.arg(core::area_name(core::Area::project_setup)));
    EXPECT_FALSE(setup.save());
    EXPECT_EQ(stored(Kind::finance), QStringList());
}

TEST_P(ProjectSetupTest, AKilledSaveLeavesTheProjectsOfOneSaveAlone)
{
    constexpr int funds = 40;
    {
        add_projects();
        auto setup = open();
        for (int fund = 0; fund < funds; ++fund)
            ASSERT_TRUE(setup.add_category(0, FigureKind::money, u"Fund %1"_s.arg(fund)));
        ASSERT_TRUE(setup.save());
    }
    weekly.reset();
    desk.reset();
    other.reset();
    std::mt19937 random(20261123);
    for (int round = 0; round < 20; ++round) {
        church->close();
        run_and_kill(
            [&](const Ready& ready) {
                WorkingOffice working(*church);
                ProjectSetup setup(working.office);
                for (int save = 1;; ++save) {
                    const auto name = [save](const QString& what) {
                        return u"%1 %2"_s.arg(what).arg(save);
                    };
                    for (const auto kind : registers::kinds)
                        (void)setup.rename(kind, 1, name(u"Project"_s));
                    (void)setup.set_service(1, 0, name(u"Service"_s));
                    for (const int fund : {0, funds})
                        (void)setup.rename_category(0, FigureKind::money, fund, name(u"Fund no %1"_s.arg(fund)));
                    (void)setup.move_category_down(0, FigureKind::money, 1);
                    (void)setup.save();
                    if (save == 1)
                        ready();
                }
            },
            std::chrono::microseconds(random() % 15000));
        church->reopen();
        SetupOffice looking(*church);
        const ProjectSetup setup(looking.office);
        const auto& categories = setup.categories(0, FigureKind::money);
        ASSERT_EQ(categories.size(), funds + 1) << "A save stands by half.";
        EXPECT_EQ(count(u"[tbl_roll_setup]"_s), 2);
        QSet<QString> saves{setup.list(Kind::roll)[1].services[0].section(u' ', -1)};
        for (const auto kind : registers::kinds)
            saves += setup.list(kind)[1].name.section(u' ', -1);
        for (const auto* category : {&categories.front(), &categories.back()})
            saves += category->name.section(u' ', -1);
        EXPECT_EQ(saves.size(), 1) << "Two saves are mixed.";
    }
}

} // namespace kindrel::test
