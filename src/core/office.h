#pragma once

#include "core/clock.h"
#include "core/dialogue.h"
#include "core/paths.h"
#include "core/person_guard.h"
#include "core/plugin_catalogue.h"
#include "core/rights.h"
#include "core/session.h"
#include "core/settings.h"
#include "core/side_files.h"
#include "core/workstation.h"

#include <memory>
#include <vector>

namespace kindrel::core {

/// What a started program holds. Rooms take it by reference and keep nothing of it beyond their own life; switching
/// church destroys it and builds a new one.
struct Office
{
    Paths paths;
    Mode mode = Mode::normal;
    int church = 1; ///< 1 to 7, or training_church, or booked_out_church.
    QString church_name = {};
    QStringList church_names = {}; ///< Of churches 1 to 7.
    QString caption_suffix = {};   ///< Of the main window, with its leading blank.
    QString logo = {};             ///< Whole path of the logo picture; empty when there is none.
    bool tutorial = false;         ///< The program folder holds the tutorial, `TUTOR`.
    SideSettings side = {};
    PluginCatalogue plugins = {};
    Settings settings = {};
    std::unique_ptr<Session> session = {};
    Rights rights = {};
    int user_id = 0;        ///< Of the password that let the person in; 0 without security and by a recovery password.
    QString user_name = {}; ///< Those whom that password belongs to.
    Workstation& workstation;
    Dialogue& dialogue;
    Clock& clock;
    std::vector<const PersonGuard*> person_guards = {}; ///< Of the rooms above; they outlive the office.

    [[nodiscard]] bool may(Area area) const { return rights.may(area); }
    /// Whether several workstations can be in this church at once.
    [[nodiscard]] bool shared() const
    {
        return mode == Mode::network || (session && session->engine() == EngineKind::postgres);
    }
    [[nodiscard]] DayOrder day_order() const { return settings.day_order(); }
};

/// The product's name, used in every message and caption.
inline constexpr QStringView product = u"Kindrel";

} // namespace kindrel::core
