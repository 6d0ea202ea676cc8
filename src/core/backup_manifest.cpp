#include "core/backup_manifest.h"

#include "core/backup_error.h"
#include "core/backup_files.h"
#include "core/settings.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QUuid>

#include <algorithm>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr int format_version = 1;
constexpr qsizetype digest_digits = 64;
constexpr qsizetype counted_at_once = 50; ///< Tables.
constexpr double largest_size = 1e15;     // Beyond any disk, and still a whole number in JSON.

const QString format_name = u"Kindrel backup"_s;

/// Throws BackupError unless it holds.
void demand(bool holds)
{
    if (!holds)
        throw BackupError(BackupFault::damaged, u"The description inside the backup is damaged."_s);
}

qint64 size_in(const QJsonValue& value)
{
    const double size = value.toDouble(-1);
    demand(size >= 0 && size <= largest_size);
    return static_cast<qint64>(size);
}

QJsonObject rows_to_json(const QMap<QString, qint64>& rows)
{
    QJsonObject object;
    for (auto row = rows.begin(); row != rows.end(); ++row)
        object.insert(row.key(), row.value());
    return object;
}

QJsonArray entries_to_json(const std::vector<ManifestEntry>& entries)
{
    QJsonArray array;
    for (const auto& entry : entries)
        array.append(QJsonObject{
            {u"name"_s, entry.name}, {u"size"_s, entry.size}, {u"sha256"_s, QString::fromLatin1(entry.sha256)}});
    return array;
}

/// All in one statement.
void add_counts(Session& session, const QStringList& tables, QMap<QString, qint64>& rows)
{
    QStringList counts;
    for (const auto& table : tables)
        counts += u"SELECT %1 AS [place],COUNT(*) AS [rows] FROM [%2]"_s.arg(QString::number(counts.size()), table);
    auto counted = session.select(counts.join(u" UNION ALL "_s) + u';');
    for (const Row& row : counted)
        rows.insert(tables[row.integer(Column{0})].toLower(), row.number(Column{1}));
}

ManifestEntry entry_from(const QJsonObject& object)
{
    const ManifestEntry entry{object[u"name"_s].toString(), size_in(object[u"size"_s]),
                              object[u"sha256"_s].toString().toLatin1()};
    demand(stays_inside(entry.name) && entry.sha256.size() == digest_digits);
    return entry;
}

ChurchSummary church_from(const QJsonObject& object)
{
    ChurchSummary church{.church = object[u"church"_s].toInt(),
                         .church_name = object[u"church_name"_s].toString(),
                         .church_code = object[u"church_code"_s].toString(),
                         .schema = object[u"schema"_s].toInt(-1),
                         .last_change = Date::from_stored(object[u"last_change"_s].toString()),
                         .rows = {}};
    const QJsonObject rows = object[u"rows"_s].toObject();
    for (auto row = rows.begin(); row != rows.end(); ++row)
        church.rows.insert(row.key().toLower(), size_in(row.value()));
    demand(!church.church_code.isEmpty() && church.schema >= 0 && !church.rows.isEmpty());
    return church;
}

} // namespace

ChurchSummary summary_of(Session& session, const QStringList& tables)
{
    ChurchSummary church;
    church.schema = read_version(session);
    {
        auto code = session.select(u"SELECT [church_code] FROM [tbl_startup];"_s);
        if (const Row* row = code.first())
            church.church_code = row->text(Column{0});
    }
    if (tables.contains(u"tbl_surname"_s, Qt::CaseInsensitive)) {
        auto last = session.select(u"SELECT MAX([last_edit]) FROM [tbl_surname];"_s);
        if (const Row* row = last.first())
            church.last_change = row->date(Column{0});
    }
    for (qsizetype first = 0; first < tables.size(); first += counted_at_once)
        add_counts(session, tables.mid(first, counted_at_once), church.rows);
    return church;
}

QStringList tables_of(Session& session)
{
    auto rows = session.select(
        session.engine() == EngineKind::postgres
            ? u"SELECT [tablename] FROM [pg_tables] WHERE [schemaname]='public' ORDER BY [tablename];"_s
            : u"SELECT [name] FROM [sqlite_master] WHERE [type]='table' AND substr([name],1,7)<>'sqlite_' "
              "ORDER BY [name];"_s);
    QStringList tables;
    for (const Row& row : rows)
        tables += row.text(Column{0});
    return tables;
}

QByteArray Manifest::to_json() const
{
    return QJsonDocument(QJsonObject{
                             {u"format"_s, format_name},
                             {u"format_version"_s, format_version},
                             {u"edition"_s, edition},
                             {u"made"_s, made.toString(Qt::ISODate)},
                             {u"church"_s, church.church},
                             {u"church_name"_s, church.church_name},
                             {u"church_code"_s, church.church_code},
                             {u"schema"_s, church.schema},
                             {u"last_change"_s, church.last_change ? church.last_change->stored() : QString()},
                             {u"rows"_s, rows_to_json(church.rows)},
                             {u"parts"_s, QJsonArray::fromStringList(parts)},
                             {u"entries"_s, entries_to_json(entries)},
                         })
        .toJson();
}

Manifest Manifest::from_json(const QByteArray& json)
{
    const QJsonObject object = QJsonDocument::fromJson(json).object();
    if (object[u"format"_s].toString() != format_name)
        throw BackupError(BackupFault::foreign, u"This file is not a Kindrel backup."_s);
    if (object[u"format_version"_s].toInt() > format_version)
        throw BackupError(BackupFault::newer, u"This backup was made by a newer edition of Kindrel."_s);
    demand(object[u"format_version"_s].toInt() == format_version);

    Manifest manifest{.church = church_from(object),
                      .made = QDateTime::fromString(object[u"made"_s].toString(), Qt::ISODate),
                      .edition = object[u"edition"_s].toInt(),
                      .parts = object[u"parts"_s].toVariant().toStringList(),
                      .entries = {}};
    demand(manifest.made.isValid());
    for (const auto& entry : object[u"entries"_s].toArray())
        manifest.entries.push_back(entry_from(entry.toObject()));
    return manifest;
}

qint64 Manifest::bytes() const
{
    qint64 sum = 0;
    for (const auto& entry : entries)
        sum += entry.size;
    return sum;
}

QString provide_church_code(Session& session)
{
    Transaction transaction(session);
    QString code = summary_of(session, {}).church_code;
    if (code.isEmpty()) {
        code = QUuid::createUuid().toString(QUuid::Id128);
        write_setting(session, u"church_code"_s, code);
    }
    transaction.commit();
    return code;
}

} // namespace kindrel::core
