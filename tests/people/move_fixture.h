#pragma once

#include "core/open_church.h"
#include "people/family_store.h"
#include "people/move_steps.h"
#include "people/person_files.h"
#include "people/setup_rows.h"
#include "support/data_folder.h"
#include "support/families.h"
#include "support/test_church.h"

#include <QDir>

namespace kindrel::test {

/// Two churches of one data root, and an office in the first. The second one's counters stand at 40 families and 300
/// people.
class TwoChurches
{
public:
    TwoChurches(core::EngineKind here, core::EngineKind there)
    {
        using namespace Qt::StringLiterals;
        provide(1, here);
        provide(2, there);
        office.session = connect(1);
        add_setup_items(this->here());
        for (const auto& list : people::setup_lists())
            (void)this->here().allocate(list.entity, 3);
        m_there = connect(2);
        (void)this->there().allocate(core::Entity::surname, 40);
        (void)this->there().allocate(core::Entity::person, 300);
    }

    [[nodiscard]] core::Session& here() { return *office.session; }
    [[nodiscard]] core::Session& there() { return *m_there; }
    [[nodiscard]] core::Paths paths(int church) const { return data.paths(core::Mode::normal, church); }
    [[nodiscard]] std::unique_ptr<core::Session> connect(int church) const
    {
        return core::connect_church(paths(church));
    }
    /// Closes both, as a program that ends does; reopen() starts it anew.
    void close()
    {
        office.session.reset();
        m_there.reset();
    }
    void reopen()
    {
        office.session = connect(1);
        m_there = connect(2);
    }

    /// A family with a photograph and a notebook page of its first person and a photograph of its own.
    people::FamilyFile add(people::FamilyFile file)
    {
        file = people::save_family(here(), std::move(file), QDate(2020, 1, 2));
        const int first = file.people.front().person_id;
        lay(1, people::portrait_of_person(first), "photograph");
        lay(1, people::notebook_of_person(first), "notes");
        lay(1, people::portrait_of_family(file.family.Surname_ID), "all of us");
        return file;
    }
    void lay(int church, const people::OwnFile& file, const QByteArray& content) const
    {
        DataFolder::write(paths(church).folder(file.folder) + file.name, content);
    }
    /// Photographs and notebook pages, by name.
    [[nodiscard]] QStringList files(int church) const
    {
        QStringList found;
        for (const auto folder : {core::Folder::portrait, core::Folder::notebook})
            found += QDir(paths(church).folder(folder)).entryList(QDir::Files | QDir::Hidden);
        found.sort();
        return found;
    }
    [[nodiscard]] QByteArray content(int church, const people::OwnFile& file) const
    {
        return DataFolder::read(paths(church).folder(file.folder) + file.name);
    }
    [[nodiscard]] static QStringList files_of(int surname_id, int first_person)
    {
        QStringList names{people::portrait_of_family(surname_id).name, people::portrait_of_person(first_person).name,
                          people::notebook_of_person(first_person).name};
        names.sort();
        return names;
    }

    [[nodiscard]] static QString question(const people::FamilyFile& file)
    {
        const auto count = file.people.size();
        return QStringLiteral("Please confirm that you wish to move the %1 family (%2) to 'Church2'")
            .arg(file.family.surname, count == 1 ? QStringLiteral("1 person") : QStringLiteral("%1 people").arg(count));
    }
    /// Moves the family to the other church, with a Yes to the question.
    [[nodiscard]] bool move(const people::FamilyFile& file, const people::MoveWatch& watch = {})
    {
        dialogue.expect_confirm(question(file), core::Answer::yes, core::Answer::no);
        return move_without_question(file, watch);
    }
    [[nodiscard]] bool move_without_question(const people::FamilyFile& file, const people::MoveWatch& watch = {})
    {
        return people::move_family_watched(office, file.family.Surname_ID, 2, progress, watch);
    }
    [[nodiscard]] qint64 families_there()
    {
        return number_of(there(), QStringLiteral("SELECT COUNT(*) FROM [tbl_surname];"));
    }
    /// Of moves that are not over, in both churches.
    [[nodiscard]] qint64 notes()
    {
        const auto count = QStringLiteral("SELECT COUNT(*) FROM [tbl_setting];");
        return number_of(here(), count) + number_of(there(), count);
    }

    DataFolder data;
    FakeWorkstation workstation;
    ScriptedDialogue dialogue;
    FixedClock clock;
    core::SilentProgress progress;
    core::Office office{
        .paths = paths(1),
        .church = 1,
        .church_names = {QStringLiteral("Church1"), QStringLiteral("Church2"), QStringLiteral("Church3")},
        .rights = core::Rights::all(),
        .workstation = workstation,
        .dialogue = dialogue,
        .clock = clock};

private:
    void provide(int church, core::EngineKind engine)
    {
        const auto folder = paths(church).folder(core::Folder::church);
        if (engine == core::EngineKind::sqlite) {
            DataFolder::make_church(folder);
        } else {
            m_servers.push_back(std::make_unique<TestChurch>(engine));
            m_servers.back()->close();
            DataFolder::write(folder + core::connection_file.toString(), m_servers.back()->connection().toUtf8());
        }
    }

    std::vector<std::unique_ptr<TestChurch>> m_servers;
    std::unique_ptr<core::Session> m_there;
};

/// Each church on either engine.
class MoveTest : public testing::TestWithParam<std::tuple<core::EngineKind, core::EngineKind>>
{
protected:
    void SetUp() override
    {
        const auto [here, there] = GetParam();
        if (!TestChurch::available(here) || !TestChurch::available(there))
            GTEST_SKIP() << "No server: run through ./test, or tests/support/with-postgres.";
        churches.emplace(here, there);
    }
    std::optional<TwoChurches> churches;
};

[[nodiscard]] inline std::string engines_name(const testing::TestParamInfo<MoveTest::ParamType>& info)
{
    const auto name = [](core::EngineKind engine) {
        return engine == core::EngineKind::sqlite ? "Sqlite" : "Postgres";
    };
    return std::string(name(std::get<0>(info.param))) + "To" + name(std::get<1>(info.param));
}

} // namespace kindrel::test

#define KINDREL_ON_ALL_PAIRS_OF_ENGINES(suite)                                                                         \
    INSTANTIATE_TEST_SUITE_P(                                                                                          \
        Engines, suite,                                                                                                \
        testing::Combine(testing::Values(kindrel::core::EngineKind::sqlite, kindrel::core::EngineKind::postgres),      \
                         testing::Values(kindrel::core::EngineKind::sqlite, kindrel::core::EngineKind::postgres)),     \
        kindrel::test::engines_name)
