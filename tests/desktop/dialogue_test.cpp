#include "desktop/shell/dialogue.h"

#include "desktop/desktop_fixture.h"
#include "desktop/shell/progress.h"

#include <QApplication>
#include <QDialog>
#include <QLineEdit>
#include <QListWidget>
#include <QMessageBox>
#include <QProgressDialog>
#include <QPushButton>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace std::chrono_literals;
using core::Answer;

namespace {

/// Answers each box as soon as it stands, on a clock of its own that is past the deaf time.
class DialogueTest : public testing::Test
{
protected:
    /// What is done to the next box; closes it in the end so that no test hangs.
    void when_asked(const std::function<void(QDialog&)>& act)
    {
        QMetaObject::invokeMethod(
            QCoreApplication::instance(),
            [this, act] {
                auto* box = qobject_cast<QDialog*>(QApplication::activeModalWidget());
                ASSERT_NE(box, nullptr);
                now += 1s;
                act(*box);
                closed_by_answer = !box->isVisible();
                box->close();
            },
            Qt::QueuedConnection);
    }
    void when_asked_click(QMessageBox::StandardButton button)
    {
        when_asked([button](QDialog& box) {
            QTest::mouseClick(dynamic_cast<QMessageBox&>(box).button(button), Qt::LeftButton);
        });
    }
    void when_asked_press(Qt::Key key)
    {
        when_asked([key](QDialog& box) { QTest::keyClick(&box, key); });
    }

    std::chrono::milliseconds now{0};
    bool closed_by_answer = false;
    desktop::QtDialogue dialogue{[this] {
        return now;
    }};
};

const core::Message question{u"Please confirm you wish to delete Ben from the family file"_s, u"Ben has 3 groups."_s};

} // namespace

TEST_F(DialogueTest, EnterAndEscapeGiveTheAnswerThatLosesNothing)
{
    for (const auto safe : {Answer::yes, Answer::no})
        for (const auto key : {Qt::Key_Return, Qt::Key_Escape}) {
            when_asked_press(key);
            EXPECT_EQ(dialogue.confirm(question, safe), safe == Answer::yes) << key;
            EXPECT_TRUE(closed_by_answer) << key;
        }
}

TEST_F(DialogueTest, TheOtherAnswerIsGivenByItsButton)
{
    when_asked_click(QMessageBox::Yes);
    EXPECT_TRUE(dialogue.confirm(question, Answer::no));
    when_asked_click(QMessageBox::No);
    EXPECT_FALSE(dialogue.confirm(question, Answer::yes));
}

TEST_F(DialogueTest, TheSentenceStandsAloneWithMoreBeneathIt)
{
    when_asked([](QDialog& box) {
        auto& shown = dynamic_cast<QMessageBox&>(box);
        EXPECT_EQ(shown.text(), question.text);
        EXPECT_EQ(shown.informativeText(), question.more);
        EXPECT_EQ(shown.windowTitle(), u"Caution"_s);
        QTest::keyClick(&box, Qt::Key_Return);
    });
    dialogue.show(question);
    EXPECT_TRUE(closed_by_answer);
}

TEST_F(DialogueTest, ASaveQuestionStaysOnEnterAndEscape)
{
    for (const auto key : {Qt::Key_Return, Qt::Key_Escape}) {
        when_asked_press(key);
        EXPECT_EQ(dialogue.confirm_or_cancel(question), std::nullopt) << key;
    }
    when_asked_click(QMessageBox::Yes);
    EXPECT_EQ(dialogue.confirm_or_cancel(question), true);
    when_asked_click(QMessageBox::No);
    EXPECT_EQ(dialogue.confirm_or_cancel(question), false);
}

