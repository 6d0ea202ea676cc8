#include "core/security_setup.h"

#include "workplace.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

namespace {

const QString no_password = u"Unable to exit the security area as you have set security on without adding a password"_s;
const QString no_access_area =
    u"You have entered a password without entering any access areas to it, unable to exit security setup until you enter "
    "at least one access area to all passwords"_s;
const QString nobody_gets_back =
    u"Unable to exit the security area as you do not have at least one password setup to enter the security area, you "
    "must have a password setup to enter the security area so that you do not get locked out"_s;
const QString operational = u"Security will become operational the next time a user enters Kindrel"_s;
const QString exit_first =
    u"Before the changes can take effect you need to exit Kindrel and re-enter it using your password"_s;
const QString used_already = u"This Password has already been used"_s;
const QString maximum = u"The maximum amount of passwords available has been reached."_s;

} // namespace

class SecuritySetupTest : public EngineTest
{
protected:
    void SetUp() override
    {
        EngineTest::SetUp();
        if (church)
            place.emplace(*church);
    }
    [[nodiscard]] SecuritySetup open()
    {
        auto setup = SecuritySetup::open(place->office);
        EXPECT_TRUE(setup);
        return std::move(*setup);
    }
    /// A setup that may be left: security on and one password that opens it.
    [[nodiscard]] SecuritySetup set_up(const QString& password)
    {
        auto setup = open();
        setup.switch_on(true);
        EXPECT_EQ(setup.add(password), 0);
        EXPECT_TRUE(setup.set_area(0, Area::security, true));
        return setup;
    }
    /// Passwords whose owners only the database knows.
    void add_strangers(int count)
    {
        for (int user = 1; user <= count; ++user)
            session().execute(u"INSERT INTO [tbl_security] ([security_id],[user_id],[password],[area]) VALUES "
                              "(?,?,'no hash','Security');"_s,
                              user, user);
        (void)session().allocate(Entity::user, count);
        (void)session().allocate(Entity::security, count);
    }
    [[nodiscard]] ScriptedDialogue& dialogue() { return place->dialogue; }

    std::optional<Workplace> place;
};
KINDREL_ON_BOTH_ENGINES(SecuritySetupTest);

TEST_P(SecuritySetupTest, TheLeavingRulesAreMetOneAfterTheOther)
{
    auto setup = open();
    setup.switch_on(true);
    dialogue().expect_box(no_password);
    EXPECT_FALSE(setup.leave());

    ASSERT_EQ(setup.add(u"green"_s), 0);
    dialogue().expect_box(no_access_area);
    EXPECT_FALSE(setup.leave());
    EXPECT_EQ(setup.faulty(), 0);

    ASSERT_TRUE(setup.set_area(0, Area::roll, true));
    dialogue().expect_box(nobody_gets_back);
    EXPECT_FALSE(setup.leave());
    EXPECT_FALSE(setup.faulty());
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_security];"_s), 0) << "A refused setup was saved.";

    ASSERT_TRUE(setup.set_area(0, Area::security, true));
    dialogue().expect_box(operational);
    EXPECT_TRUE(setup.leave());
    EXPECT_TRUE(read_settings(session()).Security);
}

TEST_P(SecuritySetupTest, WhatWasSetUpIsThereAgainWithOneRowForEachPasswordAndArea)
{
    auto setup = set_up(u"green"_s);
    ASSERT_TRUE(setup.set_people(0, {u" Ann  Naismith"_s, u"  "_s, u"Ben"_s}));
    ASSERT_TRUE(setup.set_email(0, u"The office"_s, u"office@example.org "_s));
    ASSERT_EQ(setup.add(u"blue"_s), 1);
    for (const Area area : {Area::read_only_family_data, Area::roll, Area::roll, Area::tagging})
        ASSERT_TRUE(setup.set_area(1, area, true));
    ASSERT_TRUE(setup.set_area(1, Area::tagging, false));
    dialogue().expect_box(operational);
    ASSERT_TRUE(setup.leave());

    const auto again = open();
    EXPECT_TRUE(again.switched_on());
    EXPECT_EQ(again.users(), setup.users());
    EXPECT_FALSE(again.altered());
    EXPECT_EQ(again.title(0), u"Ann Naismith, Ben"_s);
    EXPECT_EQ(again.title(1), u"Password 2"_s);
    EXPECT_EQ(again.users()[0].email_address, u"office@example.org"_s);
    EXPECT_NE(again.users()[0].user_id, again.users()[1].user_id);
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_security];"_s), 3);
}

