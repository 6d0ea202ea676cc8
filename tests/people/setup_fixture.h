#pragma once

#include "core/office.h"
#include "people/setup_editor.h"
#include "support/data_folder.h"
#include "support/families.h"
#include "support/test_church.h"

namespace kindrel::test {

/// A workstation's office in a church, with every right.
class SetupOffice
{
public:
    explicit SetupOffice(const TestChurch& church)
        : office{.paths = core::Paths(church.folder() + u'/', church.folder() + u'/', church.folder() + u'/',
                                      core::Mode::normal, 1),
                 .rights = core::Rights::all(),
                 .workstation = workstation,
                 .dialogue = dialogue,
                 .clock = clock}
    {
        office.session = church.another();
    }

    FakeWorkstation workstation;
    ScriptedDialogue dialogue;
    FixedClock clock;
    core::Office office;
};

/// Gives each of the ten lists three items, with keys 1 to 3 that their counters have handed out.
inline void fill_setup_lists(core::Session& session)
{
    add_setup_items(session);
    for (const auto& list : people::setup_lists())
        (void)session.allocate(list.entity, 3);
}

/// Texts of the list in its order; a suburb with its postcode.
template <class Items>
[[nodiscard]] QStringList texts(const Items& items)
{
    QStringList found;
    for (const people::SetupItem& item : items)
        found += item.postcode.isEmpty() ? item.text : item.text + u' ' + item.postcode;
    return found;
}

class SetupTest : public EngineTest
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
    [[nodiscard]] people::SetupEditor open() { return people::SetupEditor(desk->office); }
    /// The list as another workstation reads it.
    [[nodiscard]] QStringList stored(people::SetupKind kind)
    {
        return texts(people::read_setup_items(session(), kind));
    }

    std::optional<SetupOffice> desk;
};

/// For rules that ask no engine: on a church file alone.
class SetupRuleTest : public testing::Test
{
protected:
    SetupRuleTest() { fill_setup_lists(church.session()); }
    [[nodiscard]] people::SetupEditor open() { return people::SetupEditor(desk.office); }

    TestChurch church{core::EngineKind::sqlite};
    SetupOffice desk{church};
    ScriptedDialogue& dialogue = desk.dialogue;
};

} // namespace kindrel::test
