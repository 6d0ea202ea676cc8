#include "core/sqlite_session.h"

#include "core/dialect.h"

#include <QFile>
#include <QFileInfo>
#include <QHash>
#include <QThread>

#include <SQLiteCpp/Backup.h>
#include <SQLiteCpp/SQLiteCpp.h>
#include <sqlite3.h>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

/// Tells a church file from any other SQLite file.
constexpr int application_id = 0x4B444C31;
constexpr int busy_milliseconds = 15000;
constexpr qsizetype statements_kept = 256;

FileTrouble trouble_of(const SQLite::Exception& error)
{
    switch (error.getErrorCode()) {
    case SQLITE_CORRUPT:
    case SQLITE_NOTADB:
        return FileTrouble::damage;
    case SQLITE_IOERR:
        return error.getExtendedErrorCode() == SQLITE_IOERR_READ ||
                       error.getExtendedErrorCode() == SQLITE_IOERR_SHORT_READ
                   ? FileTrouble::damage
                   : FileTrouble::other;
    case SQLITE_BUSY:
    case SQLITE_LOCKED:
    case SQLITE_PROTOCOL:
        return FileTrouble::in_use;
    case SQLITE_CANTOPEN:
    case SQLITE_PERM:
    case SQLITE_READONLY:
        return FileTrouble::forbidden;
    default:
        return FileTrouble::other;
    }
}

/// Runs `work` and turns the engine's exception into the house's.
template <class Work>
auto guarded(Work&& work) -> decltype(work())
{
    try {
        return work();
    } catch (const SQLite::Exception& error) {
        throw FileDatabaseError(QString::fromUtf8(error.what()), trouble_of(error),
                                error.getErrorCode() == SQLITE_CONSTRAINT);
    }
}

void bind(SQLite::Statement& statement, int place, const Value& value)
{
    if (const auto* number = std::get_if<qint64>(&value)) {
        statement.bind(place, static_cast<int64_t>(*number));
    } else if (const auto* text = std::get_if<QString>(&value)) {
        statement.bind(place, text->toStdString());
    } else if (const auto* bytes = std::get_if<QByteArray>(&value)) {
        statement.bind(place, bytes->constData(), static_cast<int>(bytes->size()));
    } else {
        statement.bind(place);
    }
}

using Prepared = std::shared_ptr<SQLite::Statement>;

/// Frees a kept statement's locks and values, also when it failed.
class Running
{
public:
    explicit Running(Prepared statement) : m_statement(std::move(statement)) {}
    Running(const Running&) = delete;
    Running& operator=(const Running&) = delete;
    ~Running() { m_statement->tryReset(); }
    SQLite::Statement* operator->() const { return m_statement.get(); }
    SQLite::Statement& operator*() const { return *m_statement; }

private:
    Prepared m_statement;
};

class SqliteCursor : public Cursor
{
public:
    explicit SqliteCursor(Prepared statement) : m_statement(std::move(statement)) {}
    ~SqliteCursor() override { m_statement->tryReset(); }
    bool next() override
    {
        return guarded([this] { return m_statement->executeStep(); });
    }
    int column_count() const override { return m_statement->getColumnCount(); }
    QString column_name(int index) const override { return QString::fromUtf8(m_statement->getColumnName(index)); }
    bool is_null(Column column) const override { return cell(column).isNull(); }
    qint64 number(Column column) const override { return cell(column).getInt64(); }
    QString text(Column column) const override
    {
        const auto found = cell(column);
        const char* start = found.getText();
        return QString::fromUtf8(start, found.getBytes());
    }
    QByteArray bytes(Column column) const override
    {
        const auto found = cell(column);
        const auto* start = static_cast<const char*>(found.getBlob());
        return {start, found.getBytes()};
    }
    Value value(Column column) const override
    {
        const auto found = cell(column);
        if (found.isNull())
            return {};
        if (found.isInteger())
            return static_cast<qint64>(found.getInt64());
        return found.isBlob() ? Value{bytes(column)} : Value{text(column)};
    }

private:
    SQLite::Column cell(Column column) const { return m_statement->getColumn(static_cast<int>(column)); }
    Prepared m_statement;
};

class SqliteSession : public Session
{
public:
    SqliteSession(const QString& file, int mode) : m_database(file.toStdString(), mode, busy_milliseconds) {}

    EngineKind engine() const override { return EngineKind::sqlite; }
    void configure()
    {
        m_database.exec("PRAGMA journal_mode=DELETE; PRAGMA synchronous=EXTRA; PRAGMA temp_store=MEMORY;");
    }
    bool read_only() { return sqlite3_db_readonly(m_database.getHandle(), "main") == 1; }
    SQLite::Database& database() { return m_database; }

    void insert(const QString& table, const QStringList& fields, std::span<const std::vector<Value>> rows) override
    {
        if (rows.empty())
            return;
        Transaction transaction(*this);
        guarded([&] { insert_rows(insert_text(table, fields), rows); });
        transaction.commit();
    }

