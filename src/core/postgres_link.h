#pragma once

#include "core/session.h"

#include <QHash>

#include <pqxx/pqxx>

namespace kindrel::core {

/// The connection to the server is gone, in the middle of what is told here.
class LinkLost : public DatabaseError
{
public:
    using DatabaseError::DatabaseError;
};

/// One connection to a server. Once lost it stays lost. Statements are those of the house's dialect.
class PostgresLink
{
public:
    /// Takes complete keywords. Throws DatabaseError when the server cannot be reached.
    explicit PostgresLink(const QString& keywords);

    /// True once this machine has heard that the other side ended the connection. Asks nobody and waits for nothing.
    [[nodiscard]] bool ended() const;
    /// A statement with values is kept prepared. Throws LinkLost or another DatabaseError.
    pqxx::result exec(const QString& text, std::span<const Value> values);
    /// Adds rows in one statement, which is not kept.
    void insert(const QString& table, const QStringList& fields, std::span<const std::vector<Value>> rows);
    /// Sends a text as it stands.
    void exec_as_is(const QString& text);

private:
    [[nodiscard]] std::string prepared(const QString& text);
    template <class Work>
    auto guarded(Work&& work) -> decltype(work());

    pqxx::connection m_connection;
    pqxx::quiet_errorhandler m_quiet;
    pqxx::nontransaction m_work;
    QHash<QString, std::string> m_names;
};

/// The keywords as a link takes them, with limits to every waiting for a server that does not answer; what the given
/// ones say about these holds. Throws DatabaseError when they cannot be understood or hold a password.
[[nodiscard]] QString complete_keywords(const QString& connection);

} // namespace kindrel::core
