#include "core/locks.h"
#include "core/side_files.h"
#include "desktop/desktop_fixture.h"
#include "desktop/shell/note_bar.h"
#include "desktop/shell/page.h"
#include "support/families.h"

#include <QLineEdit>
#include <QTableWidget>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

const QString save_question = u"The network setting has been altered. Do you wish to save it?"_s;

class NetworkPageTest : public DesktopTest
{
protected:
    void SetUp() override
    {
        elsewhere.machine = u"office-2"_s;
        begin({family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s})});
    }
    void open_page()
    {
        running->open_area(u"network"_s);
        settle();
    }
    void close_page() { press(window(), Qt::Key_W, Qt::ControlModifier); }
    [[nodiscard]] bool in_page() { return window().page()->objectName() == u"setup_Networking"_s; }
    void push(const QString& name)
    {
        tab_to(name);
        press(window(), Qt::Key_Space);
    }
    [[nodiscard]] core::Locks other_workstation()
    {
        return core::Locks(*desk().office.session, elsewhere, place.clock);
    }
    [[nodiscard]] QStringList row(int number)
    {
        QStringList words;
        for (int column = 0; column < list().columnCount(); ++column)
            words += list().item(number, column)->text();
        return words;
    }
    [[nodiscard]] QTableWidget& list() { return child<QTableWidget>(window(), u"locks"_s); }
    [[nodiscard]] std::optional<core::SideRecord> network_file()
    {
        return core::read_side_file(desk().office.paths, core::side_files::network);
    }

    FakeWorkstation elsewhere;
};

} // namespace

TEST_F(NetworkPageTest, ALockOfAnotherWorkstationIsListedWithPlaceAndTimeAndGoesOnUnlock)
{
    auto locks = other_workstation();
    ASSERT_TRUE(locks.take(core::LockKind::family, stored[0].family.Surname_ID));
    ASSERT_TRUE(locks.take(core::LockKind::custom_letter, u"Welcome"_s));
    open_page();
    ASSERT_EQ(list().rowCount(), 2);
    EXPECT_EQ(row(0), QStringList({u"Family file 'Naismith, Ann'"_s, u"office-2"_s, u"10:30 on 15/05/2024"_s}));
    EXPECT_EQ(window().page()->status(), u"2 locks"_s);

    press(window(), Qt::Key_F, Qt::ControlModifier);
    push(u"unlock"_s);

    ASSERT_EQ(list().rowCount(), 1);
    EXPECT_FALSE(locks.check(core::LockKind::family, stored[0].family.Surname_ID));
    EXPECT_TRUE(locks.check(core::LockKind::custom_letter, u"Welcome"_s));
    EXPECT_EQ(window().page()->note().text(), u"Family file 'Naismith, Ann' is unlocked."_s);
}

TEST_F(NetworkPageTest, AfterAnUnlockTheNextOneWantsAChoiceAgain)
{
    auto locks = other_workstation();
    ASSERT_TRUE(locks.take(core::LockKind::roll, 3));
    ASSERT_TRUE(locks.take(core::LockKind::roll, 4));
    open_page();
    press(window(), Qt::Key_F, Qt::ControlModifier);
    push(u"unlock"_s);
    place.dialogue.expect_box(u"You need to choose what you wish to unlock before performing the unlock function."_s);
    push(u"unlock"_s);
    EXPECT_EQ(locks.count(core::LockKind::roll), 1);
    EXPECT_TRUE(list().hasFocus());
}

TEST_F(NetworkPageTest, WhatAppearsMeanwhileIsListedOnRefresh)
{
    open_page();
    EXPECT_TRUE(visible_texts(window()).contains(u"Nothing is locked"_s));
    ASSERT_TRUE(core::Locks(desk().office).take(core::LockKind::weekly, 5));
    desk().office.session->execute(u"INSERT INTO [tbl_roll_locked] ([roll_locked]) VALUES (7);"_s);
    push(u"refresh"_s);
    ASSERT_EQ(list().rowCount(), 2);
    EXPECT_EQ(row(0).mid(1), QStringList({u"not known"_s, u"not known"_s}));
    EXPECT_EQ(row(1).at(1), u"office-1 (this workstation)"_s);
}

TEST_F(NetworkPageTest, TheNetworkIsChosenTestedAndSavedByKeyboard)
{
    const QString network = place.data.make_network();
    open_page();
    press(window(), Qt::Key_Space);
    tab_to(u"path"_s);
    type(window(), u"/nowhere"_s);
    place.dialogue.expect_box(u"Unable to find the Kindrel Data Files on '/nowhere'."_s);
    push(u"test"_s);
    EXPECT_EQ(window().focusWidget()->objectName(), u"path"_s);

    place.dialogue.expect_file(u"Folder on the network with the Kindrel files"_s, network);
    push(u"browse"_s);
    EXPECT_EQ(child<QLineEdit>(window(), u"path"_s).text(), network);
    push(u"test"_s);
    EXPECT_EQ(window().page()->note().text(),
              u"The data files are there, and this workstation can write beside them."_s);
    EXPECT_FALSE(network_file());

    press(window(), Qt::Key_S, Qt::ControlModifier);
    EXPECT_EQ(window().page()->note().text(),
              u"The network setting is saved. It takes effect the next time Kindrel is started on this computer."_s);
    ASSERT_TRUE(network_file());
    EXPECT_TRUE(network_file()->flag("network"));
    EXPECT_EQ(network_file()->text("path"), network);
    close_page();
    EXPECT_FALSE(in_page());
}

TEST_F(NetworkPageTest, AnUnsavedSettingIsAskedForOnLeaving)
{
    open_page();
    tab_to(u"path"_s);
    type(window(), u"/later"_s);
    place.dialogue.expect_confirm_or_cancel(save_question, std::nullopt);
    close_page();
    EXPECT_TRUE(in_page());

    place.dialogue.expect_confirm_or_cancel(save_question, true);
    close_page();
    EXPECT_FALSE(in_page());
    ASSERT_TRUE(network_file());
    EXPECT_EQ(network_file()->text("path"), u"/later"_s);

    open_page();
    tab_to(u"path"_s);
    type(window(), u"-never"_s);
    place.dialogue.expect_confirm_or_cancel(save_question, false);
    close_page();
    EXPECT_EQ(network_file()->text("path"), u"/later"_s);
}

} // namespace kindrel::test
