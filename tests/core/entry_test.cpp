#include "core/entry.h"

#include "support/processes.h"
#include "workplace.h"

#include <QCoreApplication>
#include <QFile>

#include <algorithm>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

namespace {

const QString mender = u"If you are permanently locked out use the 'Kindrel Mender' program to unlock the area."_s;
const QString being_set_up =
    u"To insure the integrity of your data files nobody is allowed into this area while another "
    "user is altering the lists that it works with. "_s +
    mender;
const QString one_in_setup =
    u"To protect the integrity of your data only one person is allowed into the setup area at a time. If you are "
    "permanently locked out of this area the 'Kindrel Mender' program will unlock the setup areas."_s;
const QString project_in_use =
    u"To protect the integrity of your data nobody is allowed to alter the %1 setup area while a user is working with %1 "
    "data. If you are permanently locked out of this area the 'Kindrel Mender' program will remove all locks."_s;

/// An area that is closed because somebody holds a lock.
struct Refusal
{
    AreaId area;
    LockKind kind;
    LockKey key;
    QString held; ///< The lock in words.
    QString sentence, explanation = {};
};

/// Where people work, refused while their setup is open.
std::vector<Refusal> working_refusals()
{
    const auto setup = [](AreaId area, AreaCode code, const QString& held, const QString& sentence) {
        return Refusal{area, LockKind::area, code, held, sentence, being_set_up};
    };
    const QString in_setup = u"Setup area"_s;
    const QString in_projects = u"Roll/Finance/Weekly setup area"_s;
    return {
        setup(AreaId::family_editor, AreaCode::setup, in_setup,
              u"Unable to enter the family file editor as another user is in the setup area of Kindrel"_s),
        setup(AreaId::roster, AreaCode::setup, in_setup,
              u"Unable to enter the Roster program as another user is in the setup area of Kindrel"_s),
        setup(AreaId::roster, AreaCode::roster_setup, u"Roster setup area"_s,
              u"Unable to enter the Roster program as another user is in the setup area of Kindrel"_s),
        setup(AreaId::tagging, AreaCode::setup, in_setup,
              u"Unable to enter the Tagging program as another user is in the setup area of Kindrel"_s),
        setup(AreaId::organiser, AreaCode::setup, in_setup,
              u"Unable to enter the Organiser program, another user is in the setup area of Kindrel"_s),
        setup(AreaId::roll, AreaCode::setup, in_setup,
              u"Unable to enter the Roll program as another user is in the setup area of Kindrel"_s),
        setup(AreaId::roll, AreaCode::project_setup, in_projects,
              u"Unable to enter the Roll program as another user is in the setup area of Kindrel"_s),
        setup(AreaId::finance, AreaCode::setup, in_setup,
              u"Unable to enter the Finance program as another user is in the setup area of Kindrel"_s),
        setup(AreaId::weekly, AreaCode::setup, in_setup,
              u"Unable to enter the Weekly Statistics program as another user is in the setup area of Kindrel"_s),
        setup(AreaId::wardline, AreaCode::setup, in_setup,
              u"Unable to enter the Wardline program as another user is in the setup area of Kindrel"_s),
        setup(AreaId::wardline, AreaCode::wardline_setup, u"Wardline setup area"_s,
              u"Unable to enter the Wardline program as another user is in the setup area of Kindrel"_s),
    };
}

/// What only one person may do, and setups refused while somebody works with what they set up.
std::vector<Refusal> exclusive_refusals()
{
    const QString in_setup = u"Setup area"_s;
    const QString in_projects = u"Roll/Finance/Weekly setup area"_s;
    return {
        {AreaId::visitation, LockKind::area, AreaCode::visitation, u"Visitation area"_s,
         u"Unable to enter the Visitation area as another user is working on the Visitation notes"_s,
         u"To insure the integrity of your data files only one user at a time is allowed to work on the Visitation "
         "notes. "_s +
             mender},
        {AreaId::family_setup, LockKind::family, 7, u"Family file 7"_s,
         u"Unable to enter the Kindrel setup area as another user is editing a family file."_s},
        {AreaId::family_setup, LockKind::roll, 7, u"Roll project 7"_s,
         u"Unable to enter the Kindrel setup area as another user is using the Roll Program."_s},
        {AreaId::family_setup, LockKind::finance, 7, u"Finance project 7"_s,
         u"Unable to enter the Kindrel setup area as another user is using the Finance Program."_s},
        {AreaId::family_setup, LockKind::weekly, 7, u"Weekly project 7"_s,
         u"Unable to enter the Kindrel setup area as another user is using the Weekly Statisitcs Program."_s},
        {AreaId::family_setup, LockKind::area, AreaCode::setup, in_setup,
         u"Unable to enter the setup area as another user is presently in the setup area."_s, one_in_setup},
        {AreaId::project_setup, LockKind::roll, 7, u"Roll project 7"_s,
         u"Unable to enter the Roll setup area as another user is currently working in the Roll program."_s,
         project_in_use.arg(u"Roll"_s)},
        {AreaId::project_setup, LockKind::finance, 7, u"Finance project 7"_s,
         u"Unable to enter the Finance setup area as another user is currently working in the Finance program."_s,
         project_in_use.arg(u"Finance"_s)},
        {AreaId::project_setup, LockKind::weekly, 7, u"Weekly project 7"_s,
         u"Unable to enter the Weekly Statistics setup area as another user is currently working in the Weekly "
         "Statistics program."_s,
         project_in_use.arg(u"Weekly Statistics"_s)},
        {AreaId::project_setup, LockKind::area, AreaCode::project_setup, in_projects,
         u"Unable to enter the Roll/Finance/Weekly setup area as another user is presently in the setup area."_s,
         one_in_setup},
        {AreaId::roster_setup, LockKind::roster, 7, u"Roster project 7"_s,
         u"Unable to enter the Roster setup area as another user is currently working in the Roster program."_s,
         project_in_use.arg(u"Roster"_s)},
        {AreaId::roster_setup, LockKind::area, AreaCode::setup, in_setup,
         u"Unable to enter the Roster setup area as another user is presently in the setup area."_s, one_in_setup},
        {AreaId::roster_setup, LockKind::area, AreaCode::roster_setup, u"Roster setup area"_s,
         u"Unable to enter the Roster setup area as another user is presently in the setup area."_s, one_in_setup},
        {AreaId::wardline_setup, LockKind::wardline, 7, u"Wardline compliance 7"_s,
         u"Unable to enter the Wardline setup area as another user is currently working in the Wardline program."_s,
         project_in_use.arg(u"Wardline"_s)},
        {AreaId::security, LockKind::area, AreaCode::security, u"Security area"_s,
         u"Unable to enter the Security area as another user is presently in the Security area."_s,
         u"To protect the integrity of your data only one person is allowed into the Security area at a time. If you are "
         "permanently locked out of this area the 'Kindrel Mender' program will unlock the area."_s},
    };
}

/// Whom nobody answers.
class Unheard : public Dialogue
{
public:
    void show(const Message&) override {}
    bool confirm(const Message&, Answer safe) override { return safe == Answer::yes; }
    std::optional<bool> confirm_or_cancel(const Message&) override { return {}; }
    std::optional<QString> ask_text(const Message&, bool) override { return {}; }
    std::optional<int> choose(const Message&, const QStringList&) override { return {}; }
    std::optional<QString> choose_file(const FileQuestion&) override { return {}; }
    void play(const QString&) override {}
};

} // namespace