    void fill_temporary(const QString& table, const QStringList& columns,
                        std::span<const std::vector<Value>> rows) override
    {
        guarded([&] {
            m_database.exec(temporary_table(table, columns).toStdString());
            // A plain BEGIN takes no lock until the church's own tables are touched.
            std::optional<SQLite::Transaction> writing;
            if (transaction_depth() == 0)
                writing.emplace(m_database);
            m_database.exec(u"DELETE FROM temp.[%1]"_s.arg(table).toStdString());
            insert_rows(insert_text(table, columns), rows);
            if (writing)
                writing->commit();
        });
    }

    void run_script(const QString& script) override
    {
        guarded([&] {
            for (const auto& statement : split_script(script))
                m_database.exec(statement.toStdString());
        });
    }

    qint64 change_mark() override
    {
        const qint64 others = guarded([this] { return m_database.execAndGet("PRAGMA data_version").getInt64(); });
        return (others << 32) + m_commits;
    }

    void copy_to(const QString& file) override
    {
        if (QFile::exists(file))
            throw DatabaseError(u"'%1' exists already."_s.arg(file));
        guarded([&] {
            SQLite::Database target(file.toStdString(), SQLite::OPEN_READWRITE | SQLite::OPEN_CREATE);
            QFile::setPermissions(file, QFile::ReadOwner | QFile::WriteOwner | QFile::ReadGroup | QFile::WriteGroup);
            copy(target, m_database);
        });
    }

    void replace_content(const QString& file) override
    {
        guarded([&] {
            SQLite::Database source(file.toStdString(), SQLite::OPEN_READONLY, busy_milliseconds);
            m_kept.clear();
            copy(m_database, source);
        });
        ++m_commits;
    }

protected:
    std::unique_ptr<Cursor> run_select(const QString& text, std::span<const Value> values) override
    {
        return guarded([&] {
            auto statement = prepared(text);
            bind_all(*statement, values);
            return std::make_unique<SqliteCursor>(std::move(statement));
        });
    }

    int run(const QString& text, std::span<const Value> values) override
    {
        const int touched = guarded([&] {
            const Running statement(prepared(text));
            bind_all(*statement, values);
            return statement->exec();
        });
        if (transaction_depth() == 0 || text == u"COMMIT")
            ++m_commits;
        return touched;
    }

    void begin_outermost() override { run(u"BEGIN IMMEDIATE"_s, {}); }

private:
    static void bind_all(SQLite::Statement& statement, std::span<const Value> values)
    {
        int place = 0;
        for (const auto& value : values)
            bind(statement, ++place, value);
    }

    static QString insert_text(const QString& table, const QStringList& fields)
    {
        const QStringList marks(fields.size(), u"?"_s);
        return u"INSERT INTO [%1] ([%2]) VALUES (%3)"_s.arg(table, fields.join(u"],["_s), marks.join(u','));
    }

    void insert_rows(const QString& text, std::span<const std::vector<Value>> rows)
    {
        const Running statement(prepared(text));
        for (const auto& row : rows) {
            bind_all(*statement, row);
            statement->exec();
            statement->reset();
        }
    }

    /// A statement is kept for its text and lent to one user at a time; a second user gets one of their own.
    Prepared prepared(const QString& text)
    {
        auto& kept = m_kept[text];
        if (!kept || kept.use_count() > 1) {
            auto fresh = std::make_shared<SQLite::Statement>(m_database, text.toStdString());
            if (kept)
                return fresh;
            kept = std::move(fresh);
        }
        const Prepared found = kept;
        if (m_kept.size() > statements_kept)
            m_kept.removeIf([&](const auto& entry) { return entry.value() != found; });
        return found;
    }

    /// Copies all pages in one go, so that the target changes at once or not at all.
    static void copy(SQLite::Database& target, SQLite::Database& source)
    {
        SQLite::Backup backup(target, source);
        for (int waited = 0;; waited += 50) {
            const int result = backup.executeStep(-1);
            if (result == SQLITE_DONE)
                return;
            if (waited > busy_milliseconds)
                throw SQLite::Exception("database is locked", result);
            QThread::msleep(50);
        }
    }

    SQLite::Database m_database;
    QHash<QString, Prepared> m_kept;
    qint64 m_commits = 0;
};

} // namespace

std::unique_ptr<Session> open_sqlite(const QString& file)
{
    return guarded([&] {
        auto session = std::make_unique<SqliteSession>(file, SQLite::OPEN_READWRITE);
        if (session->read_only())
            throw FileDatabaseError(u"'%1' cannot be written."_s.arg(file), FileTrouble::forbidden);
        if (session->database().execAndGet("PRAGMA application_id").getInt() != application_id)
            throw FileDatabaseError(u"'%1' is not a church database."_s.arg(file), FileTrouble::damage);
        session->configure();
        return std::unique_ptr<Session>(std::move(session));
    });
}

std::unique_ptr<Session> create_sqlite(const QString& file)
{
    if (QFile::exists(file))
        throw DatabaseError(u"'%1' exists already."_s.arg(file));
    return guarded([&] {
        auto session = std::make_unique<SqliteSession>(file, SQLite::OPEN_READWRITE | SQLite::OPEN_CREATE);
        session->database().exec("PRAGMA application_id=" + std::to_string(application_id));
        QFile::setPermissions(file, QFile::ReadOwner | QFile::WriteOwner | QFile::ReadGroup | QFile::WriteGroup);
        session->configure();
        return std::unique_ptr<Session>(std::move(session));
    });
}

} // namespace kindrel::core
