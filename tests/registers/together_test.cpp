#include "core/backup_place.h"
#include "people/family_editor.h"
#include "people/family_store.h"
#include "people/mender_people.h"
#include "people/quick_add.h"
#include "people/setup_fixture.h"
#include "people/setup_lists.h"
#include "people/tagging.h"
#include "registers/weekly_register.h"
#include "support/families.h"
#include "support/processes.h"

#include <QElapsedTimer>
#include <QSet>

#include <map>
#include <random>
#include <set>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

constexpr int processes = 4;
constexpr int families = 30;
constexpr core::Date sundays[]{{2024, 4, 28}, {2024, 5, 5}, {2024, 5, 12}};

qint64 working_milliseconds()
{
    bool set = false;
    const int seconds = qEnvironmentVariableIntValue("KINDREL_TOGETHER_SECONDS", &set);
    return 1000 * (set ? seconds : 4);
}

/// What a workstation did and was not refused, line by line: a word and what it was done to.
using Deeds = QStringList;

/// Agrees to everything, and keeps what others changed meanwhile beside what was typed.
class KeepingBoth : public YesDialogue
{
public:
    std::optional<int> choose(const core::Message&, const QStringList&) override { return 0; }
};

/// A workstation whose people do this and that, by chance.
class Colleague
{
public:
    Colleague(const core::Paths& paths, int number)
        : m_number(number), m_started(paths, &m_dialogue), m_chance(9000U + number)
    {
        m_started.workstation.machine = u"office-%1"_s.arg(number);
    }
    [[nodiscard]] QByteArray work()
    {
        using Act = void (Colleague::*)();
        constexpr Act acts[]{&Colleague::note_event, &Colleague::tag_some,   &Colleague::count,
                             &Colleague::add_family, &Colleague::remove_own, &Colleague::add_job};
        QElapsedTimer timer;
        timer.start();
        back_up();
        for (const auto act : acts)
            (this->*act)();
        while (timer.elapsed() < working_milliseconds()) {
            (this->*acts[below(std::size(acts))])();
            if (below(100) == 0)
                back_up();
        }
        for (const int person : m_carriers)
            done(u"carries"_s, person);
        return m_deeds.join(u'\n').toUtf8();
    }

private:
    [[nodiscard]] std::size_t below(std::size_t limit) { return m_chance() % limit; }
    [[nodiscard]] core::Office& office() { return m_started.office; }
    [[nodiscard]] QString mark() { return u"%1-%2"_s.arg(m_number).arg(++m_marks); }
    void done(const QString& deed, int key, const QString& text = {})
    {
        m_deeds += u"%1 %2 %3"_s.arg(deed).arg(key).arg(text);
    }

