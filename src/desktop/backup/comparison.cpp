#include "desktop/backup/comparison.h"

#include "core/backup_files.h"
#include "desktop/backup/backup_words.h"

#include <QLocale>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

const QString another_church = u"Made of another church"_s;
const QString stays = u"Left out of the backup: stays as it is"_s;
const QString one_by_one = u"Replaces files of the same name"_s;
const QString later_lost = u"Later changes would be lost"_s;

QString number_words(qint64 number)
{
    return QLocale().toString(number);
}

ComparedLine counts(const QString& what, qint64 then, qint64 now)
{
    ComparedLine line{.what = what, .then = number_words(then), .now = number_words(now), .outcome = {}};
    line.loss = now > then;
    if (now != then)
        line.outcome = (line.loss ? u"%1 fewer"_s : u"%1 more"_s).arg(number_words(qAbs(now - then)));
    return line;
}

ComparedLine church_line(const core::ChurchSummary& then, const core::ChurchSummary& now)
{
    const bool foreign = !now.church_code.isEmpty() && now.church_code != then.church_code;
    return {u"Church"_s, then.church_name, now.church_name, foreign ? another_church : QString(), foreign};
}

ComparedLine age_line(const core::BackupContents& backup, const core::ChurchSummary& now, core::DayOrder order)
{
    const bool changed_since = now.last_change && *now.last_change >= core::Date::from(backup.made.date());
    return {u"Date"_s, u"Made %1"_s.arg(moment_words(backup.made, order)),
            now.last_change ? u"Changed %1"_s.arg(now.last_change->shown(order)) : u"Change not known"_s,
            changed_since ? later_lost : QString(), changed_since};
}

/// Files of a folder that is the church's own go with it; where churches share a folder they are put in one by one.
ComparedLine part_line(const core::BackupPart& part, const core::PartContents* then, qint64 now)
{
    const QString words = QString::fromUtf16(part.words);
    if (!then)
        return {words, u"–"_s, number_words(now), stays};
    if (!part.shared)
        return counts(words, then->files, now);
    return {words, number_words(then->files), number_words(now), then->files > 0 ? one_by_one : QString()};
}

Present present_of(const core::Office& office)
{
    Present present{core::present_state(office), {}};
    for (const core::BackupPart& part : core::backup_parts())
        present.files.push_back(core::files_within(office.paths.folder(part.folder)).size());
    return present;
}

bool says_something(const ComparedLine& line)
{
    return line.then != u"0" || line.now != u"0";
}

} // namespace

const Present& PresentState::now()
{
    const qint64 mark = m_office.session->change_mark();
    if (!m_present || m_change_mark != mark)
        m_present = present_of(m_office);
    m_change_mark = mark;
    return *m_present;
}

std::vector<ComparedLine> compare(const Present& present, const core::BackupContents& backup, core::DayOrder order)
{
    std::vector<ComparedLine> lines{church_line(backup.church, present.church),
                                    age_line(backup, present.church, order)};
    for (const auto& kind : core::compared_kinds(backup.church, present.church))
        lines.push_back(counts(kind.words, kind.then, kind.now));
    for (auto now = present.files.begin(); const core::BackupPart& part : core::backup_parts()) {
        const auto found = std::ranges::find(backup.parts, QString::fromUtf16(part.words), &core::PartContents::words);
        lines.push_back(part_line(part, found == backup.parts.end() ? nullptr : &*found, *now++));
    }
    std::erase_if(lines, [](const ComparedLine& line) { return !says_something(line); });
    return lines;
}

} // namespace kindrel::desktop
