#include "core/locks.h"
#include "core/security_setup.h"
#include "desktop/desktop_fixture.h"
#include "desktop/shell/page.h"
#include "desktop/shell/rail.h"

#include <QAbstractItemView>
#include <QCheckBox>
#include <QLineEdit>
#include <QMetaProperty>
#include <QPlainTextEdit>
#include <QTableWidget>

#include <functional>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Answer;
using core::Area;

namespace {

const QString no_password = u"Unable to exit the security area as you have set security on without adding a password"_s;
const QString no_access_area =
    u"You have entered a password without entering any access areas to it, unable to exit security setup until you "
    "enter at least one access area to all passwords"_s;
const QString nobody_gets_back =
    u"Unable to exit the security area as you do not have at least one password setup to enter the security area, you "
    "must have a password setup to enter the security area so that you do not get locked out"_s;
const QString operational = u"Security will become operational the next time a user enters Kindrel"_s;
const QString entry_question = u"Please enter your password to gain access to Kindrel."_s;
const QString confirm_removal = u"Please confirm that you wish to remove this password."_s;

/// Whatever can be read or heard of an object, lists with all their roles included.
QStringList all_texts(const QObject& object)
{
    QStringList texts;
    for (int place = 0; place < object.metaObject()->propertyCount(); ++place) {
        const QVariant value = object.metaObject()->property(place).read(&object);
        if (value.metaType() == QMetaType::fromType<QString>())
            texts += value.toString();
    }
    const auto* view = qobject_cast<const QAbstractItemView*>(&object);
    for (int cell = 0; view && cell < view->model()->rowCount() * view->model()->columnCount(); ++cell)
        for (int role = 0; role <= Qt::UserRole; ++role) {
            const int columns = view->model()->columnCount();
            texts += view->model()->index(cell / columns, cell % columns).data(role).toString();
        }
    return texts;
}

class SecurityPageTest : public DesktopTest
{
protected:
    void SetUp() override { begin(); }
    void open_page()
    {
        running->open_area(u"security"_s);
        settle();
    }
    void close_page() { press(window(), Qt::Key_W, Qt::ControlModifier); }
    [[nodiscard]] bool in_page() { return window().page()->objectName() == u"security"_s; }
    [[nodiscard]] QString focus() { return window().focusWidget()->objectName(); }

    void tick(const QString& area)
    {
        tab_to(area);
        press(window(), Qt::Key_Space);
    }
    void add_password(const QString& text)
    {
        tab_to(u"password"_s);
        type(window(), text);
        press(window(), Qt::Key_Return);
        type(window(), text);
        press(window(), Qt::Key_Return);
    }
    /// Passwords as somebody set them up before, the first with access to Security.
    void store(std::initializer_list<std::pair<QString, Area>> passwords)
    {
        auto setup = *core::SecuritySetup::open(desk().office);
        setup.switch_on(true);
        for (const auto& [password, area] : passwords) {
            const auto added = setup.add(password);
            ASSERT_TRUE(added && setup.set_people(*added, {u"Owner of %1"_s.arg(area_name(area))}) &&
                        setup.set_area(*added, area, true));
        }
        place.dialogue.expect_box(operational);
        ASSERT_TRUE(setup.leave());
    }
    [[nodiscard]] std::vector<core::User> stored_users() { return core::load_users(*desk().office.session); }
    [[nodiscard]] QTableWidget& list() { return child<QTableWidget>(window(), u"passwords"_s); }
};

} // namespace

