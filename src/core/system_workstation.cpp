#include "core/system_workstation.h"

#include "core/files.h"

#include <QCoreApplication>
#include <QLocale>
#include <QLockFile>
#include <QStandardPaths>
#include <QStorageInfo>
#include <QSysInfo>

#ifdef Q_OS_WIN
#include <windows.h>
#else
#include <cerrno>
#include <csignal>
#endif

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

bool SystemWorkstation::process_runs(qint64 process) const
{
#ifdef Q_OS_WIN
    HANDLE found = OpenProcess(PROCESS_QUERY_LIMITED_INFORMATION, FALSE, static_cast<DWORD>(process));
    if (!found)
        return GetLastError() == ERROR_ACCESS_DENIED;
    DWORD status = 0;
    const bool runs = GetExitCodeProcess(found, &status) && status == STILL_ACTIVE;
    CloseHandle(found);
    return runs;
#else
    return process > 0 && (kill(static_cast<pid_t>(process), 0) == 0 || errno == EPERM);
#endif
}

} // namespace kindrel::core
