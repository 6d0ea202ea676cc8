#include "core/locks.h"
#include "core/marker.h"
#include "core/side_files.h"
#include "move_fixture.h"
#include "people/group_history.h"
#include "people/move_family.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace people;
using core::Date;
using core::Entity;

namespace {

const QString order_of_things = u"Roster duties and Wardline records of the family end with the move. Attendance and "
                                "giving totals stay in this church."_s;

class MoveFamilyTest : public MoveTest
{
};

/// On church files alone: for what asks no engine.
class MoveFamilyRuleTest : public testing::Test
{
protected:
    void clear_the_way()
    {
        churches.office.mode = core::Mode::normal;
        churches.office.rights = core::Rights::all();
        churches.office.person_guards.clear();
        (void)core::Locks(churches.office).unlock(core::LockKind::roll_area, core::Locks::own_place());
        churches.there().execute(u"UPDATE [tbl_startup] SET [Version]=1;"_s);
        churches.here().execute(u"UPDATE [tbl_surname] SET [booked_out]=0;"_s);
    }

    TwoChurches churches{core::EngineKind::sqlite, core::EngineKind::sqlite};
    ScriptedDialogue& dialogue = churches.dialogue;
};

/// Does not let two people go.
class Guard : public core::PersonGuard
{
public:
    [[nodiscard]] bool allows(core::Office& office, core::PersonAct act, std::span<const int> ids) const override
    {
        EXPECT_EQ(act, core::PersonAct::move);
        EXPECT_EQ(ids.size(), 2U);
        office.dialogue.show({u"Records are kept of Ann"_s});
        return false;
    }
};

void forget_keys(std::vector<LinkRow>& rows)
{
    for (auto& row : rows)
        row = {0, row.text.toUpper().trimmed(), row.type, row.date, row.field, row.tagged};
}

/// The file with the texts of its items in place of their keys.
FamilyFile by_text(FamilyFile file)
{
    for (auto& person : file.people) {
        for (auto* rows :
             {&person.status, &person.groups, &person.ministries, &person.flexi, &person.dates, &person.occupations})
            forget_keys(*rows);
    }
    forget_keys(file.family_groups);
    forget_keys(file.family_dates);
    for (auto* suburb : {&file.residential, &file.postal})
        (*suburb)->suburb_id = 0;
    return file;
}

void add_there(TwoChurches& churches, SetupKind kind, const SetupItem& item, int position)
{
    const auto& list = setup_list(kind);
    while (churches.there().allocate(list.entity) < item.key) {
    }
    insert_setup_rows(churches.there(), list, std::array{SetupRow{item, position}});
}

QStringList texts_there(TwoChurches& churches, SetupKind kind)
{
    QStringList found;
    for (const auto& [item, position] : read_setup_rows(churches.there(), setup_list(kind)))
        found += u"%1: %2 %3"_s.arg(item.key).arg(item.text, item.postcode).trimmed();
    return found;
}

} // namespace

KINDREL_ON_ALL_PAIRS_OF_ENGINES(MoveFamilyTest);

TEST_P(MoveFamilyTest, AFamilyArrivesWholeUnderTheKeysOfTheOtherChurch)
{
    const auto file = churches->add(full_family(true));
    const int first = file.people.front().person_id;

    ASSERT_TRUE(churches->move(file));

    auto expected = file;
    expected.family.Surname_ID = 41;
    expected.family.last_edit = Date::from(churches->clock.today());
    for (int key = 301; auto& person : expected.people) {
        person.person_id = key++;
        person.Surname_ID = 41;
    }
    const auto arrived = load_family(churches->there(), 41);
    ASSERT_TRUE(arrived);
    EXPECT_EQ(by_text(*arrived), by_text(expected));
    EXPECT_EQ(arrived->family.created, (Date{1999, 12, 31}));
    EXPECT_EQ(churches->there().allocate(Entity::person), 304) << "The counter does not know the keys.";
    EXPECT_EQ(churches->files(2), TwoChurches::files_of(41, 301));
    EXPECT_EQ(churches->content(2, portrait_of_person(301)), "photograph");
    EXPECT_EQ(churches->content(2, notebook_of_person(301)), "notes");

    EXPECT_FALSE(load_family(churches->here(), file.family.Surname_ID));
    EXPECT_EQ(number_of(churches->here(), u"SELECT COUNT(*) FROM [tbl_personal_details];"_s), 0) << first;
    EXPECT_EQ(churches->files(1), QStringList());
    EXPECT_EQ(churches->notes(), 0);
}