TEST_F(SecurityPageTest, APasswordIsSetUpByKeyboardAloneAndTheLeavingRulesAreMetOneAfterTheOther)
{
    open_page();
    EXPECT_EQ(window().page()->title(), u"Security Setup"_s);
    press(window(), Qt::Key_Space);
    place.dialogue.expect_box(no_password);
    close_page();
    EXPECT_TRUE(in_page());
    EXPECT_EQ(focus(), u"password"_s);

    add_password(u"green umbrella"_s);
    EXPECT_EQ(focus(), u"people"_s);
    type(window(), u"Ann Naismith"_s);
    place.dialogue.expect_box(no_access_area);
    close_page();
    EXPECT_EQ(focus(), u"Read Only Access on Family Data"_s);

    tick(u"Roll"_s);
    place.dialogue.expect_box(nobody_gets_back);
    close_page();
    EXPECT_EQ(focus(), u"Security"_s);
    EXPECT_FALSE(window().focusWidget()->visibleRegion().isEmpty());
    EXPECT_TRUE(stored_users().empty());

    press(window(), Qt::Key_Space);
    place.dialogue.expect_box(operational);
    close_page();
    EXPECT_FALSE(in_page());
    ASSERT_EQ(stored_users().size(), 1U);
    EXPECT_EQ(stored_users()[0].people, QStringList({u"Ann Naismith"_s}));
    EXPECT_TRUE(stored_users()[0].areas.may(Area::roll));
    EXPECT_TRUE(core::read_settings(*desk().office.session).Security);
}

TEST_F(SecurityPageTest, LeavingLeadsToThePasswordThatIsAtFault)
{
    store({{u"green"_s, Area::security}, {u"blue"_s, Area::roll}});
    open_page();
    press(window(), Qt::Key_Down);
    tick(u"Roll"_s);
    tab_to(u"passwords"_s);
    press(window(), Qt::Key_Home);
    press(window(), Qt::Key_Up);
    place.dialogue.expect_box(no_access_area);
    close_page();

    EXPECT_EQ(list().currentRow(), 1);
    EXPECT_EQ(focus(), u"Read Only Access on Family Data"_s);
    EXPECT_EQ(list().item(1, 1)->text(), u"none"_s);
}

TEST_F(SecurityPageTest, TicksAndSenderOfTheChosenPasswordReachTheDatabase)
{
    store({{u"green"_s, Area::security}, {u"blue"_s, Area::roll}});
    open_page();
    press(window(), Qt::Key_Down);
    tick(u"Birth Dates Access"_s);
    tick(u"Roll"_s);
    tab_to(u"email_name"_s);
    type(window(), u"The treasurer"_s);
    press(window(), Qt::Key_Tab);
    type(window(), u"money@example.org"_s);
    place.dialogue.expect_box(operational);
    close_page();

    ASSERT_EQ(stored_users().size(), 2U);
    const core::User changed = stored_users()[1];
    EXPECT_TRUE(changed.areas.may(Area::birth_dates));
    EXPECT_FALSE(changed.areas.may(Area::roll));
    EXPECT_EQ(changed.email_name, u"The treasurer"_s);
    EXPECT_EQ(changed.email_address, u"money@example.org"_s);
    EXPECT_EQ(stored_users()[0].email_name, QString());
}

TEST_F(SecurityPageTest, NoTypedPasswordIsLeftInAnyTextOfTheWindow)
{
    open_page();
    const QString password = u"Green-umbrella-7"_s;
    tab_to(u"password"_s);
    type(window(), password);
    EXPECT_FALSE(child<QLineEdit>(window(), u"password"_s).displayText().contains(u"Green"_s));
    press(window(), Qt::Key_Return);
    type(window(), password);
    press(window(), Qt::Key_Return);
    ASSERT_EQ(list().rowCount(), 1);

    for (const QObject* object : window().findChildren<QObject*>())
        for (const QString& text : all_texts(*object))
            EXPECT_FALSE(text.contains(password, Qt::CaseInsensitive))
                << object->objectName().toStdString() << ": " << text.toStdString();
}

