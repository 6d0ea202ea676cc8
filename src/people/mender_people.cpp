#include "people/mender_people.h"

#include "people/sort_key.h"

#include <QDirIterator>
#include <QRegularExpression>
#include <QSet>

#include <array>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

using core::Column;
using core::Cure;
using core::Findings;
using core::Folder;
using core::MenderPlace;
using core::Session;

struct Renamed
{
    int key;
    QString name;
};

/// What `value` makes of each row whose first column is a key and whose second is what is stored.
template <class Make>
std::vector<Renamed> differing(Session& session, const QString& statement, const Make& make)
{
    auto rows = session.select(statement);
    std::vector<Renamed> found;
    for (const core::Row& row : rows) {
        if (const QString right = make(row); right != row.text(Column{1}))
            found.push_back({row.integer(Column{0}), right});
    }
    return found;
}

std::vector<Renamed> family_sort_keys(Session& session)
{
    return differing(session, u"SELECT [Surname_ID],[sort_key],[surname] FROM [tbl_surname];"_s,
                     [](const core::Row& row) { return sort_key(row.text(Column{2})); });
}

std::vector<Renamed> person_sort_keys(Session& session)
{
    return differing(session,
                     u"SELECT p.[person_id],p.[sort_key],s.[surname],d.[other_surname],d.[surname_hidden] "
                     "FROM [tbl_people] p INNER JOIN [tbl_surname] s ON s.[Surname_ID]=p.[Surname_ID] "
                     "LEFT JOIN [tbl_personal_details] d ON d.[person_id]=p.[person_id];"_s,
                     [](const core::Row& row) {
                         const bool own = !row.flag(Column{4}) && !row.text(Column{3}).isEmpty();
                         return sort_key(row.text(own ? Column{3} : Column{2}));
                     });
}

std::vector<Renamed> primary_names(Session& session)
{
    return differing(session,
                     u"SELECT s.[Surname_ID],s.[Primary_name],(SELECT MIN(p.[Name]) FROM [tbl_people] p WHERE "
                     "p.[Surname_ID]=s.[Surname_ID] AND p.[position]=1) FROM [tbl_surname] s;"_s,
                     [](const core::Row& row) { return row.text(Column{2}); });
}

/// What follows from another field.
struct Follower
{
    const char16_t *table, *key, *field, *words;
    std::vector<Renamed> (*find)(Session&);
};
constexpr std::array followers{
    Follower{u"tbl_surname", u"Surname_ID", u"Primary_name",
             u"%1 listed under the name of somebody who is not at the head.", primary_names},
    Follower{u"tbl_surname", u"Surname_ID", u"sort_key", u"%1 at a wrong place of the alphabet.", family_sort_keys},
    Follower{u"tbl_people", u"person_id", u"sort_key", u"%1 at a wrong place of the alphabet.", person_sort_keys},
};

Findings examine_names(MenderPlace& place)
{
    Findings findings;
    for (const auto& follower : followers) {
        const auto count = static_cast<int>(follower.find(*place.session).size());
        const QString of = QStringView(follower.key) == u"person_id" ? core::counted(count, u"person"_s, u"people"_s)
                                                                     : core::counted(count, u"family"_s, u"families"_s);
        if (count > 0)
            findings.push_back({u"names"_s, QString::fromUtf16(follower.words).arg(of), count, Cure::mend,
                                u"It is worked out again from the names as they were typed."_s});
    }
    return findings;
}

void mend_names(MenderPlace& place)
{
    for (const auto& follower : followers) {
        const QString update = u"UPDATE [%1] SET [%2]=? WHERE [%3]=?;"_s.arg(
            QStringView(follower.table), QStringView(follower.field), QStringView(follower.key));
        for (const auto& [key, name] : follower.find(*place.session))
            place.session->execute(update, name, key);
    }
}

QSet<qint64> keys_of(Session& session, const QString& statement)
{
    auto rows = session.select(statement);
    QSet<qint64> keys;
    for (const core::Row& row : rows)
        keys.insert(row.number(Column{0}));
    return keys;
}

/// Photographs and notebook pages by what they belong to.
struct OwnedFiles
{
    QStringList orphaned; ///< Of nobody in the church.
    QStringList waiting;  ///< The same, where more owners are gone than are left: they may come back with a backup.
};

OwnedFiles orphaned_files(MenderPlace& place)
{
    if (!place.session)
        return {};
    const std::array owners{keys_of(*place.session, u"SELECT [person_id] FROM [tbl_people];"_s),
                            keys_of(*place.session, u"SELECT [Surname_ID] FROM [tbl_surname];"_s)};
    static const QRegularExpression own(u"^(f?)([0-9]+)[.](jpg|fll)$"_s, QRegularExpression::CaseInsensitiveOption);
    std::array<QStringList, 2> found;
    std::array<QSet<qint64>, 2> missing;
    for (const auto folder : {Folder::portrait, Folder::notebook}) {
        for (QDirIterator files(place.paths.folder(folder), QDir::Files); files.hasNext();) {
            const QString path = files.next();
            const auto match = own.match(files.fileName());
            const std::size_t whose = match.captured(1).isEmpty() ? 0 : 1;
            const qint64 key = match.captured(2).toLongLong();
            if (!match.hasMatch() || owners[whose].contains(key))
                continue;
            found[whose] += path;
            missing[whose] += key;
        }
    }
    OwnedFiles sorted;
    for (const std::size_t whose : {0U, 1U})
        (missing[whose].size() > owners[whose].size() ? sorted.waiting : sorted.orphaned) += found[whose];
    return sorted;
}

QString files_of_nobody(qsizetype count)
{
    return u"%1 of families or people who are not in the church."_s.arg(
        core::counted(static_cast<int>(count), u"photograph or notebook page"_s, u"photographs and notebook pages"_s));
}

Findings examine_files(MenderPlace& place)
{
    const auto [orphaned, waiting] = orphaned_files(place);
    Findings findings;
    if (!orphaned.isEmpty())
        findings.push_back({u"orphaned_files"_s, files_of_nobody(orphaned.size()), static_cast<int>(orphaned.size()),
                            Cure::mend, u"Moved into the folder 'mended'; nothing is deleted."_s});
    if (!waiting.isEmpty())
        findings.push_back({u"lost_table"_s, files_of_nobody(waiting.size()), static_cast<int>(waiting.size()),
                            Cure::by_hand,
                            u"More of these are gone than are left, so the files stay where they are. Put back a "
                            "backup, which has them, or move the files away."_s});
    return findings;
}

void mend_files(MenderPlace& place)
{
    for (const auto& file : orphaned_files(place).orphaned)
        core::set_aside(place, file);
}

constexpr std::array checks{
    core::Check{core::Check::On::rows, examine_names, mend_names},
    core::Check{core::Check::On::files, examine_files, mend_files},
};

} // namespace

std::span<const core::Check> mender_checks()
{
    return checks;
}

} // namespace kindrel::people
