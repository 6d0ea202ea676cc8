#include "core/system_workstation.h"

#include "core/files.h"

#include <QCoreApplication>
#include <QLocale>
#include <QLockFile>
#include <QStandardPaths>
#include <QStorageInfo>
#include <QSysInfo>

namespace kindrel::core {

using namespace Qt::StringLiterals;

SystemWorkstation::SystemWorkstation(QSize display_size, int display_depth)
    : m_display_size(display_size), m_display_depth(display_depth)
{
}

SystemWorkstation::~SystemWorkstation() = default;

QString SystemWorkstation::program_folder() const
{
    return as_folder(QCoreApplication::applicationDirPath());
}

QString SystemWorkstation::default_data_drive() const
{
#ifdef Q_OS_WIN
    return u"C:\\"_s;
#else
    return as_folder(QStandardPaths::writableLocation(QStandardPaths::GenericDataLocation));
#endif
}

QString SystemWorkstation::short_date_pattern() const
{
    const QLocale locale = QLocale::system();
    return locale.language() == QLocale::C ? QString() : locale.dateFormat(QLocale::ShortFormat);
}

bool SystemWorkstation::claim_single_instance(const QString& local_settings)
{
    if (m_claim && m_claim->isLocked())
        return true;
    m_claim = std::make_unique<QLockFile>(local_settings + u"kindrel.lock"_s);
    m_claim->setStaleLockTime(0); // However long it is held; the lock of a process that ended is void all the same.
    return m_claim->tryLock() || m_claim->error() != QLockFile::LockFailedError;
}

qint64 SystemWorkstation::free_bytes(const QString& folder) const
{
    return QStorageInfo(folder).bytesAvailable();
}

QString SystemWorkstation::name() const
{
    return QSysInfo::machineHostName();
}

} // namespace kindrel::core
