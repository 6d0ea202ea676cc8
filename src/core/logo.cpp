#include "core/logo.h"

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

QString path_if_there(const Paths& paths, Folder folder, const QString& name)
{
    return !name.isEmpty() && paths.exists(folder, name) ? paths.file(folder, name) : QString();
}

} // namespace

QString logo_path(const Paths& paths, const QString& name)
{
    const QString own = path_if_there(paths, Folder::images, name);
    return own.isEmpty() ? path_if_there(paths, Folder::program, name) : own;
}

QString workstation_logo_path(const Paths& paths, const QString& name)
{
    return name.isEmpty() ? path_if_there(paths, Folder::program, u"Logo.jpg"_s) : logo_path(paths, name);
}

} // namespace kindrel::core
