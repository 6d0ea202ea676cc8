#include "core/startup.h"

#include "core/open_church.h"
#include "core/startup_security.h"
#include "core/startup_steps.h"

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

enum class For { all, desktop };

struct Step
{
    bool (*run)(startup_steps::State&);
    For purpose = For::all;
};

/// In this order; the first that returns false ends the program.
constexpr std::array steps{
    Step{startup_steps::write_manifest, For::desktop},
    Step{startup_steps::confirm_data_folder},
    Step{startup_steps::claim_single_instance, For::desktop},
    Step{startup_steps::check_date_separator, For::desktop},
    Step{startup_steps::reach_network},
    Step{startup_steps::read_church_names},
    Step{startup_steps::choose_church},
    Step{startup_steps::build_paths},
    Step{startup_steps::rotate_backups, For::desktop},
    Step{startup_steps::find_logo},
    Step{startup_steps::read_sounds_and_options},
    Step{startup_steps::provide_database},
    Step{startup_steps::check_busy_marker},
    Step{startup_steps::set_caption},
    Step{startup_steps::open_database},
    Step{startup_steps::settle_restore},
    Step{startup_steps::check_version},
    Step{startup_steps::load_settings},
    Step{startup_steps::count_start, For::desktop},
    Step{startup_steps::ask_password},
    Step{startup_steps::release_left_locks, For::desktop},
    Step{startup_steps::find_tutorial, For::desktop},
    Step{startup_steps::read_side_settings},
    Step{startup_steps::compact_when_due, For::desktop},
    Step{startup_steps::check_day_order, For::desktop},
    Step{startup_steps::check_display, For::desktop},
    Step{startup_steps::load_plugin_catalogue},
};

bool run_steps(startup_steps::State& state)
{
    for (const auto& step : steps) {
        const bool wanted = step.purpose == For::all || state.on_desktop();
        if (wanted && !step.run(state))
            return false;
    }
    return true;
}

} // namespace

std::unique_ptr<Office> start_up(const StartRequest& request, Workstation& workstation, Dialogue& dialogue,
                                 Clock& clock, Progress& progress)
{
    try {
        std::unique_ptr<Office> office(new Office{.paths = startup_steps::first_paths(request, workstation),
                                                  .workstation = workstation,
                                                  .dialogue = dialogue,
                                                  .clock = clock});
        startup_steps::State state{.request = request, .progress = progress, .office = *office};
        if (run_steps(state))
            return office;
    } catch (const DatabaseError& error) {
        dialogue.show(unable_to_connect(error.text()));
    } catch (const FileError& error) {
        dialogue.show(information(error.text(), u"Kindrel is now going to shut down."_s));
    }
    return nullptr;
}

} // namespace kindrel::core
