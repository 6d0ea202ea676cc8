#include "core/postgres_session.h"

#include "core/dialect.h"
#include "core/postgres_copy.h"

#include <QHash>

#include <libpq-fe.h>
#include <pqxx/pqxx>

#include <cstdlib>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr std::size_t values_per_statement = 30000;
/// A temporary table this large is counted, so that the server plans by its true size.
constexpr std::size_t rows_worth_counting = 200;
constexpr unsigned bytea_type = 17;
constexpr std::array<unsigned, 3> whole_number_types{20, 21, 23};
/// First half of the advisory locks' keys; the second is the entity's number.
constexpr int counter_locks = 0x4B444C;

template <class Work>
auto guarded(Work&& work) -> decltype(work())
{
    try {
        return work();
    } catch (const pqxx::integrity_constraint_violation& error) {
        throw DatabaseError(QString::fromUtf8(error.what()), true);
    } catch (const pqxx::pqxx_exception& error) {
        throw DatabaseError(QString::fromUtf8(error.base().what()));
    }
}

/// The values as libpq takes them: texts, or null.
class Parameters
{
public:
    explicit Parameters(std::size_t expected)
    {
        m_texts.reserve(expected);
        m_null.reserve(expected);
    }
    void add(const Value& value)
    {
        m_null.push_back(std::holds_alternative<std::monostate>(value));
        m_texts.push_back(as_text(value));
    }
    void add_all(std::span<const Value> values)
    {
        for (const auto& value : values)
            add(value);
    }
    [[nodiscard]] std::vector<const char*> pointers() const
    {
        std::vector<const char*> found(m_texts.size());
        for (std::size_t i = 0; i < found.size(); ++i)
            found[i] = m_null[i] ? nullptr : m_texts[i].c_str();
        return found;
    }

private:
    static std::string as_text(const Value& value)
    {
        if (const auto* number = std::get_if<qint64>(&value))
            return std::to_string(*number);
        if (const auto* bytes = std::get_if<QByteArray>(&value))
            return "\\x" + bytes->toHex().toStdString();
        const auto* text = std::get_if<QString>(&value);
        if (text && text->contains(QChar::Null))
            throw DatabaseError(u"A text holds a null character."_s);
        return text ? text->toStdString() : std::string();
    }
    std::vector<std::string> m_texts;
    std::vector<bool> m_null;
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
        : m_connection(connection.toStdString()), m_quiet(m_connection), m_work(m_connection)
    {
        m_connection.set_client_encoding("UTF8");
    }

    EngineKind engine() const override { return EngineKind::postgres; }

    void insert(const QString& table, const QStringList& fields, std::span<const std::vector<Value>> rows) override
    {
        const auto at_once = std::max<std::size_t>(1, values_per_statement / static_cast<std::size_t>(fields.size()));
        for (std::size_t start = 0; start < rows.size(); start += at_once)
            insert_some(table, fields, rows.subspan(start, std::min(at_once, rows.size() - start)));
    }

    void fill_temporary(const QString& table, const QStringList& columns,
                        std::span<const std::vector<Value>> rows) override
    {
        run(temporary_table(table, columns), {});
        run(u"TRUNCATE [%1]"_s.arg(table), {});
        insert(table, columns, rows);
        if (rows.size() > rows_worth_counting)
            run(u"ANALYZE [%1]"_s.arg(table), {});
    }

    void run_script(const QString& script) override
    {
        guarded([&] {
            for (const auto& statement : split_script(script))
                m_work.exec(schema_for_postgres(statement).toStdString());
        });
    }

    qint64 change_mark() override
    {
        auto rows = select(u"SELECT CAST(pg_current_wal_insert_lsn() - '0/0' AS bigint) AS [mark]"_s);
        return rows.first()->number(Column{0});
    }

    void copy_to(const QString& file) override { copy_to_file(*this, file); }
    void replace_content(const QString& file) override { replace_from_file(*this, file); }

protected:
    std::unique_ptr<Cursor> run_select(const QString& text, std::span<const Value> values) override
    {
        return std::make_unique<PostgresCursor>(exec(text, values));
    }
    int run(const QString& text, std::span<const Value> values) override
    {
        return static_cast<int>(exec(text, values).affected_rows());
    }
    void hold_counter(Entity entity) override
    {
        (void)select(u"SELECT pg_advisory_xact_lock(CAST(? AS integer), CAST(? AS integer))"_s, counter_locks, entity);
    }
    void begin_outermost() override { run(u"BEGIN"_s, {}); }

private:
    pqxx::result exec(const QString& text, std::span<const Value> values)
    {
        return guarded([&] {
            if (values.empty())
                return m_work.exec(for_postgres(text).toStdString());
            Parameters parameters(values.size());
            parameters.add_all(values);
            return m_work.exec_prepared(prepared(text), pqxx::prepare::make_dynamic_params(parameters.pointers()));
        });
    }

    std::string prepared(const QString& text)
    {
        const auto kept = m_names.constFind(text);
        if (kept != m_names.cend())
            return *kept;
        const auto name = "statement_" + std::to_string(m_names.size());
        m_connection.prepare(name, for_postgres(text).toStdString());
        m_names.insert(text, name);
        return name;
    }

    void insert_some(const QString& table, const QStringList& fields, std::span<const std::vector<Value>> rows)
    {
        const QString row_marks = u'(' + QStringList(fields.size(), u"?"_s).join(u',') + u')';
        const QStringList marks(static_cast<qsizetype>(rows.size()), row_marks);
        const auto text = u"INSERT INTO [%1] ([%2]) VALUES %3"_s.arg(table, fields.join(u"],["_s), marks.join(u','));
        Parameters parameters(rows.size() * static_cast<std::size_t>(fields.size()));
        for (const auto& row : rows)
            parameters.add_all(row);
        guarded([&] {
            m_work.exec_params(for_postgres(text).toStdString(),
                               pqxx::prepare::make_dynamic_params(parameters.pointers()));
        });
    }

    pqxx::connection m_connection;
    pqxx::quiet_errorhandler m_quiet;
    pqxx::nontransaction m_work;
    QHash<QString, std::string> m_names;
};

bool holds_password(const QString& connection)
{
    char* fault = nullptr;
    PQconninfoOption* options = PQconninfoParse(connection.toUtf8().constData(), &fault);
    PQfreemem(fault);
    if (!options)
        return false; // Connecting will say what is wrong with it.
    bool found = false;
    for (const auto* option = options; option->keyword; ++option)
        found = found || (option->val && QByteArray(option->keyword) == "password");
    PQconninfoFree(options);
    return found;
}

} // namespace

std::unique_ptr<Session> open_postgres(const QString& connection)
{
    if (holds_password(connection))
        throw DatabaseError(u"The connection file holds a password. Remove it and use libpq's password file."_s);
    return guarded([&] { return std::unique_ptr<Session>(std::make_unique<PostgresSession>(connection)); });
}

} // namespace kindrel::core
