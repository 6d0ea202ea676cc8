#pragma once

#include "core/locks.h"
#include "support/data_folder.h"
#include "support/test_church.h"

namespace kindrel::test {

/// One of the workstations that share a church over the network.
struct Workplace
{
    /// `listener` stands in for the scripted dialogue.
    explicit Workplace(const TestChurch& church, const QString& machine = QStringLiteral("office-1"),
                       core::Dialogue* listener = nullptr)
        : office{.paths = paths_of(church, core::Mode::network),
                 .mode = core::Mode::network,
                 .session = church.another(),
                 .rights = core::Rights::all(),
                 .workstation = workstation,
                 .dialogue = listener ? *listener : dialogue,
                 .clock = clock}
    {
        workstation.machine = machine;
        DataFolder::write(office.paths.database(), "The church lies elsewhere; only that a file is here matters.");
    }
    /// All rights are lost but these.
    void grant_only(std::initializer_list<core::Area> areas)
    {
        office.rights = {};
        for (const auto area : areas)
            office.rights.set(area, true);
    }
    static core::Paths paths_of(const TestChurch& church, core::Mode mode)
    {
        const QString folder = church.folder() + QStringLiteral("/workplace/");
        return {folder, folder, folder + QStringLiteral("Kindrel_10_Data/"), mode, 1};
    }

    FakeWorkstation workstation;
    ScriptedDialogue dialogue;
    FixedClock clock;
    core::SilentProgress progress;
    core::Office office;
    core::Locks locks{office};
};

} // namespace kindrel::test
