#include "core/users.h"

#include "core/startup_security.h"
#include "support/processes.h"
#include "workplace.h"

#include <set>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;
using namespace std::chrono_literals;

namespace {

constexpr HashCost cheap{1, 8};

const QString question = u"Please enter your password to gain access to Kindrel."_s;
const QString incorrect = u"Incorrect password"_s;
const QString special = u"Access has been aloud via this special password. You MUST reset your security setup as this "
                        "password can only be used ONCE."_s;
const QString special_used =
    u"Access denied. This password has been used once before and can only be used once for access"_s;

QString hash(QString typed, const QByteArray& salt, HashCost cost = cheap)
{
    return hash_password(Password(std::move(typed)), salt, cost);
}

bool match(QString typed, const QByteArray& salt, const QString& stored)
{
    const Password password(std::move(typed));
    return PasswordCheck(password, salt).matches(stored);
}

/// Recovery passwords that a test knows.
RecoveryList known_recovery_list()
{
    const QByteArray salt(16, 'r');
    return {salt, {hash(u"QQQQWWWW"_s, salt), hash(u"ABCDEFGH"_s, salt)}};
}

} // namespace

TEST(PasswordsTest, TheSamePasswordGivesTheSameHashUnderOneSaltAndAnotherUnderAnother)
{
    const QByteArray salt(16, 'a');
    const QByteArray other(16, 'b');

    EXPECT_EQ(hash(u"Blue umbrella"_s, salt), hash(u"Blue umbrella"_s, salt));
    EXPECT_NE(hash(u"Blue umbrella"_s, salt), hash(u"Blue umbrella"_s, other));
    EXPECT_NE(hash(u"Blue umbrella"_s, salt), hash(u"Blue umbrella "_s, salt));
    EXPECT_NE(hash(u"Blue umbrella"_s, salt), hash(u"blue umbrella"_s, salt));
}

TEST(PasswordsTest, APasswordMatchesHoweverItsAccentsWereTypedAndWhateverItsHashCost)
{
    const QByteArray salt(16, 'a');
    const QString composed = u"caf\u00e9"_s;
    const QString decomposed = u"cafe\u0301"_s;
    for (const HashCost cost : {cheap, HashCost{2, 64}, password_cost}) {
        const QString stored = hash(composed, salt, cost);
        EXPECT_TRUE(match(decomposed, salt, stored));
        EXPECT_FALSE(match(u"cafe"_s, salt, stored));
    }
}

TEST(PasswordsTest, WhatIsNoHashMatchesNothing)
{
    const QByteArray salt(16, 'a');
    for (const auto& stored : {u""_s, u"secret"_s, u"argon2id$1$8"_s, u"argon2id$0$8$AAAA"_s, u"argon2id$x$8$AAAA"_s,
                               u"argon2id$1$99999999$AAAA"_s, u"argon2i$1$8$AAAA"_s, u"argon2id$1$8$"_s})
        EXPECT_FALSE(match(u"secret"_s, salt, stored)) << stored.toStdString();
}

TEST(PasswordsTest, WhatWasTypedIsGoneOnceItIsAPassword)
{
    QString typed = u"Blue umbrella"_s;
    const Password password(std::move(typed));

    EXPECT_TRUE(typed.isEmpty());
    EXPECT_EQ(password.bytes(), "Blue umbrella");
}

TEST(RecoveryTest, TheListHoldsSixteenHashesThatCostMoreThanAUsersPassword)
{
    const auto& list = recovery_list();

    EXPECT_EQ(list.hashes.size(), 16);
    EXPECT_EQ(std::set<QString>(list.hashes.begin(), list.hashes.end()).size(), 16U);
    for (const auto& stored : list.hashes)
        EXPECT_TRUE(stored.startsWith(u"argon2id$3$262144$"_s));
}

class UsersTest : public EngineTest
{
protected:
    void SetUp() override
    {
        EngineTest::SetUp();
        if (!church)
            return;
        place.emplace(*church);
        place->office.rights = {};
    }
    void add_user(int user_id, const QString& password, const QString& people, std::initializer_list<Area> areas)
    {
        for (const Area area : areas)
            session().execute(u"INSERT INTO [tbl_security] ([security_id],[user_id],[password],[area],[people]) "
                              "VALUES (?,?,?,?,?);"_s,
                              session().allocate(Entity::security), user_id, hash(password, church_salt(session())),
                              area_name(area).toString(), people);
    }
    [[nodiscard]] bool enter(const EntryRules& rules = {.recovery = nullptr})
    {
        return enter_by_password(place->office, place->progress, rules);
    }
    [[nodiscard]] ScriptedDialogue& dialogue() { return place->dialogue; }

    std::optional<Workplace> place;
};
KINDREL_ON_BOTH_ENGINES(UsersTest);

TEST_P(UsersTest, OneSaltIsMadeForTheChurchEvenBySeveralWorkstationsAtOnce)
{
    const auto work = [&] {
        return church_salt(*church->another());
    };
    const auto salts = run_together({work, work, work});

    EXPECT_EQ(salts[0].size(), 16);
    EXPECT_EQ(std::set<QByteArray>(salts.begin(), salts.end()).size(), 1U);
    EXPECT_EQ(church_salt(session()), salts[0]);
}