class EntryTest : public EngineTest
{
protected:
    void SetUp() override
    {
        EngineTest::SetUp();
        if (!church)
            return;
        here.emplace(*church, u"office-1"_s);
        there.emplace(*church, u"office-2"_s);
    }
    std::optional<Workplace> here, there;
};
KINDREL_ON_BOTH_ENGINES(EntryTest);

TEST_P(EntryTest, AnAreaIsRefusedWhileALockStandsInItsWayAndOpenOnceItIsReleased)
{
    auto refusals = working_refusals();
    std::ranges::copy(exclusive_refusals(), std::back_inserter(refusals));
    for (const auto& refusal : refusals) {
        SCOPED_TRACE(refusal.sentence.toStdString());
        ASSERT_TRUE(there->locks.take(refusal.kind, refusal.key));
        QStringList beneath{refusal.explanation,
                            refusal.held + u" is held by the workstation 'office-2' since 10:30 on 15/05/2024."_s};
        beneath.removeAll(QString());
        here->dialogue.expect_box(refusal.sentence, beneath.join(u'\n'), u"Caution"_s);

        EXPECT_FALSE(enter(here->office, refusal.area));

        there->locks.release(refusal.kind, refusal.key);
        EXPECT_TRUE(enter(here->office, refusal.area));
        EXPECT_TRUE(here->locks.all().empty()) << "Something is still locked after leaving.";
    }
}