TEST_P(MoveFamilyTest, ItemsAreFoundByTheirTextAndTheOthersComeToTheEndOfTheirLists)
{
    add_there(*churches, SetupKind::groups, {.key = 7, .text = u"GROUP 3"_s}, 5);
    add_there(*churches, SetupKind::suburbs, {.key = 4, .text = u"suburb 1"_s, .postcode = u"9000"_s}, 1);
    add_there(*churches, SetupKind::suburbs, {.key = 9, .text = u"Suburb 2"_s, .postcode = u"3000"_s}, 2);
    add_there(*churches, SetupKind::titles, {.key = 2, .text = u"rev"_s}, 1);
    churches->here().execute(u"UPDATE [tbl_group_setup] SET [not_active]=-1 WHERE [group_id]=1;"_s);
    auto file = full_family(false);
    file.people[0].Title = u"Rev"_s;
    file.people[1].Title = file.people[2].Title = u"Dr"_s;

    ASSERT_TRUE(churches->move(churches->add(file)));

    EXPECT_EQ(texts_there(*churches, SetupKind::groups), (QStringList{u"7: GROUP 3"_s, u"8: group 1"_s}));
    const auto groups = read_setup_rows(churches->there(), setup_list(SetupKind::groups));
    EXPECT_EQ(groups.back().position, 6);
    EXPECT_TRUE(groups.back().item.not_active) << "A group that no longer meets meets again.";
    EXPECT_EQ(texts_there(*churches, SetupKind::suburbs),
              (QStringList{u"4: suburb 1 9000"_s, u"9: Suburb 2 3000"_s, u"10: suburb 1 3000"_s}));
    EXPECT_EQ(texts_there(*churches, SetupKind::titles), (QStringList{u"2: rev"_s, u"3: Dr"_s}));
    const auto arrived = load_family(churches->there(), 41);
    EXPECT_EQ(arrived->people[0].groups[0].item, 7);
    EXPECT_EQ(arrived->people[0].groups[1].item, 8);
    EXPECT_EQ(arrived->residential->suburb_id, 10);
    EXPECT_EQ(arrived->postal->suburb_id, 9);
    EXPECT_EQ(arrived->people[0].Title, u"Rev"_s);
}

TEST_P(MoveFamilyTest, ItemsThatAreOneThereAreCarriedOnce)
{
    churches->here().execute(u"UPDATE [tbl_status_setup] SET [status]='STATUS 1' WHERE [status_id]=2;"_s);
    ASSERT_TRUE(churches->move(churches->add(full_family(false))));
    EXPECT_EQ(load_family(churches->there(), 41)->people[0].status.size(), 1);
    EXPECT_EQ(texts_there(*churches, SetupKind::status).size(), 1);
}

TEST_P(MoveFamilyTest, TimesInGroupsGoAlongPresentAndPast)
{
    add_there(*churches, SetupKind::groups, {.key = 7, .text = u"Group 2"_s}, 1);
    auto ann = family(u"Naismith"_s, {u"Ann"_s});
    ann.people[0].groups = {LinkRow{3, u"group 3"_s, 0, {}, {}, false}};
    ann = churches->add(ann);
    churches->here().execute(u"INSERT INTO [tbl_group_history] ([history_id],[person_id],[group_id],[group],[date_in],"
                             "[date_out],[completed]) VALUES (90,?,2,NULL,'2001-02-03','2002-03-04',-1),"
                             "(91,?,99,'Old choir','2003-04-05','2004-05-06',-1);"_s,
                             ann.people[0].person_id, ann.people[0].person_id);

    ASSERT_TRUE(churches->move(ann));

    QStringList told;
    for (const auto& entry : read_group_history(churches->there(), 41)) {
        const auto out = entry.date_out ? entry.date_out->stored() : QString();
        told += u"%1 %2 %3 %4"_s.arg(entry.person_id).arg(entry.group, entry.date_in->stored(), out).trimmed() +
                (entry.completed ? u" completed"_s : QString());
    }
    EXPECT_EQ(told, (QStringList{u"301 group 3 2020-01-02"_s, u"301 Old choir 2003-04-05 2004-05-06 completed"_s,
                                 u"301 Group 2 2001-02-03 2002-03-04 completed"_s}));
    EXPECT_EQ(texts_there(*churches, SetupKind::groups), (QStringList{u"7: Group 2"_s, u"8: group 3"_s}))
        << "A group that was removed is offered again.";
}

TEST_P(MoveFamilyTest, APinThatIsInUseThereIsLeftOutAndTold)
{
    auto file = family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s});
    file.people[0].personal_pin = u"12"_s;
    file.people[1].personal_pin = u"34"_s;
    file = churches->add(file);
    churches->there().execute(u"INSERT INTO [tbl_pin] ([person_id],[personal_pin]) VALUES (5,'12');"_s);

    ASSERT_TRUE(churches->move(file));

    const auto arrived = load_family(churches->there(), 41);
    EXPECT_EQ(arrived->people[0].personal_pin, QString());
    EXPECT_EQ(arrived->people[1].personal_pin, u"34"_s);
    EXPECT_EQ(churches->dialogue.seen().back().more,
              u"This P.I.N. is in use there and will be left out: that of Ann.\n"_s + order_of_things);
}