TEST_F(SecurityPageTest, TwoDifferentSpellingsAddNothing)
{
    open_page();
    tab_to(u"password"_s);
    type(window(), u"green"_s);
    press(window(), Qt::Key_Return);
    type(window(), u"greem"_s);
    press(window(), Qt::Key_Return);

    EXPECT_EQ(list().rowCount(), 0);
    EXPECT_EQ(focus(), u"password_again"_s);
    EXPECT_TRUE(visible_texts(window()).contains(u"Not the same"_s));
    type(window(), u"green"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(list().rowCount(), 1);
}

TEST_F(SecurityPageTest, WithoutAChosenPasswordEachActSaysWhatToDoAndLeavesNothingBehind)
{
    const auto first_choose = [](const QString& act) {
        return u"Please select a password in the list box first that you wish to %1"_s.arg(act);
    };
    const auto press_on = [this](const QString& name) {
        tab_to(name);
        press(window(), Qt::Key_Space);
    };
    const auto type_in = [this](const QString& name) {
        tab_to(name);
        type(window(), u"x"_s);
    };
    struct Case
    {
        QString refusal;
        std::function<void()> act;
    };
    const Case cases[]{
        {u"Please select a password first before attempting to remove it."_s,
         [&] {
             press_on(u"remove"_s);
         }},
        {first_choose(u"change"_s),
         [&] {
             press_on(u"change"_s);
         }},
        {first_choose(u"add security access to"_s),
         [&] {
             press_on(u"Roll"_s);
         }},
        {first_choose(u"attach people to"_s),
         [&] {
             type_in(u"people"_s);
         }},
        {first_choose(u"add an e-mail name and address to"_s),
         [&] {
             type_in(u"email_address"_s);
         }},
        {u"Please enter a password first before attempting to add it"_s,
         [&] {
             press_on(u"add"_s);
         }},
    };
    open_page();
    for (const Case& one : cases) {
        place.dialogue.expect_box(one.refusal);
        one.act();
        place.dialogue.verify();
    }
    EXPECT_FALSE(child<QCheckBox>(window(), u"Roll"_s).isChecked());
    EXPECT_EQ(child<QPlainTextEdit>(window(), u"people"_s).toPlainText(), QString());
    EXPECT_EQ(child<QLineEdit>(window(), u"email_address"_s).text(), QString());
    EXPECT_FALSE(window().page()->altered());
}

TEST_F(SecurityPageTest, DeleteRemovesTheChosenPasswordAfterAsking)
{
    store({{u"green"_s, Area::security}, {u"blue"_s, Area::roll}});
    open_page();
    press(window(), Qt::Key_Down);
    place.dialogue.expect_confirm(confirm_removal, Answer::no, Answer::no);
    press(window(), Qt::Key_Delete);
    EXPECT_EQ(list().rowCount(), 2);

    place.dialogue.expect_confirm(confirm_removal, Answer::yes, Answer::no);
    press(window(), Qt::Key_Delete);
    EXPECT_EQ(list().rowCount(), 1);
    place.dialogue.expect_box(operational);
    close_page();
    EXPECT_EQ(stored_users().size(), 1U);
}

TEST_F(SecurityPageTest, ThePasswordTypedAtTheStartDecidesWhichAreasAreGrey)
{
    store({{u"green"_s, Area::security}, {u"blue"_s, Area::report_outputs}});
    place.dialogue.expect_text(entry_question, u"red"_s);
    place.dialogue.expect_box(u"Incorrect password"_s);
    place.dialogue.expect_text(entry_question, u"blue"_s);
    begin_again();

    EXPECT_FALSE(child<desktop::RailButton>(window(), u"security"_s).isEnabled());
    EXPECT_FALSE(child<desktop::RailButton>(window(), u"network"_s).isEnabled());
    EXPECT_TRUE(child<desktop::RailButton>(window(), u"reports"_s).isEnabled());
    open_page();
    EXPECT_FALSE(in_page());
}

TEST_F(SecurityPageTest, ThePageIsForOnePersonAtATimeAndIsFreeAgainOnceClosed)
{
    core::Office& office = desk().office;
    office.mode = core::Mode::network;
    FakeWorkstation elsewhere;
    elsewhere.machine = u"office-2"_s;
    core::Locks other(*office.session, elsewhere, place.clock);
    ASSERT_TRUE(other.take(core::LockKind::area, core::AreaCode::security));
    place.dialogue.expect_box(
        u"Unable to enter the Security area as another user is presently in the Security area."_s);
    open_page();
    EXPECT_FALSE(in_page());

    other.release(core::LockKind::area, core::AreaCode::security);
    open_page();
    EXPECT_TRUE(in_page());
    EXPECT_TRUE(other.check(core::LockKind::area, core::AreaCode::security));
    close_page();
    EXPECT_FALSE(other.check(core::LockKind::area, core::AreaCode::security));
}

} // namespace kindrel::test
