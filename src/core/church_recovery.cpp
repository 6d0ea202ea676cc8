#include "core/church_recovery.h"

#include "core/backup_manifest.h"
#include "core/damaged_file.h"
#include "core/files.h"
#include "core/schema.h"
#include "core/sqlite_session.h"

#include <QFile>
#include <QFileInfo>
#include <QtEndian>

#include <algorithm>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr std::size_t rows_at_once = 2000;

/// Those of the table's fields that the damaged file knows too.
QStringList shared_fields(Session& fresh, const QString& table, const QStringList& known)
{
    const auto rows = fresh.select(u"SELECT * FROM [%1] WHERE 1=0;"_s.arg(table));
    QStringList fields;
    for (int index = 0; index < rows.column_count(); ++index) {
        if (known.contains(rows.column_name(index), Qt::CaseInsensitive))
            fields += rows.column_name(index);
    }
    return fields;
}

/// Gathers rows and writes them in batches; one that the table refuses does not take the others along.
class Filling
{
public:
    Filling(Session& session, RecoveredTable& told, QStringList fields)
        : m_session(session), m_told(told), m_fields(std::move(fields))
    {
    }
    void add(std::vector<Value> row)
    {
        if (m_told.rows + m_told.refused == 0 && m_rows.empty()) // The row that a new church begins with gives way.
            m_session.execute(u"DELETE FROM [%1];"_s.arg(m_told.table));
        m_rows.push_back(std::move(row));
        if (m_rows.size() == rows_at_once)
            flush();
    }
    void flush()
    {
        if (!put(m_rows)) {
            for (const auto& row : m_rows)
                (void)(put({&row, 1}) ? ++m_told.rows : ++m_told.refused);
        } else {
            m_told.rows += static_cast<int>(m_rows.size());
        }
        m_rows.clear();
    }

private:
    bool put(std::span<const std::vector<Value>> rows)
    {
        try {
            Transaction attempt(m_session);
            m_session.insert(m_told.table, m_fields, rows);
            attempt.commit();
            return true;
        } catch (const DatabaseError& error) {
            if (!error.constraint_broken())
                throw;
            return false;
        }
    }

    Session& m_session;
    RecoveredTable& m_told;
    QStringList m_fields;
    std::vector<std::vector<Value>> m_rows;
};

RecoveredTable recover_table(DamagedFile& from, Session& to, const QString& table)
{
    RecoveredTable told{table};
    const auto known = from.fields_of(table);
    const auto fields = shared_fields(to, table, known);
    if (fields.isEmpty()) {
        told.whole = false;
        return told;
    }
    Filling filling(to, told, fields);
    told.whole = from.read(table, fields, [&](std::vector<Value> row) { filling.add(std::move(row)); });
    filling.flush();
    return told;
}

std::vector<RecoveredTable> recover_tables(DamagedFile& from, const QString& file)
{
    const auto fresh = create_sqlite(file);
    create_schema(*fresh);
    std::vector<RecoveredTable> tables;
    Transaction transaction(*fresh);
    for (const auto& table : tables_of(*fresh))
        tables.push_back(recover_table(from, *fresh, table));
    transaction.commit();
    if (std::ranges::all_of(tables, [](const RecoveredTable& table) { return table.rows == 0; }))
        throw DatabaseError(u"Nothing can be read of the church file any more. Put back a backup."_s);
    return tables;
}

/// The files that the work needs meanwhile; gone at the end.
class Scratch
{
public:
    explicit Scratch(const QString& fresh) : m_reading(fresh + u".reading"_s), m_writing(fresh + u".unfinished"_s)
    {
        clear();
    }
    ~Scratch() { clear(); }
    Scratch(const Scratch&) = delete;
    Scratch& operator=(const Scratch&) = delete;
    [[nodiscard]] QString reading() const { return m_reading; }
    [[nodiscard]] QString writing() const { return m_writing; }

private:
    void clear() const
    {
        for (const auto& file : {m_reading, m_writing}) {
            QFile::remove(file);
            QFile::remove(file + u"-journal"_s);
        }
    }

    QString m_reading, m_writing;
};

/// A page that was cut through would pass for one whose rows are empty.
void cut_to_whole_pages(const QString& file)
{
    constexpr int size_place = 16;
    QFile copy(file);
    if (!copy.open(QIODevice::ReadWrite) || !copy.seek(size_place))
        throw FileError(u"Unable to read '%1': %2"_s.arg(file, copy.errorString()));
    const QByteArray told = copy.read(2);
    const int stored = told.size() == 2 ? qFromBigEndian<quint16>(told.constData()) : 0;
    const int page = stored == 1 ? 65536 : stored; // The largest size does not fit into the field.
    if (page >= 512 && copy.size() % page != 0)
        copy.resize(copy.size() / page * page);
}

} // namespace

std::vector<RecoveredTable> recover_church(const QString& damaged, const QString& fresh)
{
    if (!QFileInfo::exists(damaged))
        throw FileError(u"'%1' is missing."_s.arg(damaged));
    if (QFileInfo::exists(fresh))
        throw FileError(u"'%1' exists already; name a new file."_s.arg(fresh));
    const Scratch scratch(fresh);
    // What an interrupted change left in the journal is taken back in the copy.
    if (QFileInfo::exists(damaged + u"-journal"_s))
        copy_file(damaged + u"-journal"_s, scratch.reading() + u"-journal"_s);
    copy_file(damaged, scratch.reading());
    cut_to_whole_pages(scratch.reading());
    DamagedFile from(scratch.reading(), DamagedFile::Opening::copy);
    auto tables = recover_tables(from, scratch.writing());
    move_file(scratch.writing(), fresh);
    return tables;
}

QString code_of_damaged(const QString& damaged)
{
    const QString table = u"tbl_startup"_s, field = u"church_code"_s;
    DamagedFile from(damaged, DamagedFile::Opening::as_it_lies);
    QString code;
    if (!from.fields_of(table).contains(field, Qt::CaseInsensitive))
        return code;
    (void)from.read(table, {field}, [&](const std::vector<Value>& row) {
        if (const auto* text = std::get_if<QString>(&row.front()))
            code = *text;
    });
    return code;
}

} // namespace kindrel::core
