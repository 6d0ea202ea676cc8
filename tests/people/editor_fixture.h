#pragma once

#include "people/family_editor.h"
#include "people/family_store.h"
#include "people/setup_fixture.h"

namespace kindrel::test {

/// Agrees to everything; stands where a process works until it is killed.
class AgreeingDialogue : public core::Dialogue
{
public:
    void show(const core::Message&) override {}
    bool confirm(const core::Message&, core::Answer) override { return true; }
    std::optional<bool> confirm_or_cancel(const core::Message&) override { return true; }
    std::optional<QString> ask_text(const core::Message&, bool) override { return {}; }
    std::optional<int> choose(const core::Message&, const QStringList&) override { return 0; }
    std::optional<QString> choose_file(const core::FileQuestion&) override { return {}; }
    void play(const QString&) override {}
};

/// An office for a process of its own, in which everything is agreed to.
class WorkingOffice
{
public:
    explicit WorkingOffice(const TestChurch& church)
        : own(church), office{.paths = own.office.paths,
                              .session = church.another(),
                              .rights = core::Rights::all(),
                              .workstation = own.workstation,
                              .dialogue = agreeing,
                              .clock = own.clock}
    {
    }

    SetupOffice own;
    AgreeingDialogue agreeing;
    core::Office office;
};

/// A workstation in a church with setup lists; another one can come in.
class EditorTest : public EngineTest
{
protected:
    void SetUp() override
    {
        EngineTest::SetUp();
        if (!church)
            return;
        fill_setup_lists(session());
        desk.emplace(*church);
    }
    [[nodiscard]] core::Office& office() { return desk->office; }
    [[nodiscard]] ScriptedDialogue& dialogue() { return desk->dialogue; }

    /// Stores a family of these people; the first are adults.
    int add(const QString& surname, std::initializer_list<QString> names, int children = 0)
    {
        auto file = family(surname, names);
        for (int child = 0; child < children; ++child)
            file.people[file.people.size() - 1 - static_cast<std::size_t>(child)].Marital = 6;
        return people::save_family(session(), file, desk->clock.today()).family.Surname_ID;
    }
    [[nodiscard]] people::FamilyFile stored(int surname_id) { return *people::load_family(session(), surname_id); }
    [[nodiscard]] static QStringList names(const people::FamilyFile& file)
    {
        QStringList found;
        for (const auto& person : file.people)
            found += person.Name;
        return found;
    }
    [[nodiscard]] qint64 locks(int surname_id)
    {
        return number_of(
            session(),
            QStringLiteral("SELECT COUNT(*) FROM [tbl_locked_family_files] WHERE [surname_id]=%1").arg(surname_id));
    }
    void type_surname(people::FamilyEditor& editor, const QString& surname)
    {
        editor.change(QStringLiteral("surname"), [&](people::FamilyFile& file) { file.family.surname = surname; });
    }
    void type_phone(people::FamilyEditor& editor, const QString& phone)
    {
        editor.change(QStringLiteral("phone"), [&](people::FamilyFile& file) { file.address.phone = phone; });
    }

    std::optional<SetupOffice> desk;
};

inline const QString altered_question = QStringLiteral("This file has been altered.");

} // namespace kindrel::test
