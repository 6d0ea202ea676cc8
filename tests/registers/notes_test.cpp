#include "registers/notes.h"

#include "register_fixture.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using registers::Notes;
using registers::NotesArea;

namespace {

const QString question = u"This note has been altered. Do you wish to save it?"_s;

/// Where the notes of each area lie; a project 1 with two dates, 1 and 2.
struct AreaCase
{
    NotesArea area;
    QString title, date_table, date_key, date, project_key, memo_table;
};
const std::vector<AreaCase> areas{
    {NotesArea::roll, u"Roll Notes"_s, u"tbl_roll_date"_s, u"roll_date_id"_s, u"roll_date"_s, u"roll_project_id"_s,
     u"tbl_roll_memo"_s},
    {NotesArea::roster, u"Roster Notes"_s, u"tbl_roster_date"_s, u"date_id"_s, u"date"_s, u"roster_project_id"_s,
     u"tbl_roster_memo"_s},
    {NotesArea::weekly, u"Weekly Notes"_s, u"tbl_weekly_date"_s, u"weekly_date_id"_s, u"weekly_date"_s,
     u"weekly_project_id"_s, u"tbl_weekly_memo"_s},
    {NotesArea::finance, u"Finance Notes"_s, u"tbl_finance_date"_s, u"finance_date_id"_s, u"finance_date"_s,
     u"finance_project_id"_s, u"tbl_finance_memo"_s},
};

class NotesTest : public RegisterTest
{
protected:
    void add_dates(const AreaCase& at)
    {
        const auto statement = u"INSERT INTO [%1] ([%2],[%3],[%4]) VALUES (?,?,?);"_s.arg(at.date_table, at.date_key,
                                                                                          at.date, at.project_key);
        session().execute(statement, 1, first, 1);
        session().execute(statement, 2, second, 1);
        session().execute(statement, 3, third, 2);
    }
    [[nodiscard]] QString stored(const AreaCase& at, int key)
    {
        auto rows = session().select(u"SELECT [Notes] FROM [%1] WHERE [%2]=?;"_s.arg(at.memo_table, at.date_key), key);
        const auto* row = rows.first();
        return row ? row->text(core::Column{0}) : u"none"_s;
    }
    const AreaCase& of_weekly = areas[2];
};

} // namespace

KINDREL_ON_BOTH_ENGINES(NotesTest);

TEST_P(NotesTest, EveryAreaShowsAndStoresTheNotesOfItsOwnDates)
{
    for (const auto& at : areas) {
        SCOPED_TRACE(at.title.toStdString());
        add_dates(at);
        EXPECT_EQ(registers::notes_title(at.area), at.title);
        EXPECT_EQ(registers::notes_button(session(), at.area, 1), u"&Add Notes");

        Notes notes(office(), at.area, 1, 1);
        ASSERT_EQ(notes.dates().size(), 2u);
        EXPECT_EQ(notes.dates()[0].date, second);
        EXPECT_EQ(notes.shown(), 1);
        notes.type(u"It rained.\nFew came."_s);
        ASSERT_TRUE(notes.save());
        EXPECT_EQ(stored(at, 1), u"It rained.\nFew came.");
        EXPECT_EQ(stored(at, 2), u"none");
        EXPECT_EQ(registers::notes_button(session(), at.area, 1), u"&Notes Exist");

        notes.type(u"Few came."_s);
        ASSERT_TRUE(notes.save());
        EXPECT_EQ(stored(at, 1), u"Few came.");
        notes.type({});
        ASSERT_TRUE(notes.save());
        EXPECT_EQ(registers::notes_button(session(), at.area, 1), u"&Add Notes");
    }
}

TEST_P(NotesTest, WhatWasTypedIsOfferedForSavingBeforeAnotherDateIsShown)
{
    add_dates(of_weekly);
    Notes notes(office(), NotesArea::weekly, 1);
    EXPECT_EQ(notes.shown(), 0) << "The newest date.";
    notes.type(u"Picnic"_s);
    dialogue().expect_confirm_or_cancel(question, std::nullopt);
    EXPECT_FALSE(notes.show(1));
    EXPECT_EQ(notes.text(), u"Picnic");
    dialogue().expect_confirm_or_cancel(question, true);
    EXPECT_TRUE(notes.show(1));
    EXPECT_EQ(notes.text(), u"");
    EXPECT_EQ(stored(of_weekly, 2), u"Picnic");

    notes.type(u"Storm"_s);
    dialogue().expect_confirm_or_cancel(question, false);
    EXPECT_TRUE(notes.leave());
    EXPECT_EQ(stored(of_weekly, 1), u"none");
    EXPECT_TRUE(notes.show(0));
    EXPECT_EQ(notes.text(), u"Picnic");
}

TEST_P(NotesTest, ANoteThatOthersWroteMeanwhileIsShownBeforeItIsReplaced)
{
    add_dates(of_weekly);
    Notes mine(office(), NotesArea::weekly, 1);
    Notes theirs(other->office, NotesArea::weekly, 1);
    theirs.type(u"Picnic"_s);
    ASSERT_TRUE(theirs.save());
    mine.type(u"Storm"_s);

    dialogue().expect_box(u"This note has been changed by another user. Saving it once more puts yours in its place."_s,
                          u"Picnic"_s);
    EXPECT_FALSE(mine.save());
    EXPECT_EQ(stored(of_weekly, 2), u"Picnic");
    EXPECT_TRUE(mine.save());
    EXPECT_EQ(stored(of_weekly, 2), u"Storm");
}

TEST_P(NotesTest, ADateThatIsGoneGetsNoNote)
{
    add_dates(of_weekly);
    Notes notes(office(), NotesArea::weekly, 1);
    session().execute(u"DELETE FROM [tbl_weekly_date] WHERE [weekly_date_id]=2;"_s);
    notes.type(u"Picnic"_s);

    dialogue().expect_box(u"This date has been removed by another user."_s, u"The note was not stored."_s);
    EXPECT_FALSE(notes.save());
    EXPECT_EQ(stored(of_weekly, 2), u"none");
}

TEST_P(NotesTest, WithoutTheRightNoNoteIsRead)
{
    add_dates(of_weekly);
    office().rights.set(core::Area::weekly_statistics, false);
    dialogue().expect_box(
        u"Your password does not give access to \"%1\""_s.arg(core::area_name(core::Area::weekly_statistics)));
    const Notes notes(office(), NotesArea::weekly, 1);
    EXPECT_TRUE(notes.dates().empty());
    EXPECT_EQ(notes.shown(), std::nullopt);
}

} // namespace kindrel::test
