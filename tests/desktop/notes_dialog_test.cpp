#include "desktop/weekly_fixture.h"

#include <QDialog>
#include <QPlainTextEdit>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

const QString note_question = u"This note has been altered. Do you wish to save it?"_s;

class NotesDialogTest : public WeeklyScreenTest
{
protected:
    /// The notes of the weekly project, from the button; the cursor is in the newest date's note.
    QDialog& open_notes()
    {
        if (page().objectName() != u"weekly"_s)
            open_page();
        button().setFocus();
        act(Qt::Key_Space);
        return child<QDialog>(window(), u"Roll_notes"_s);
    }
    [[nodiscard]] QAbstractButton& button() { return child<QAbstractButton>(page(), u"notes"_s); }
    [[nodiscard]] QString note_of(int date_key)
    {
        auto rows = session().select(u"SELECT [Notes] FROM [tbl_weekly_memo] WHERE [weekly_date_id]=?;"_s, date_key);
        const auto* row = rows.first();
        return row ? row->text(core::Column{0}) : QString();
    }
};

} // namespace

TEST_F(NotesDialogTest, ANoteIsWrittenByKeysAloneAndTheButtonTellsOfIt)
{
    start();
    auto& notes = open_notes();
    EXPECT_EQ(notes.windowTitle(), u"Weekly Notes"_s);
    EXPECT_EQ(button().text(), u"&Add Notes"_s);
    type(notes, u"Rain"_s);
    press(notes, Qt::Key_S, Qt::ControlModifier);
    EXPECT_EQ(note_of(2), u"Rain"_s);
    press(notes, Qt::Key_Escape);
    EXPECT_EQ(button().text(), u"&Notes Exist"_s);
}

TEST_F(NotesDialogTest, AnotherDateIsShownOnceTheNoteIsSettled)
{
    start();
    auto& notes = open_notes();
    auto& dates = child<QListWidget>(notes, u"note_dates"_s);
    auto& text = child<QPlainTextEdit>(notes, u"note"_s);
    type(notes, u"Rain"_s);
    dates.setFocus();
    place.dialogue.expect_confirm_or_cancel(note_question, std::nullopt);
    press(notes, Qt::Key_Down);
    EXPECT_EQ(dates.currentRow(), 0);
    EXPECT_EQ(text.toPlainText(), u"Rain"_s);
    place.dialogue.expect_confirm_or_cancel(note_question, true);
    press(notes, Qt::Key_Down);
    EXPECT_EQ(dates.currentRow(), 1);
    EXPECT_EQ(text.toPlainText(), QString());
    EXPECT_EQ(note_of(2), u"Rain"_s);
    EXPECT_EQ(dates.item(0)->text(), u"05/05/2024  note"_s);
    press(notes, Qt::Key_Return);
    EXPECT_EQ(notes.focusWidget(), &text);
    EXPECT_TRUE(notes.isVisible());
}

TEST_F(NotesDialogTest, ClosingAsksAndDoesAsItIsTold)
{
    struct Case
    {
        std::optional<bool> answer;
        bool stays;
        QString stored;
    };
    start();
    auto* notes = &open_notes();
    for (const auto& [answer, stays, in_store] :
         {Case{std::nullopt, true, {}}, Case{false, false, {}}, Case{true, false, u"Rain"_s}}) {
        if (child<QPlainTextEdit>(*notes, u"note"_s).toPlainText().isEmpty())
            type(*notes, u"Rain"_s);
        place.dialogue.expect_confirm_or_cancel(note_question, answer);
        press(*notes, Qt::Key_Escape);
        EXPECT_EQ(window().findChild<QDialog*>(u"Roll_notes"_s) != nullptr, stays);
        EXPECT_EQ(note_of(2), in_store);
        if (!stays && in_store.isEmpty())
            notes = &open_notes();
    }
}

TEST_F(NotesDialogTest, ANoteThatOthersChangedIsToldAndTheCursorStaysInIt)
{
    start();
    auto& notes = open_notes();
    type(notes, u"Rain"_s);
    place.in_database(u"INSERT INTO [tbl_weekly_memo] ([weekly_date_id],[Notes]) VALUES (2,'Snow');"_s);
    place.dialogue.expect_box(
        u"This note has been changed by another user. Saving it once more puts yours in its place."_s, u"Snow"_s);
    press(notes, Qt::Key_S, Qt::ControlModifier);
    EXPECT_EQ(notes.focusWidget()->objectName(), u"note"_s);
    EXPECT_EQ(child<QPlainTextEdit>(notes, u"note"_s).toPlainText(), u"Rain"_s);
    press(notes, Qt::Key_S, Qt::ControlModifier);
    EXPECT_EQ(note_of(2), u"Rain"_s);
}

TEST_F(NotesDialogTest, ANoteThatCannotBeStoredStaysWithItsDateHoweverItIsLeft)
{
    start();
    auto& notes = open_notes();
    type(notes, u"Rain"_s);
    place.in_database(u"ALTER TABLE [tbl_weekly_memo] RENAME TO [gone];"_s);
    for (const auto way : {Qt::Key_Down, Qt::Key_Escape}) {
        if (way == Qt::Key_Down)
            child<QListWidget>(notes, u"note_dates"_s).setFocus();
        place.dialogue.expect_confirm_or_cancel(note_question, true);
        place.dialogue.expect_box(u"Unable to save the note"_s);
        press(notes, way);
        EXPECT_TRUE(notes.isVisible());
        EXPECT_EQ(child<QListWidget>(notes, u"note_dates"_s).currentRow(), 0);
        EXPECT_EQ(child<QPlainTextEdit>(notes, u"note"_s).toPlainText(), u"Rain"_s);
    }
    place.dialogue.expect_confirm_or_cancel(note_question, false);
    press(notes, Qt::Key_Escape);
    EXPECT_EQ(window().findChild<QDialog*>(u"Roll_notes"_s), nullptr);
}

} // namespace kindrel::test