TEST_P(EntryTest, AnAreaForOnePersonIsHeldUntilItIsLeft)
{
    auto visiting = enter(here->office, AreaId::visitation);
    ASSERT_TRUE(visiting);
    EXPECT_TRUE(there->locks.check(LockKind::area, AreaCode::visitation));

    std::optional moved(std::move(*visiting));
    visiting.reset();
    EXPECT_TRUE(there->locks.check(LockKind::area, AreaCode::visitation));

    auto setting_up = enter(here->office, AreaId::family_setup);
    ASSERT_TRUE(setting_up);
    *moved = std::move(*setting_up);
    EXPECT_EQ(moved->area(), AreaId::family_setup);
    EXPECT_FALSE(there->locks.check(LockKind::area, AreaCode::visitation));
    moved.reset();
    EXPECT_TRUE(there->locks.all().empty());
}

TEST_P(EntryTest, ManyWorkWithPeopleAtOnceAndNobodyDeletesThemMeanwhile)
{
    const std::array areas{AreaId::roll, AreaId::finance, AreaId::roster, AreaId::wardline};
    for (const AreaId area : areas) {
        const auto one = enter(here->office, area);
        const auto other = enter(there->office, area);
        ASSERT_TRUE(one && other);
        here->dialogue.expect_box(
            u"Unable to delete people as currently another user has an area of the program active "
            "in which they are working with peoples files."_s);

        EXPECT_FALSE(may_delete_people(here->office));
        EXPECT_TRUE(here->dialogue.seen().back().more.startsWith(
            u"To protect the integrity of your data, Kindrel only allows people to be deleted when other users are not "
            "working with people. If no user is on the system then you will need to run the 'Kindrel Mender' program to "
            "remove all locks.\n"_s));
        EXPECT_EQ(here->dialogue.seen().back().more.count(u'\n'), 2);
    }
    EXPECT_TRUE(may_delete_people(here->office));
}

TEST_P(EntryTest, NoMoreThanFiveHoldersAreNamed)
{
    for (int family = 1; family <= 7; ++family)
        ASSERT_TRUE(there->locks.take(LockKind::family, family));
    here->dialogue.expect_box(u"Unable to enter the Kindrel setup area as another user is editing a family file."_s);

    EXPECT_FALSE(enter(here->office, AreaId::family_setup));

    const auto lines = here->dialogue.seen().back().more.split(u'\n');
    EXPECT_EQ(lines.size(), 6);
    EXPECT_EQ(lines.back(), u"And 2 more."_s);
}

TEST_P(EntryTest, NoAreaOpensWithoutARightToIt)
{
    here->grant_only({});
    for (int area = 0; area < area_id_count; ++area) {
        EXPECT_FALSE(may_enter(here->office, static_cast<AreaId>(area)));
    }
    here->dialogue.expect_box(u"Your password does not give access to \"Roll\""_s);
    EXPECT_FALSE(enter(here->office, AreaId::roll));
    here->dialogue.expect_box(u"Your password does not give access to \"Full Financial Access\""_s);
    EXPECT_FALSE(enter(here->office, AreaId::finance));
    here->dialogue.expect_box(u"Your password does not give access to \"Security\""_s);
    EXPECT_FALSE(permitted(here->office, Area::security));

    here->grant_only({Area::pin_financial_only, Area::read_only_family_data});
    EXPECT_TRUE(enter(here->office, AreaId::finance));
    EXPECT_TRUE(enter(here->office, AreaId::family_editor));
    EXPECT_FALSE(may_enter(here->office, AreaId::roll));
}