    /// An event is added to a family that anybody may work on.
    void note_event()
    {
        people::FamilyEditor editor(office());
        const int family = 1 + static_cast<int>(below(families));
        if (!editor.open(family))
            return;
        const auto event = mark();
        editor.change(u"event"_s, [&](people::FamilyFile& file) {
            file.events.push_back({core::Date{2024, 5, 1}, event});
        });
        demand(editor.save() == people::Saved::yes);
        done(u"event"_s, family, event);
        demand(editor.leave());
    }
    /// Each workstation gives and takes an item of its own.
    void tag_some()
    {
        const auto everybody = people::active_families(*office().session);
        people::WorkingList list;
        for (const auto& member : everybody.members) {
            if (below(3) == 0)
                list.members.push_back(member);
        }
        const people::TagItem item{m_number < processes ? people::TagKind::group : people::TagKind::status,
                                   m_number < processes ? m_number : 1, u"mine"_s};
        const bool give = below(2) == 0;
        if (!people::tag(office(), list, item, give ? people::TagAct::give : people::TagAct::take))
            return;
        for (const auto& member : list.members) {
            if (give)
                m_carriers.insert(member.person_id);
            else
                m_carriers.remove(member.person_id);
        }
    }
    /// A figure goes up by one.
    void count()
    {
        registers::WeeklyRegister weekly(office());
        const auto sunday = below(std::size(sundays));
        if (!weekly.enter())
            return;
        const auto& dates = weekly.dates();
        const auto known = std::ranges::find(dates, sundays[sunday], &registers::RegisterDate::date);
        if (!(known == dates.end() ? weekly.add(sundays[sunday]) : weekly.open(known->key)))
            return;
        const auto figure = weekly.rows().front().figure;
        const auto next = figure ? figure->ten_thousandths / 10'000 + 1 : 1;
        demand(weekly.enter_figure(0, QString::number(next)) && weekly.save() && weekly.leave());
        done(u"count"_s, static_cast<int>(sunday));
    }
    void add_family()
    {
        auto file = family(u"Own "_s + mark(), {u"Anna"_s, u"Jan"_s});
        people::FamilyEditor editor(office());
        editor.change(u"all"_s, [&](people::FamilyFile& empty) { empty = file; });
        demand(editor.save() == people::Saved::yes);
        m_own.push_back(editor.file().family.Surname_ID);
        done(u"add"_s, m_own.back());
        demand(editor.leave());
    }
    void remove_own()
    {
        people::FamilyEditor editor(office());
        if (m_own.empty() || !editor.open(m_own.back()))
            return;
        demand(editor.remove_family());
        done(u"remove"_s, m_own.back());
        m_own.pop_back();
    }
    void add_job()
    {
        const auto job = mark();
        if (const auto key = people::add_occupation(office(), job))
            done(u"job"_s, *key, job);
    }
    /// Of everything, while the others go on.
    void back_up()
    {
        if (const auto report = core::make_backup(office(), {}, m_started.silent))
            done(u"backup"_s, report->compacted ? 1 : 0);
    }
    /// What nobody else may stand in the way of.
    void demand(bool done) const
    {
        if (!done)
            throw std::runtime_error(m_dialogue.told.join(u'\n').toStdString());
    }

    int m_number;
    KeepingBoth m_dialogue;
    StartedOffice m_started;
    std::mt19937 m_chance;
    int m_marks = 0;
    Deeds m_deeds;
    QSet<int> m_carriers;
    std::vector<int> m_own;
};

/// What all workstations say they did.
struct Account
{
    explicit Account(const std::vector<QByteArray>& told)
    {
        for (int number = 1; const auto& one : told) {
            for (const auto& line : QString::fromUtf8(one).split(u'\n', Qt::SkipEmptyParts))
                note(number, line);
            ++number;
        }
    }
    void note(int number, const QString& line)
    {
        const auto deed = line.section(u' ', 0, 0);
        const int key = line.section(u' ', 1, 1).toInt();
        ++deeds[deed];
        if (deed == u"event")
            events[key].insert(line.section(u' ', 2));
        else if (deed == u"job")
            jobs.insert(line.section(u' ', 2));
        else if (deed == u"carries")
            carriers[number].insert(key);
        else if (deed == u"count")
            ++counted[sundays[key].stored()];
        else if (deed == u"add")
            added.insert(key);
        else if (deed == u"remove")
            added.remove(key);
    }

    std::map<QString, int> deeds;
    std::map<int, std::multiset<QString>> events; ///< By family.
    QSet<QString> jobs;
    std::map<int, QSet<int>> carriers; ///< By workstation, as each has an item of its own.
    std::map<QString, int> counted;    ///< By date.
    QSet<int> added;                   ///< Families that are not removed again.
};

} // namespace

