#include "core/plugin_catalogue.h"

#include "core/files.h"

#include <QDir>
#include <QMap>

#include <algorithm>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

struct PluginFolder
{
    Folder folder;
    QString catalogue;
    QStringList endings;
};

const PluginFolder report_folder{Folder::plugin_reports, u"report_title.plg"_s, {u".rpt"_s, u".rpy"_s, u".sub"_s}};
const PluginFolder letter_folder{Folder::plugin_letters, u"letter_title.plg"_s, {u".ltr"_s}};
const QString arrival = u"New_plugin.plg"_s;

/// Titles by file name in lower case.
using Titles = QMap<QString, Plugin>;

bool is_plugin(const PluginFolder& kind, const QString& file)
{
    return std::ranges::any_of(kind.endings,
                               [&](const QString& ending) { return file.endsWith(ending, Qt::CaseInsensitive); });
}

/// A name that could lead out of the folder is no name of a plug-in.
bool plain_name(const QString& file)
{
    return !file.contains(u'/') && !file.contains(u'\\') && !file.contains(u':');
}

void read_titles(const Paths& paths, const PluginFolder& kind, const QString& name, Titles& titles)
{
    const QByteArray content = read_file(paths.file(kind.folder, name)).value_or(QByteArray());
    for (const auto& line : QString::fromUtf8(content).split(u'\n')) {
        const auto sign = line.indexOf(u'=');
        const Plugin plugin{line.left(sign).trimmed(), line.mid(sign + 1).trimmed()};
        if (sign > 0 && !plugin.title.isEmpty() && plain_name(plugin.file) && is_plugin(kind, plugin.file))
            titles.insert(plugin.file.toLower(), plugin);
    }
}

void take_arrival(const Paths& paths, const PluginFolder& kind, Titles& titles)
{
    if (!paths.exists(kind.folder, arrival))
        return;
    read_titles(paths, kind, arrival, titles);
    QString content;
    for (const auto& plugin : titles)
        content += plugin.file + u'=' + plugin.title + u'\n';
    write_file(paths.file(kind.folder, kind.catalogue), content.toUtf8());
    remove_file(paths.file(kind.folder, arrival));
}

std::vector<Plugin> load(const Paths& paths, const PluginFolder& kind)
{
    Titles titles;
    read_titles(paths, kind, kind.catalogue, titles);
    take_arrival(paths, kind, titles);
    std::vector<Plugin> plugins;
    for (const QString& file : QDir(paths.folder(kind.folder)).entryList(QDir::Files, QDir::Name)) {
        if (is_plugin(kind, file))
            plugins.push_back({file, titles.value(file.toLower(), {file, file.chopped(4)}).title});
    }
    std::ranges::stable_sort(plugins, {}, [](const Plugin& plugin) { return plugin.title.toLower(); });
    return plugins;
}

} // namespace

PluginCatalogue load_plugins(const Paths& paths)
{
    return {load(paths, report_folder), load(paths, letter_folder)};
}

} // namespace kindrel::core