TEST_F(MoveFamilyRuleTest, TheQuestionNamesWhatIsAddedTenItemsAtMost)
{
    auto file = churches.add(full_family(false));
    dialogue.expect_confirm(TwoChurches::question(file), core::Answer::no, core::Answer::no);

    EXPECT_FALSE(churches.move_without_question(file));

    EXPECT_EQ(dialogue.seen().back().more,
              u"17 items will be added to its setup lists: status 2 (Status), status 1 (Status), group 3 (Groups), "
              "group 1 (Groups), ministry 1 (Ministries), date_description 1 (Personal Dates), date_description 3 "
              "(Personal Dates), flexi 1 (Flexi Fields), family_group 2 (Family Groups), family_group 1 (Family "
              "Groups) and 7 more.\n"_s +
                  order_of_things);
    EXPECT_TRUE(load_family(churches.here(), file.family.Surname_ID));
    EXPECT_EQ(churches.families_there() + churches.notes(), 0);
    EXPECT_EQ(texts_there(churches, SetupKind::groups), QStringList());
}

TEST_F(MoveFamilyRuleTest, WhatStandsInTheWayIsToldAndNothingIsWritten)
{
    const Guard guard;
    struct Case
    {
        std::function<void()> arrange;
        QString text;
        std::optional<QString> more = {};
        std::optional<int> church = 2;
    };
    const auto file = churches.add(family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s}));
    auto& office = churches.office;
    std::optional<core::Marker> busy;
    const std::vector<Case> cases{
        {[&] { office.mode = core::Mode::training; }, u"Unable to move a family to another church in training mode"_s,
         u"This option is not available while the program is in training mode."_s},
        {[&] { office.mode = core::Mode::booked_out; },
         u"Unable to move a family to another church as you are in Family Booked out mode"_s,
         u"This option is not available while the program is in Booked out mode."_s},
        {[] {}, u"Please select a church to move the family too first"_s, {}, std::nullopt},
        {[] {}, u"Please select a church to move the family too first"_s, {}, 1},
        {[&] { office.rights.set(core::Area::read_only_family_data, true); },
         u"Unable to move this family file as you only have read only access within family files"_s},
        {[&] { office.rights = {}; }, u"Your password does not give access to \"Search for Family\""_s},
        {[&] { EXPECT_TRUE(core::Locks(office).take(core::LockKind::roll_area, core::Locks::own_place())); },
         u"Unable to delete people as currently another user has an area of the program active in which they are "
         "working with peoples files."_s},
        {[] {}, u"Unable to move the family as 'Church3' has no database yet"_s, {}, 3},
        {[&] { busy.emplace(*core::Marker::take(churches.paths(2), core::side_files::busy)); },
         u"Unable to Enter Kindrel"_s},
        {[&] {
             office.mode = core::Mode::network;
             busy.emplace(*core::Marker::take(churches.paths(2), core::side_files::opening));
         },
         u"Unable to open the database of 'Church2'"_s,
         u"Another workstation is opening it. Please try again in a moment."_s},
        {[&] { churches.there().execute(u"UPDATE [tbl_startup] SET [Version]=99;"_s); },
         u"Unable to move the family as the database of 'Church2' is of another version"_s},
        {[&] { DataFolder::write(churches.paths(3).database(), "no database at all, but a text"); },
         u"Unable to open the database of 'Church3'"_s,
         {},
         3},
        {[&] { churches.here().execute(u"UPDATE [tbl_surname] SET [booked_out]=-1,[booked_out_person]='Ruth';"_s); },
         u"Unable to move the Naismith family as it is booked out to Ruth"_s},
        {[&] { office.person_guards = {&guard}; }, u"Records are kept of Ann"_s},
        {[&] { churches.here().execute(u"DELETE FROM [tbl_surname];"_s); },
         u"Unable to move this family file because another user has removed it from the database."_s},
    };
    for (const auto& [arrange, text, more, church] : cases) {
        busy.reset();
        clear_the_way();
        arrange();
        dialogue.expect_box(text, more);
        EXPECT_FALSE(move_family(office, file.family.Surname_ID, church, churches.progress)) << text.toStdString();
        dialogue.verify();
    }
    EXPECT_EQ(number_of(churches.here(), u"SELECT COUNT(*) FROM [tbl_people];"_s), 2);
    EXPECT_EQ(churches.families_there() + churches.notes(), 0);
    EXPECT_EQ(churches.files(2), QStringList());
}

TEST_F(MoveFamilyRuleTest, TheOtherChurchesWithADatabaseAreOffered)
{
    const auto offered = [this] {
        QStringList names;
        for (const auto& [church, name] : other_churches(churches.office))
            names += u"%1 %2"_s.arg(church).arg(name);
        return names;
    };
    EXPECT_EQ(offered(), QStringList(u"2 Church2"_s));
    DataFolder::make_church(churches.paths(3).folder(core::Folder::church));
    churches.office.church = 2;
    EXPECT_EQ(offered(), (QStringList{u"1 Church1"_s, u"3 Church3"_s}));
    for (const auto mode : {core::Mode::training, core::Mode::booked_out}) {
        churches.office.mode = mode;
        EXPECT_EQ(offered(), QStringList());
    }
}

} // namespace kindrel::test