/// Several workstations that work in one church, each in a process of its own.
class TogetherTest : public BackupPlaceTest
{
protected:
    void SetUp() override
    {
        BackupPlaceTest::SetUp();
        if (!place)
            return;
        session().execute(u"DELETE FROM [tbl_surname];"_s);
        fill_setup_lists(session());
        for (int number = 0; number < families; ++number)
            (void)people::save_family(session(), family(u"Family %1"_s.arg(number), {u"Ole"_s, u"Kari"_s}),
                                      place->started->clock.today());
        session().execute(u"INSERT INTO [tbl_weekly_project] ([weekly_project_id],[weekly_project],[position]) "
                          "VALUES (1,'Sunday',1);"_s);
        session().execute(u"INSERT INTO [tbl_weekly_group] ([group_id],[group],[position],[group_type],"
                          "[weekly_project_id]) VALUES (1,'Morning',1,1,1);"_s);
        (void)session().allocate(core::Entity::weekly_project, 1);
        (void)session().allocate(core::Entity::weekly_group, 1);
    }
    [[nodiscard]] core::Session& session() { return place->session(); }
    /// The families that should be there with their events, and the people with the items that were given to them.
    void expect_families(const Account& account)
    {
        std::vector<int> keys;
        auto rows = session().select(u"SELECT [Surname_ID] FROM [tbl_surname] ORDER BY [Surname_ID];"_s);
        for (const core::Row& row : rows)
            keys.push_back(row.integer(core::Column{0}));
        QSet<int> added;
        for (const auto& file : people::load_families(session(), keys)) {
            const int key = file.family.Surname_ID;
            if (key > families)
                added.insert(key);
            std::multiset<QString> events;
            for (const auto& event : file.events)
                events.insert(event.event);
            EXPECT_EQ(events, account.events.contains(key) ? account.events.at(key) : std::multiset<QString>()) << key;
            for (const auto& person : file.people)
                expect_items(person, account);
        }
        EXPECT_EQ(added, account.added);
    }
    static void expect_items(const people::Person& person, const Account& account)
    {
        for (const auto& [number, carriers] : account.carriers) {
            const bool in_group = number < processes;
            const auto& rows = in_group ? person.groups : person.status;
            const bool carries = std::ranges::count(rows, in_group ? number : 1, &people::LinkRow::item) == 1;
            EXPECT_EQ(carries, carriers.contains(person.person_id)) << person.person_id << " of " << number;
        }
    }
    [[nodiscard]] QSet<QString> made_jobs()
    {
        QSet<QString> found;
        for (const auto& item : people::read_setup_items(session(), people::SetupKind::occupations)) {
            if (item.key > 3)
                found.insert(item.text);
        }
        return found;
    }
    [[nodiscard]] std::map<QString, int> figures()
    {
        std::map<QString, int> found;
        auto rows = session().select(u"SELECT [weekly_date],[amount] FROM [Qry_weekly_output_anlaysis];"_s);
        for (const core::Row& row : rows)
            found[row.text(core::Column{0})] = static_cast<int>(row.amount(core::Column{1}).ten_thousandths / 10'000);
        return found;
    }
};
KINDREL_ON_BOTH_ENGINES(TogetherTest);

TEST_P(TogetherTest, NothingThatAnybodyStoredIsLostAndNoRuleIsBroken)
{
    const auto paths = place->paths();
    place->started.reset();
    std::vector<std::function<QByteArray()>> works;
    for (int number = 1; number <= processes; ++number)
        works.emplace_back([&paths, number] { return Colleague(paths, number).work(); });
    const Account account(run_together(works));
    place->started.emplace(paths);

    for (const auto& [deed, times] : account.deeds)
        RecordProperty(deed.toStdString(), times);
    for (const auto* deed : {u"event", u"carries", u"count", u"add", u"remove", u"job", u"backup"})
        EXPECT_TRUE(account.deeds.contains(QString::fromUtf16(deed))) << QString::fromUtf16(deed).toStdString();
    expect_families(account);
    EXPECT_EQ(made_jobs(), account.jobs);
    EXPECT_EQ(figures(), account.counted);
    core::MenderPlace mender{paths, 1, place->started->workstation, place->started->clock, core::connect_church(paths)};
    for (const auto& finding : core::examine_church(mender, people::mender_checks()))
        ADD_FAILURE() << finding.kind.toStdString() << ": " << finding.words.toStdString();
}

} // namespace kindrel::test