TEST_F(DialogueTest, ABoxIsDeafInItsFirstQuarterSecond)
{
    when_asked([this](QDialog& box) {
        auto* yes = dynamic_cast<QMessageBox&>(box).button(QMessageBox::Yes);
        now -= 1s;
        for (const auto passed : {0ms, 100ms, 149ms}) {
            now += passed; // 249 in all.
            QTest::keyClick(&box, Qt::Key_Return);
            QTest::keyClick(&box, Qt::Key_Escape);
            QTest::keyClick(yes, Qt::Key_Y);
            QTest::mouseClick(yes, Qt::LeftButton);
            EXPECT_TRUE(box.isVisible());
        }
        now += 1ms;
        QTest::mouseClick(yes, Qt::LeftButton);
        EXPECT_FALSE(box.isVisible());
    });
    EXPECT_TRUE(dialogue.confirm(question, Answer::no));
}

TEST_F(DialogueTest, AHeldKeyNeverAnswers)
{
    when_asked([](QDialog& box) {
        QKeyEvent held(QEvent::KeyPress, Qt::Key_Return, Qt::NoModifier, u"\r"_s, true);
        QApplication::sendEvent(&box, &held);
        EXPECT_TRUE(box.isVisible());
        QTest::keyClick(&box, Qt::Key_Return);
    });
    dialogue.show(question);
    EXPECT_TRUE(closed_by_answer);
}

TEST_F(DialogueTest, AChoiceIsTheRowOrNothing)
{
    const QStringList churches{u"Church1"_s, u"Church2"_s, u"Church3"_s};
    when_asked([](QDialog& box) {
        QTest::keyClick(box.findChild<QListWidget*>(), Qt::Key_Down);
        QTest::keyClick(box.findChild<QListWidget*>(), Qt::Key_Return);
    });
    EXPECT_EQ(dialogue.choose(question, churches), 1);
    when_asked_press(Qt::Key_Escape);
    EXPECT_EQ(dialogue.choose(question, churches), std::nullopt);
}

TEST_F(DialogueTest, ATypedAnswerIsKeptSecretWhereAsked)
{
    when_asked([](QDialog& box) {
        auto* line = box.findChild<QLineEdit*>();
        EXPECT_EQ(line->echoMode(), QLineEdit::Password);
        QTest::keyClicks(line, u"lantern"_s);
        QTest::keyClick(line, Qt::Key_Return);
    });
    EXPECT_EQ(dialogue.ask_text(question, true), u"lantern"_s);
    when_asked_press(Qt::Key_Escape);
    EXPECT_EQ(dialogue.ask_text(question, false), std::nullopt);
}

TEST_F(DialogueTest, ALongRunIsCancelledOnlyAfterAsking)
{
    ScriptedDialogue script;
    desktop::QtProgress progress(script, [this] { return now; });
    const QString sure = u"Are you sure that you wish to cancel this report?"_s;
    progress.begin(u"Directory 1"_s, 10, sure);
    EXPECT_TRUE(progress.step(u"Adder"_s));
    EXPECT_EQ(QApplication::activeModalWidget(), nullptr) << "a short run needs no box";

    for (const auto answer : {Answer::no, Answer::yes}) {
        now += 1s;
        EXPECT_TRUE(progress.step(u"Naismith"_s));
        auto* box = qobject_cast<QProgressDialog*>(QApplication::activeModalWidget());
        ASSERT_NE(box, nullptr);
        EXPECT_EQ(box->labelText(), u"Naismith"_s);
        QTest::mouseClick(box->findChild<QPushButton*>(), Qt::LeftButton);
        now += 1s;
        script.expect_confirm(sure, answer, Answer::no);
        EXPECT_EQ(progress.step({}), answer == Answer::no);
    }
    EXPECT_TRUE(progress.step({})) << "so soon nothing is looked at";
    now += 1ms;
    script.expect_confirm(sure, Answer::yes, Answer::no);
    auto* box = qobject_cast<QProgressDialog*>(QApplication::activeModalWidget());
    QMetaObject::invokeMethod(box->findChild<QPushButton*>(), &QPushButton::click, Qt::QueuedConnection);
    EXPECT_FALSE(progress.step(u"What comes now cannot be stopped"_s)) << "a new text lets a wish to stop come first";
    EXPECT_EQ(box->labelText(), u"Naismith"_s) << "it is asked under the text that it was meant for";
    progress.end();
    EXPECT_EQ(QApplication::activeModalWidget(), nullptr);
}

} // namespace kindrel::test
