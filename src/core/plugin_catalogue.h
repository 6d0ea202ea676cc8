#pragma once

#include "core/paths.h"

#include <vector>

namespace kindrel::core {

/// A report layout or letter that was added to the program; `title` is its file's base name when no title came with it.
struct Plugin
{
    QString file; ///< The name within its folder.
    QString title;

    friend bool operator==(const Plugin&, const Plugin&) = default;
};

/// In the order of their titles.
struct PluginCatalogue
{
    std::vector<Plugin> reports;
    std::vector<Plugin> letters;
};

/// Takes the titles of a newly arrived `New_plugin.plg` into the catalogue of its folder, then lists the plug-ins. A
/// catalogue is a text of lines "file=title" in UTF-8. Throws FileError.
[[nodiscard]] PluginCatalogue load_plugins(const Paths& paths);

} // namespace kindrel::core