TEST_P(EntryTest, BookedOutDataKeepTheAreasClosedThatWouldAlterWhatIsNotBookedOut)
{
    here->office.mode = Mode::booked_out;
    const QString only_booked =
        u"When in this mode you can only edit the family files that are booked out. All family files "
        "can be viewed, reports can be run, analysis can be conducted on all the data."_s;
    const QString no_wardline = u"The Wardline area is not available when in Booked Out Mode"_s;
    const std::tuple<AreaId, QString, QString> cases[]{
        {AreaId::wardline, no_wardline, QString()},
        {AreaId::wardline_setup, no_wardline, QString()},
        {AreaId::family_setup, u"Unable to alter data while in Remote Access Mode"_s, only_booked},
        {AreaId::restore, u"Unable to perform this function as Kindrel is in Remote Access Mode"_s, only_booked},
    };
    for (const auto& [area, sentence, more] : cases) {
        here->dialogue.expect_box(sentence, more);
        EXPECT_FALSE(enter(here->office, area));
    }
    EXPECT_TRUE(enter(here->office, AreaId::family_editor));
    EXPECT_TRUE(enter(here->office, AreaId::backup));
}

TEST_P(EntryTest, NobodyEntersWhileTheNetworkIsBroken)
{
    ASSERT_TRUE(QFile::remove(here->office.paths.database()));
    here->dialogue.expect_box(u"Unable to access your network files."_s);

    EXPECT_FALSE(enter(here->office, AreaId::visitation));

    EXPECT_TRUE(there->locks.all().empty());
}

TEST_P(EntryTest, AChurchOnOneComputerTakesNoAreaLocksAndMindsNone)
{
    here->office.mode = Mode::normal;
    EXPECT_EQ(here->office.shared(), GetParam() == EngineKind::postgres) << "A server is shared in every mode.";
    if (here->office.shared())
        return;
    ASSERT_TRUE(there->locks.take(LockKind::area, AreaCode::setup));

    const auto roll = enter(here->office, AreaId::roll);

    EXPECT_TRUE(roll);
    EXPECT_EQ(here->locks.all().size(), 1U);
}

TEST_P(EntryTest, HoweverTheyHurryOnePersonIsInTheSetupAndNobodyInAFamilyMeanwhile)
{
    /// Goes in and out, and tells how often it was not alone there.
    const auto worker = [&](const std::function<int(Workplace&)>& visit) {
        return [this, visit] {
            Unheard dialogue;
            Workplace workplace(*church, u"office-%1"_s.arg(QCoreApplication::applicationPid()), &dialogue);
            int company = 0;
            for (int round = 0; round < 15; ++round)
                company += visit(workplace);
            return QByteArray::number(company);
        };
    };
    const auto setup = worker([](Workplace& workplace) {
        const auto entry = enter(workplace.office, AreaId::family_setup);
        return entry ? workplace.locks.count(LockKind::area) - 1 + workplace.locks.count(LockKind::family) : 0;
    });
    const auto family = worker([](Workplace& workplace) {
        if (!workplace.locks.take(LockKind::family, 7, std::array{LockCheck{LockKind::area, AreaCode::setup}}))
            return 0;
        const int company = workplace.locks.count(LockKind::area) + workplace.locks.count(LockKind::family) - 1;
        workplace.locks.release(LockKind::family, 7);
        return company;
    });

    for (const auto& company : run_together({setup, family, setup, family}))
        EXPECT_EQ(company, "0");
    EXPECT_TRUE(here->locks.all().empty());
}

} // namespace kindrel::test