TEST_P(UsersTest, TheRightPasswordBringsItsUsersRightsAndIsLogged)
{
    add_user(4, u"green"_s, u"Ann Naismith\nBen Naismith"_s, {Area::roll, Area::birth_dates});
    add_user(9, u"blue"_s, u"Cleo Ott"_s, {Area::security});
    dialogue().expect_text(question, u"green"_s);

    place->office.church_name = u"St Mary's"_s;

    ASSERT_TRUE(enter());

    EXPECT_EQ(dialogue().seen().front().more, u"St Mary's"_s);
    const Office& office = place->office;
    EXPECT_EQ(office.user_id, 4);
    EXPECT_EQ(office.user_name, u"Ann Naismith, Ben Naismith"_s);
    EXPECT_TRUE(office.may(Area::roll) && office.may(Area::birth_dates));
    EXPECT_FALSE(office.may(Area::security) || office.may(Area::full_financial));
    EXPECT_TRUE(place->clock.waits().empty());
    const auto log = entry_log(session());
    ASSERT_EQ(log.size(), 1U);
    EXPECT_EQ(log[0].user_id, 4);
    EXPECT_EQ(entered_in_words(log[0].entered), u"Wednesday, 15 May 2024 10:30 AM"_s);
}

TEST_P(UsersTest, TheEntryLogShowsTheNewestFirst)
{
    add_user(4, u"green"_s, {}, {Area::roll});
    for (const auto& time : {QTime(9, 5), QTime(23, 59), QTime(0, 0)}) {
        place->clock.set(QDateTime({2024, 2, 29}, time));
        dialogue().expect_text(question, u"green"_s);
        ASSERT_TRUE(enter());
    }

    QStringList shown;
    for (const auto& entry : entry_log(session()))
        shown += entered_in_words(entry.entered).section(u' ', -2);
    EXPECT_EQ(shown.join(u','), u"11:59 PM,09:05 AM,12:00 AM"_s);
}

TEST_P(UsersTest, WrongPasswordsAreRefusedMoreAndMoreSlowly)
{
    add_user(4, u"green"_s, {}, {Area::roll});
    for (const auto& wrong : {u"Green"_s, u"green "_s, u""_s, u"red"_s, u"a"_s, u"b"_s, u"c"_s}) {
        dialogue().expect_text(question, wrong);
        dialogue().expect_box(incorrect, QString(), u"Caution"_s);
    }
    dialogue().expect_text(question, {});

    EXPECT_FALSE(enter());

    EXPECT_EQ(place->clock.waits(), QList<std::chrono::milliseconds>({1s, 2s, 4s, 8s, 16s, 32s, 32s}));
    EXPECT_EQ(place->office.user_id, 0);
    EXPECT_FALSE(place->office.may(Area::roll));
    EXPECT_TRUE(entry_log(session()).empty());
}

TEST_P(UsersTest, ARecoveryPasswordLetsInOnce)
{
    const auto list = known_recovery_list();
    const EntryRules rules{.recovery = &list};
    dialogue().expect_text(question, u" qqqqwwww"_s);
    dialogue().expect_box(special, QString(), u"Security Information"_s);
    ASSERT_TRUE(enter(rules));
    EXPECT_TRUE(place->office.may(Area::security) && place->office.may(Area::full_financial));
    EXPECT_FALSE(place->office.may(Area::read_only_family_data));
    EXPECT_EQ(entry_log(session()).size(), 1U);

    dialogue().expect_text(question, u"QQQQWWWW"_s);
    dialogue().expect_box(special_used, QString(), u"Security Information"_s);
    dialogue().expect_text(question, u"QQQQQQQQ"_s);
    dialogue().expect_box(incorrect);
    dialogue().expect_text(question, u"ABCDEFGH"_s);
    dialogue().expect_box(special);
    EXPECT_TRUE(enter(rules));
}

TEST_P(UsersTest, OfSeveralWorkstationsThatUseOneRecoveryPasswordAtOnceOneIsAdmitted)
{
    const auto list = known_recovery_list();
    const auto work = [&] {
        const auto own = church->another();
        const SystemClock clock;
        const Password password(u"QQQQWWWW"_s);
        return QByteArray::number(static_cast<int>(use_recovery_password(*own, clock, password, list)));
    };
    const auto admitted = QByteArray::number(static_cast<int>(Recovery::admitted));
    const auto used = QByteArray::number(static_cast<int>(Recovery::used_before));

    const auto results = run_together({work, work, work, work});

    EXPECT_EQ(std::ranges::count(results, admitted), 1);
    EXPECT_EQ(std::ranges::count(results, used), 3);
}

TEST_P(UsersTest, ACommandHasOneTryAndNoUseForARecoveryPassword)
{
    add_user(4, u"green"_s, {}, {Area::roll});
    place->office.settings.Security = true;
    const StartRequest command{.purpose = Purpose::command_line};
    startup_steps::State state{command, place->progress, place->office};
    dialogue().expect_text(question, u"ABCDEFGH"_s);
    dialogue().expect_box(incorrect);
    EXPECT_FALSE(startup_steps::ask_password(state));

    dialogue().expect_text(question, u"green"_s);
    EXPECT_TRUE(startup_steps::ask_password(state));
    EXPECT_TRUE(place->office.may(Area::roll));
}

TEST_P(UsersTest, AChurchWithoutSecurityAsksNothing)
{
    const StartRequest desktop;
    startup_steps::State state{desktop, place->progress, place->office};

    EXPECT_TRUE(startup_steps::ask_password(state));

    EXPECT_TRUE(entry_log(session()).empty());
}

} // namespace kindrel::test
