#include "desktop/backup/backup_words.h"

#include <QDir>
#include <QFileInfo>
#include <QLocale>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

const QString made_and_compared = u"The backup is made, opened again and compared."_s;
const QString contents = u"%1 with %2 and %3, %4, in '%5'."_s;
const QString uncompacted = u" The database itself could not be compacted."_s;

} // namespace

QString size_words(qint64 bytes)
{
    return QLocale().formattedDataSize(bytes, 1, QLocale::DataSizeSIFormat);
}

QString moment_words(const QDateTime& moment, core::DayOrder order)
{
    return core::Date::from(moment.date()).shown(order) + moment.toString(u" HH:mm");
}

QString counted(qint64 count, const QString& one, const QString& several)
{
    return u"%1 %2"_s.arg(QLocale().toString(count), count == 1 ? one : several);
}

QString state_words(const core::KnownBackup& backup)
{
    const QString state = !backup.present ? u"Not there"_s : backup.verified ? u"Verified"_s : u"Not verified"_s;
    return backup.before_restore ? state + u", made before a restore"_s : state;
}

const core::KnownBackup* last_verified(const std::vector<core::KnownBackup>& backups)
{
    const auto found = std::ranges::find_if(
        backups, [](const core::KnownBackup& backup) { return backup.verified && !backup.before_restore; });
    return found == backups.end() ? nullptr : &*found;
}

core::Message made_message(const core::BackupReport& report)
{
    const core::ChurchSummary& church = report.contents.church;
    const QString& file = report.contents.file;
    const QString families = counted(church.rows.value(u"tbl_surname"_s), u"family"_s, u"families"_s);
    const QString people = counted(church.rows.value(u"tbl_people"_s), u"person"_s, u"people"_s);
    const QString told = contents.arg(church.church_name, families, people, size_words(QFileInfo(file).size()),
                                      QDir::toNativeSeparators(file));
    return core::information(made_and_compared, report.compacted ? told : told + uncompacted);
}

} // namespace kindrel::desktop
