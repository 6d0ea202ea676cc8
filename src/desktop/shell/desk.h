#pragma once

#include "core/office.h"
#include "core/progress.h"
#include "desktop/shell/remembered.h"
#include "desktop/shell/windows.h"
#include "people/working_list.h"

#include <memory>

namespace kindrel::desktop {

class Printing;
struct ChosenPeople;

/// The ways from one screen to another.
class Navigation
{
public:
    virtual ~Navigation() = default;
    /// Opens speed find over the main window.
    virtual void find_family() = 0;
    /// `key` names a row of the table of areas. Happens after the caller has returned, for its page may have to go.
    virtual void open_area(const QString& key) = 0;
    /// Opens a family in the editor, with the list to turn the pages in and its name. What is typed there is offered
    /// for saving first. Happens after the caller has returned, as do the next three.
    virtual void open_family(int surname_id, std::vector<int> among, const QString& among_name) = 0;
    virtual void new_family() = 0;
    /// Brings people into the list of Tagging, who were found elsewhere as its criteria say.
    virtual void to_tagging(people::WorkingList found) = 0;
    /// Opens the unsaved work on a family; 0 is that on a new one.
    virtual void open_draft(int surname_id) = 0;
    /// Closes the office and starts up again; happens after the caller has returned.
    virtual void load_church(int church) = 0;
};

/// What every screen is given. It outlives them all.
struct Desk
{
    core::Office& office;
    core::Progress& progress;
    Remembered& remembered;
    Windows& windows;
    Printing& printing;
    Navigation& navigation;
    /// What stands in Tagging; null while it has no list.
    std::shared_ptr<const ChosenPeople> chosen = {};
};

} // namespace kindrel::desktop
