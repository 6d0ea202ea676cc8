#include "core/postgres_session.h"

#include "core/dialect.h"
#include "core/postgres_copy.h"
#include "core/postgres_link.h"

#include <cstdlib>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr std::size_t values_per_statement = 30000;
/// A temporary table this large is counted, so that the server plans by its true size.
constexpr std::size_t rows_worth_counting = 200;
constexpr unsigned bytea_type = 17;
constexpr std::array<unsigned, 3> whole_number_types{20, 21, 23};
/// First half of the advisory lock's key that is the turn to write; the second is 0.
constexpr int turn_to_write = 0x4B444C;
/// How long a write waits for its turn.
constexpr int patience_milliseconds = 15000;

/// What becomes of a statement when the connection is lost before its answer: one that changes nothing is sent once
/// more, outside a transaction; any other never is.
enum class Loss { repeat, nothing_stored, unsure };

QString words_of(Loss loss)
{
    switch (loss) {
    case Loss::repeat:
        return u"The connection to the database server was lost twice in a row. Nothing was changed."_s;
    case Loss::nothing_stored:
        return u"The connection to the database server was lost. Nothing of what was to be stored has been stored: "
               "please do it again."_s;
    case Loss::unsure:
        break;
    }
    return u"The connection to the database server was lost while a change was being stored. It may have been stored "
           "or not: please look before you do it again."_s;
}

DatabaseError with_cause(const QString& words, const DatabaseError& cause)
{
    return DatabaseError(u"%1\n%2"_s.arg(words, cause.text().trimmed()));
}

/// Adds rows in as few statements as the protocol allows.
void insert_all(PostgresLink& link, const QString& table, const QStringList& fields,
                std::span<const std::vector<Value>> rows)
{
    const auto at_once = std::max<std::size_t>(1, values_per_statement / static_cast<std::size_t>(fields.size()));
    for (std::size_t start = 0; start < rows.size(); start += at_once)
        link.insert(table, fields, rows.subspan(start, std::min(at_once, rows.size() - start)));
}

/// A session's own table, kept so that it can be laid again on another connection.
struct Temporary
{
    QStringList columns;
    std::vector<std::vector<Value>> rows;
};

void lay(PostgresLink& link, const QString& table, const QStringList& columns, std::span<const std::vector<Value>> rows)
{
    link.exec(temporary_table(table, columns), {});
    link.exec(u"TRUNCATE [%1]"_s.arg(table), {});
    insert_all(link, table, columns, rows);
    if (rows.size() > rows_worth_counting)
        link.exec(u"ANALYZE [%1]"_s.arg(table), {});
}

/// Gives what is done outside any transaction one of its own, because whoever writes waits for the turn.
class Turn
{
public:
    explicit Turn(Session& session)
    {
        if (session.transaction_depth() == 0)
            m_transaction.emplace(session);
    }
    void commit()
    {
        if (m_transaction)
            m_transaction->commit();
    }

private:
    std::optional<Transaction> m_transaction;
};

class PostgresCursor : public Cursor
{
public:
    explicit PostgresCursor(pqxx::result result) : m_result(std::move(result)) {}
    bool next() override { return ++m_at < static_cast<int>(m_result.size()); }
    int column_count() const override { return static_cast<int>(m_result.columns()); }
    QString column_name(int index) const override
    {
        return QString::fromUtf8(m_result.column_name(static_cast<pqxx::row_size_type>(index)));
    }
    bool is_null(Column column) const override { return cell(column).is_null(); }
    qint64 number(Column column) const override
    {
        const auto found = cell(column);
        return found.is_null() ? 0 : std::strtoll(found.c_str(), nullptr, 10);
    }
    QString text(Column column) const override
    {
        const auto found = cell(column);
        return found.is_null() ? QString() : QString::fromUtf8(found.c_str(), static_cast<qsizetype>(found.size()));
    }
    QByteArray bytes(Column column) const override
    {
        const auto found = cell(column);
        return found.is_null() ? QByteArray() : QByteArray::fromHex(QByteArray(found.c_str() + 2));
    }
    Value value(Column column) const override
    {
        const auto found = cell(column);
        if (found.is_null())
            return {};
        const auto type = found.type();
        if (std::ranges::find(whole_number_types, type) != whole_number_types.end())
            return number(column);
        return type == bytea_type ? Value{bytes(column)} : Value{text(column)};
    }

private:
    pqxx::field cell(Column column) const
    {
        return m_result[static_cast<pqxx::result_size_type>(m_at)][static_cast<pqxx::row_size_type>(column)];
    }
    pqxx::result m_result;
    int m_at = -1;
};

class PostgresSession : public Session
{
public:
    explicit PostgresSession(const QString& connection)
        : m_keywords(complete_keywords(connection)), m_link(std::make_unique<PostgresLink>(m_keywords))
    {
    }

    EngineKind engine() const override { return EngineKind::postgres; }

    void insert(const QString& table, const QStringList& fields, std::span<const std::vector<Value>> rows) override
    {
        if (rows.empty())
            return;
        Turn turn(*this);
        on_link(Loss::nothing_stored, [&](PostgresLink& link) { insert_all(link, table, fields, rows); });
        turn.commit();
    }

