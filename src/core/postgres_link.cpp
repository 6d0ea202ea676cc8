#include "core/postgres_link.h"

#include "core/dialect.h"

#include <libpq-fe.h>

#include <algorithm>
#include <array>

#include <poll.h>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

struct Keyword
{
    const char* name;
    const char* value;
};
/// A server that has vanished is noticed within half a minute, one that does not answer at once.
constexpr std::array limits{
    Keyword{"connect_timeout", "4"},      Keyword{"keepalives_idle", "10"},
    Keyword{"keepalives_interval", "5"},  Keyword{"keepalives_count", "3"},
    Keyword{"tcp_user_timeout", "20000"}, Keyword{"fallback_application_name", "Kindrel"},
};
/// The same for the server, which would keep the locks of a vanished workstation for hours.
const QString server_limits =
    u"SET tcp_keepalives_idle=10; SET tcp_keepalives_interval=5; SET tcp_keepalives_count=3"_s;

/// The server shuts down, was killed, is starting, or has ended this connection.
bool tells_end(const std::string& state)
{
    static constexpr std::array ends{"57P01", "57P02", "57P03", "57P05", "25P03"};
    return state.starts_with("08") || std::ranges::find(ends, state) != ends.end();
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
    void add_all(std::span<const Value> values)
    {
        for (const auto& value : values) {
            m_null.push_back(std::holds_alternative<std::monostate>(value));
            m_texts.push_back(as_text(value));
        }
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

QString quoted(const QByteArray& value)
{
    auto text = QString::fromUtf8(value);
    return u'\'' + text.replace(u'\\', u"\\\\"_s).replace(u'\'', u"\\'"_s) + u'\'';
}

const char* limit_of(const QByteArray& keyword)
{
    const auto found = std::ranges::find_if(limits, [&](const Keyword& limit) { return keyword == limit.name; });
    return found == limits.end() ? nullptr : found->value;
}

using ParsedKeywords = std::unique_ptr<PQconninfoOption, decltype(&PQconninfoFree)>;

ParsedKeywords parse(const QString& connection)
{
    // libpq's own words may quote a password.
    ParsedKeywords options(PQconninfoParse(connection.toUtf8().constData(), nullptr), &PQconninfoFree);
    if (!options || connection.trimmed().isEmpty())
        throw DatabaseError(
            u"The connection to the server cannot be understood. It should read like: host=… dbname=… user=…"_s);
    return options;
}

} // namespace

QString complete_keywords(const QString& connection)
{
    const auto options = parse(connection);
    QStringList complete;
    for (const auto* option = options.get(); option->keyword; ++option) {
        const QByteArray keyword(option->keyword);
        if (option->val && keyword == "password")
            throw DatabaseError(u"The connection file holds a password. Remove it and use libpq's password file."_s);
        if (const char* value = option->val ? option->val : limit_of(keyword))
            complete += QString::fromUtf8(keyword) + u'=' + quoted(value);
    }
    return complete.join(u' ');
}

template <class Work>
auto PostgresLink::guarded(Work&& work) -> decltype(work())
{
    try {
        return work();
    } catch (const pqxx::integrity_constraint_violation& error) {
        throw DatabaseError(QString::fromUtf8(error.what()), true);
    } catch (const pqxx::sql_error& error) {
        if (!m_connection.is_open() || tells_end(error.sqlstate()))
            throw LinkLost(QString::fromUtf8(error.what()));
        throw DatabaseError(QString::fromUtf8(error.what()));
    } catch (const pqxx::pqxx_exception& error) {
        if (!m_connection.is_open())
            throw LinkLost(QString::fromUtf8(error.base().what()));
        throw DatabaseError(QString::fromUtf8(error.base().what()));
    }
}

PostgresLink::PostgresLink(const QString& keywords)
try : m_connection(keywords.toStdString()), m_quiet(m_connection), m_work(m_connection) {
    m_connection.set_client_encoding("UTF8");
    m_work.exec(server_limits.toStdString());
} catch (const pqxx::pqxx_exception& error) {
    throw DatabaseError(QString::fromUtf8(error.base().what()));
}

bool PostgresLink::ended() const
{
    pollfd heard{m_connection.sock(), POLLRDHUP, 0};
    return heard.fd < 0 || (poll(&heard, 1, 0) > 0 && heard.revents != 0);
}

pqxx::result PostgresLink::exec(const QString& text, std::span<const Value> values)
{
    return guarded([&] {
        if (values.empty())
            return m_work.exec(for_postgres(text).toStdString());
        Parameters parameters(values.size());
        parameters.add_all(values);
        return m_work.exec_prepared(prepared(text), pqxx::prepare::make_dynamic_params(parameters.pointers()));
    });
}

void PostgresLink::insert(const QString& table, const QStringList& fields, std::span<const std::vector<Value>> rows)
{
    const QString row_marks = u'(' + QStringList(fields.size(), u"?"_s).join(u',') + u')';
    const QStringList marks(static_cast<qsizetype>(rows.size()), row_marks);
    const auto text = u"INSERT INTO [%1] ([%2]) VALUES %3"_s.arg(table, fields.join(u"],["_s), marks.join(u','));
    Parameters parameters(rows.size() * static_cast<std::size_t>(fields.size()));
    for (const auto& row : rows)
        parameters.add_all(row);
    guarded([&] {
        m_work.exec_params(for_postgres(text).toStdString(), pqxx::prepare::make_dynamic_params(parameters.pointers()));
    });
}

void PostgresLink::exec_as_is(const QString& text)
{
    guarded([&] { m_work.exec(text.toStdString()); });
}

std::string PostgresLink::prepared(const QString& text)
{
    const auto kept = m_names.constFind(text);
    if (kept != m_names.cend())
        return *kept;
    const auto name = "statement_" + std::to_string(m_names.size());
    m_connection.prepare(name, for_postgres(text).toStdString());
    m_names.insert(text, name);
    return name;
}

} // namespace kindrel::core