TEST_P(SecuritySetupTest, APasswordThatWasSetUpLetsItsUserInAndAChangedOneNoMore)
{
    const auto enters = [this](const QString& password) {
        dialogue().expect_text(u"Please enter your password to gain access to Kindrel."_s, password);
        return enter_by_password(place->office, place->progress, {.tries = 1, .recovery = nullptr});
    };
    auto setup = set_up(u"green"_s);
    dialogue().expect_box(operational);
    ASSERT_TRUE(setup.leave());
    const int user_id = setup.users()[0].user_id;
    EXPECT_TRUE(enters(u"green"_s));
    EXPECT_EQ(place->office.user_id, user_id);

    ASSERT_TRUE(setup.change_password(0, u"red"_s));
    place->office.settings.Security = true;
    dialogue().expect_box(exit_first);
    ASSERT_TRUE(setup.leave());
    EXPECT_TRUE(enters(u"red"_s));
    EXPECT_EQ(place->office.user_id, user_id);
    dialogue().expect_text(u"Please enter your password to gain access to Kindrel."_s, u"green"_s);
    dialogue().expect_box(u"Incorrect password"_s);
    EXPECT_FALSE(enter_by_password(place->office, place->progress, {.tries = 1, .recovery = nullptr}));
}

TEST_P(SecuritySetupTest, TwoUsersCannotHaveTheSamePassword)
{
    auto setup = set_up(u"caf\u00e9"_s);
    ASSERT_EQ(setup.add(u"blue"_s), 1);

    dialogue().expect_box(used_already);
    EXPECT_FALSE(setup.add(u"cafe\u0301"_s));
    dialogue().expect_box(used_already);
    EXPECT_FALSE(setup.change_password(1, u"caf\u00e9"_s));
    EXPECT_TRUE(setup.change_password(0, u"caf\u00e9"_s)) << "Its own password is not another's.";
    dialogue().expect_box(u"Please enter a password first before attempting to add it"_s);
    EXPECT_FALSE(setup.add({}));
    EXPECT_EQ(setup.users().size(), 2U);
}

TEST_P(SecuritySetupTest, FiftyPasswordsAreTheMost)
{
    add_strangers(49);
    auto setup = open();
    EXPECT_EQ(setup.add(u"green"_s), 49);
    dialogue().expect_box(maximum);

    EXPECT_FALSE(setup.add(u"blue"_s));

    EXPECT_EQ(setup.users().size(), 50U);
}

TEST_P(SecuritySetupTest, WithNoPasswordSelectedEveryActSaysWhatIsMissing)
{
    auto setup = set_up(u"green"_s);
    const QString select = u"Please select a password in the list box first that you wish to "_s;
    for (const int place_ : {-1, 1}) {
        dialogue().expect_box(select + u"add security access to"_s);
        EXPECT_FALSE(setup.set_area(place_, Area::roll, true));
        dialogue().expect_box(select + u"attach people to"_s);
        EXPECT_FALSE(setup.set_people(place_, {u"Ann"_s}));
        dialogue().expect_box(select + u"add an e-mail name and address to"_s);
        EXPECT_FALSE(setup.set_email(place_, u"Ann"_s, {}));
        dialogue().expect_box(select + u"change"_s);
        EXPECT_FALSE(setup.change_password(place_, u"blue"_s));
        dialogue().expect_box(u"Please select a password first before attempting to remove it."_s);
        EXPECT_FALSE(setup.remove(place_));
    }
}

