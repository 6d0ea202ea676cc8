// The family editor against the same statements on SQLite's C interface, on the same church in the same run: saving a
// family of five with forty rows, durably and after a look whether others changed it, and moving through 200 families
// as somebody does who holds "next".

#include "bare_family.h"
#include "measure.h"
#include "quiet_dialogue.h"

#include "core/schema.h"
#include "core/sqlite_session.h"
#include "core/system_workstation.h"
#include "people/family_editor.h"
#include "people/family_store.h"
#include "sample/church.h"

#include <QCoreApplication>
#include <QTemporaryDir>

using namespace kindrel;
using namespace kindrel::bench;
using namespace Qt::StringLiterals;

namespace {

constexpr std::array sizes{1000, 10000, 60000};
constexpr int steps = 200;
constexpr int saves = 41;
const QDate today(2026, 11, 22);

/// Five people with eight rows each.
int add_family_of_five(core::Session& session)
{
    people::FamilyFile file;
    file.family.surname = u"Naismith"_s;
    for (int place = 0; place < 5; ++place) {
        auto& person = file.people.emplace_back();
        person.Name = u"Person %1"_s.arg(place);
        person.Marital = place < 2 ? 4 : 6;
        for (auto* rows : {&person.status, &person.groups, &person.flexi, &person.dates}) {
            for (const int item : {1, 2}) {
                auto& row = rows->emplace_back();
                row.item = item;
            }
        }
    }
    return people::save_family(session, file, today).family.Surname_ID;
}

void bench_save(core::Office& office, const BareDatabase& database, int people)
{
    const int key = add_family_of_five(*office.session);
    people::FamilyEditor editor(office);
    if (!editor.open(key))
        throw std::runtime_error("The family cannot be opened.");
    BareLoad bare_load(database);
    BareSave bare_save(database);
    int phone = 0;
    const auto ours = [&] {
        editor.change({}, [&](people::FamilyFile& file) { file.address.phone = QString::number(++phone); });
        if (editor.save() != people::Saved::yes)
            throw std::runtime_error("The family was not saved.");
    };
    const auto bare = [&] {
        bare_load.run(key);
        bare_save.run(key, "2026-11-22");
    };
    print("saving a family of five", people, compare(ours, bare, saves), 1.5);
}

/// Giving one lock back and taking another, in one transaction, and reading the family.
class BareStep
{
public:
    explicit BareStep(const BareDatabase& database)
        : m_begin(database.get(), "BEGIN IMMEDIATE"), m_commit(database.get(), "COMMIT"),
          m_release(database.get(), "DELETE FROM [tbl_locked_family_files] WHERE [surname_id]=?1"),
          m_take(database.get(), "INSERT INTO [tbl_locked_family_files] ([surname_id],[workstation],[process],[taken]) "
                                 "VALUES (?1,'bench',1,'2026-11-22T10:00:00')"),
          m_load(database)
    {
    }
    void run(int from, int to)
    {
        m_begin.run();
        sqlite3_bind_int(m_release.get(), 1, from);
        m_release.run();
        sqlite3_bind_int(m_take.get(), 1, to);
        m_take.run();
        m_commit.run();
        m_load.run(to);
    }

private:
    BareStatement m_begin, m_commit, m_release, m_take;
    BareLoad m_load;
};

void bench_steps(core::Office& office, const BareDatabase& database, int people)
{
    people::FamilyEditor editor(office);
    if (!editor.next())
        throw std::runtime_error("There is no family.");
    BareStep bare(database);
    Comparison comparison;
    int before = 0;
    for (int step = 0; step < steps; ++step) {
        const int here = editor.file().family.Surname_ID;
        comparison.bare.add(milliseconds_of([&] { bare.run(before, here); }));
        before = here;
        comparison.ours.add(milliseconds_of([&] {
            if (!editor.next())
                throw std::runtime_error("There is no next family.");
        }));
    }
    print("next family, held down", people, comparison, 2);
    std::printf("| %-34s | %6d | %9.3f | %9.3f |\n", "the slowest of 200", people, comparison.ours.worst(),
                comparison.bare.worst());
}

void bench_all(int people)
{
    QTemporaryDir folder;
    const auto root = folder.path() + u'/';
    const auto file = root + u"church.kdl"_s;
    core::SystemWorkstation workstation;
    core::SystemClock clock;
    QuietDialogue dialogue;
    core::Office office{.paths = core::Paths(root, root, root, core::Mode::normal, 1),
                        .rights = core::Rights::all(),
                        .workstation = workstation,
                        .dialogue = dialogue,
                        .clock = clock};
    office.session = core::create_sqlite(file);
    core::create_schema(*office.session);
    sample::fill_church(*office.session, {.families = people * 10 / 28, .seed = 7, .training = false, .today = today},
                        {}, {});
    const BareDatabase bare(file.toStdString());
    bench_save(office, bare, people);
    bench_steps(office, bare, people);
}

} // namespace

int main(int count, char** arguments)
{
    const QCoreApplication application(count, arguments);
    std::printf("| %-34s | people |   ours ms |   bare ms | ratio | goal |\n", "work");
    for (const int people : sizes)
        bench_all(people);
    return 0;
}