    void fill_temporary(const QString& table, const QStringList& columns,
                        std::span<const std::vector<Value>> rows) override
    {
        on_link(outside_transaction(Loss::repeat), [&](PostgresLink& link) { lay(link, table, columns, rows); });
        m_temporaries.insert(table, {columns, {rows.begin(), rows.end()}});
    }

    void run_script(const QString& script) override
    {
        Turn turn(*this);
        for (const auto& statement : split_script(script))
            on_link(Loss::nothing_stored, [&](PostgresLink& link) { link.exec_as_is(schema_for_postgres(statement)); });
        turn.commit();
    }

    qint64 change_mark() override
    {
        auto rows = select(u"SELECT CAST(pg_current_wal_insert_lsn() - '0/0' AS bigint) AS [mark]"_s);
        return rows.first()->number(Column{0});
    }

    void copy_to(const QString& file) override { copy_to_file(*open_postgres_snapshot(m_keywords), file); }
    void replace_content(const QString& file) override { replace_from_file(*this, file); }

protected:
    std::unique_ptr<Cursor> run_select(const QString& text, std::span<const Value> values) override
    {
        const bool reads = text.startsWith(u"SELECT"_s, Qt::CaseInsensitive);
        const auto loss = outside_transaction(reads ? Loss::repeat : Loss::unsure);
        return std::make_unique<PostgresCursor>(
            on_link(loss, [&](PostgresLink& link) { return link.exec(text, values); }));
    }
    int run(const QString& text, std::span<const Value> values) override
    {
        if (text == u"ROLLBACK")
            return connected() ? send(text, values) : 0; // Without a connection the server has done so by itself.
        Turn turn(*this);
        const int touched = send(text, values);
        turn.commit();
        return touched;
    }
    /// Those who write take turns, as on a church file: what a transaction has read is still so when it writes.
    void begin_outermost() override
    {
        begin_with(u"BEGIN; SET LOCAL lock_timeout = %1; SELECT pg_advisory_xact_lock(%2, 0)"_s.arg(
            QString::number(patience_milliseconds), QString::number(turn_to_write)));
    }
    void begin_with(const QString& text)
    {
        try {
            on_link(Loss::repeat, [&](PostgresLink& link) { link.exec_as_is(text); });
        } catch (const DatabaseError&) {
            end_failed_begin();
            throw;
        }
    }

private:
    /// What is sent is in a transaction, or ends one.
    int send(const QString& text, std::span<const Value> values)
    {
        const auto loss = text == u"COMMIT" ? Loss::unsure : Loss::nothing_stored;
        return static_cast<int>(
            on_link(loss, [&](PostgresLink& link) { return link.exec(text, values); }).affected_rows());
    }

    void end_failed_begin()
    {
        try {
            run(u"ROLLBACK"_s, {});
        } catch (const DatabaseError&) {
            // The connection is gone, and the transaction with it.
        }
    }

    /// A transaction is gone with its connection: what was done in it is known not to be stored.
    [[nodiscard]] Loss outside_transaction(Loss loss) const
    {
        return transaction_depth() > 0 ? Loss::nothing_stored : loss;
    }

    [[nodiscard]] bool connected()
    {
        if (m_link && m_link->ended())
            m_link.reset();
        return m_link != nullptr;
    }

    /// Runs `work` on the connection, which is made anew where it was lost meanwhile.
    template <class Work>
    auto on_link(Loss loss, Work&& work) -> decltype(work(std::declval<PostgresLink&>()))
    {
        for (bool first = true;; first = false) {
            if (!connected())
                connect_again();
            try {
                return work(*m_link);
            } catch (const LinkLost& lost) {
                m_link.reset();
                if (loss != Loss::repeat || !first)
                    throw with_cause(words_of(loss), lost);
            }
        }
    }

    void connect_again()
    {
        if (transaction_depth() > 0)
            throw DatabaseError(words_of(Loss::nothing_stored));
        try {
            auto link = std::make_unique<PostgresLink>(m_keywords);
            for (auto kept = m_temporaries.cbegin(); kept != m_temporaries.cend(); ++kept)
                lay(*link, kept.key(), kept->columns, kept->rows);
            m_link = std::move(link);
        } catch (const DatabaseError& error) {
            throw with_cause(u"The database server cannot be reached. Nothing was changed; please try again later."_s,
                             error);
        }
    }

    QString m_keywords;
    std::unique_ptr<PostgresLink> m_link;
    QHash<QString, Temporary> m_temporaries;
};

class PostgresSnapshot : public PostgresSession
{
public:
    using PostgresSession::PostgresSession;

protected:
    void begin_outermost() override { begin_with(u"BEGIN ISOLATION LEVEL REPEATABLE READ READ ONLY"_s); }
};

} // namespace

std::unique_ptr<Session> open_postgres(const QString& connection)
{
    return std::make_unique<PostgresSession>(connection);
}

std::unique_ptr<Session> open_postgres_snapshot(const QString& connection)
{
    return std::make_unique<PostgresSnapshot>(connection);
}

} // namespace kindrel::core
