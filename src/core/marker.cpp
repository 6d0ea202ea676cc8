#include "core/marker.h"

#include <QFile>

namespace kindrel::core {

using namespace Qt::StringLiterals;

std::optional<Marker> Marker::take(const Paths& paths, const SideFile& file)
{
    const QString path = paths.file(file.folder, QLatin1String(file.name));
    QFile target(path);
    if (target.exists())
        return std::nullopt;
    if (!target.open(QIODevice::WriteOnly | QIODevice::NewOnly)) {
        if (target.exists())
            return std::nullopt;
        throw FileError(u"Unable to write '%1': %2"_s.arg(path, target.errorString()));
    }
    Marker marker(path);
    const QByteArray mark = SideRecord(file).bytes();
    const bool written = target.write(mark) == mark.size() && target.flush();
    target.close();
    if (!written)
        throw FileError(u"Unable to write '%1': %2"_s.arg(path, target.errorString()));
    return marker;
}

Marker::~Marker()
{
    if (!m_file.isEmpty())
        QFile::remove(m_file);
}

} // namespace kindrel::core