TEST_P(SecuritySetupTest, ARemovedUserTakesItsRememberedAddresseesAlongButNotWhatIsPast)
{
    add_strangers(2);
    for (int user = 1; user <= 2; ++user) {
        session().execute(u"INSERT INTO [tbl_email_memory] ([user_id],[surname_id],[person_id]) VALUES (?,1,1);"_s,
                          user);
        session().execute(u"INSERT INTO [tbl_security_archive] ([user_id],[entered]) VALUES (?,'2024');"_s, user);
    }
    auto setup = open();
    const QString confirm = u"Please confirm that you wish to remove this password."_s;
    dialogue().expect_confirm(confirm, Answer::no, Answer::no);
    EXPECT_FALSE(setup.remove(0));
    dialogue().expect_confirm(confirm, Answer::yes);
    ASSERT_TRUE(setup.remove(0));
    ASSERT_TRUE(setup.leave());

    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_security];"_s), 1);
    EXPECT_EQ(number_of(session(), u"SELECT MIN([user_id]) FROM [tbl_email_memory];"_s), 2);
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_security_archive];"_s), 2);
}

TEST_P(SecuritySetupTest, LeavingSaysOnlyWhatMattersToTheUser)
{
    auto untouched = open();
    EXPECT_TRUE(untouched.leave());

    auto prepared = set_up(u"green"_s);
    prepared.switch_on(false);
    EXPECT_TRUE(prepared.altered());
    EXPECT_TRUE(prepared.leave());
    EXPECT_FALSE(read_settings(session()).Security);
    EXPECT_EQ(open().users().size(), 1U);

    auto in_use = open();
    in_use.switch_on(true);
    place->office.settings.Security = true;
    dialogue().expect_box(exit_first);
    EXPECT_TRUE(in_use.leave());
    EXPECT_TRUE(in_use.leave()) << "What is saved is saved.";
}

TEST_P(SecuritySetupTest, ASetupThatCannotBeSavedLeavesTheOldOneWhole)
{
    add_strangers(2);
    auto setup = open();
    ASSERT_TRUE(setup.set_area(0, Area::roll, true));
    session().execute(u"ALTER TABLE [tbl_security] DROP COLUMN [email_name];"_s);
    dialogue().expect_box(u"The security setup could not be saved, it is as it was before."_s);

    EXPECT_FALSE(setup.leave());

    EXPECT_TRUE(setup.altered());
    EXPECT_EQ(number_of(session(), u"SELECT COUNT(*) FROM [tbl_security];"_s), 2);
}

TEST_P(SecuritySetupTest, WithoutTheRightTheSetupStaysClosed)
{
    place->grant_only({Area::roll});
    dialogue().expect_box(u"Your password does not give access to \"Security\""_s);

    EXPECT_FALSE(SecuritySetup::open(place->office));
}

TEST_P(SecuritySetupTest, NoPasswordStandsInClearInTheChurchOrInAnyMessage)
{
    const QString question = u"Please enter your password to gain access to Kindrel."_s;
    auto setup = set_up(u"Blue-Umbrella"_s);
    dialogue().expect_box(used_already);
    EXPECT_FALSE(setup.add(u"Blue-Umbrella"_s));
    dialogue().expect_box(operational);
    ASSERT_TRUE(setup.leave());
    dialogue().expect_text(question, u"Wrong-Umbrella"_s);
    dialogue().expect_box(u"Incorrect password"_s);
    dialogue().expect_text(question, u"Blue-Umbrella"_s);
    ASSERT_TRUE(enter_by_password(place->office, place->progress, {.recovery = nullptr}));

    const QString copy = church->folder() + u"/copy.kdl"_s;
    session().copy_to(copy);
    EXPECT_FALSE(DataFolder::read(copy).contains("Umbrella"));
    for (const auto& message : dialogue().seen())
        EXPECT_FALSE((message.text + message.more).contains(u"Umbrella"_s));
}

} // namespace kindrel::test
