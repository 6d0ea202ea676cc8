#pragma once

#include "core/session.h"

namespace kindrel::core {

/// What a person typed as a password, in one spelling of its characters (UTF-8, NFC). Wiped from memory when it goes.
class Password
{
public:
    /// Takes over the text and wipes it. Nothing is trimmed, and case counts.
    explicit Password(QString&& typed);
    Password(const Password&) = delete;
    Password(Password&& other) noexcept : m_bytes(std::move(other.m_bytes)) { other.m_bytes.clear(); }
    Password& operator=(Password&&) = delete;
    ~Password();

    [[nodiscard]] bool empty() const { return m_bytes.isEmpty(); }
    [[nodiscard]] const QByteArray& bytes() const { return m_bytes; }

private:
    QByteArray m_bytes;
};

/// What one hash costs. Argon2id; memory in KiB.
struct HashCost
{
    int operations;
    int memory;

    friend bool operator==(const HashCost&, const HashCost&) = default;
};
/// About a sixth of a second on an office computer.
inline constexpr HashCost password_cost{2, 64 * 1024};

/// The one salt of all hashes of the church; made at the first call.
[[nodiscard]] QByteArray church_salt(Session& session);

/// The hash as text, with its cost in front. Throws std::bad_alloc when the memory is not to be had.
[[nodiscard]] QString hash_password(const Password& password, const QByteArray& salt, HashCost cost = password_cost);

/// Compares one password with many stored hashes of one salt. Each cost found among them is paid once, so that a
/// password is compared with all users at the price of one hash.
class PasswordCheck
{
public:
    /// Keeps the reference to the password.
    PasswordCheck(const Password& password, QByteArray salt);
    /// False for what is no hash at all. Takes the same time whether they match or not.
    [[nodiscard]] bool matches(const QString& stored);

private:
    const Password& m_password;
    QByteArray m_salt;
    std::vector<std::pair<HashCost, QString>> m_computed;
};

} // namespace kindrel::core
