#include "desktop/mender/account_report.h"

#include "core/startup.h"

#include <QDir>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

QStringList lines_of(const Account& account)
{
    QStringList lines;
    for (const auto& line : account.lines)
        lines += line.in_report;
    for (const auto& group : account.groups) {
        lines += {{}, group.heading};
        for (const auto& line : group.lines)
            lines += u"- "_s + line.in_report;
    }
    return lines;
}

} // namespace

QByteArray report_of(const Account& account, int church, const QDateTime& time)
{
    const QStringList head{u"%1 Mender, edition %2"_s.arg(core::product).arg(core::program_edition),
                           u"Church %1, %2"_s.arg(church).arg(time.toString(u"yyyy-MM-dd HH:mm")),
                           u"Outcome: %1"_s.arg(account.chip),
                           {}};
    QString text = (head + lines_of(account)).join(u"\r\n"_s) + u"\r\n"_s;
    for (const auto& folder : {account.data_root, QDir::homePath() + u'/'})
        if (folder.size() > 1)
            text.replace(folder, u"…/"_s);
    return "\xEF\xBB\xBF" + text.toUtf8();
}

} // namespace kindrel::desktop
