#include "core/passwords.h"

#include <sodium.h>

#include <algorithm>
#include <array>
#include <new>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

const QString algorithm = u"argon2id"_s;
constexpr int hash_bytes = 32;
constexpr qsizetype parts_of_hash = 4;
constexpr auto salt_encoding = QByteArray::Base64Encoding;
/// What a stored hash may ask for: a damaged one must not stop the computer.
constexpr HashCost highest_cost{10, 1024 * 1024};

void start_sodium()
{
    if (sodium_init() < 0)
        throw std::runtime_error("The library for passwords could not be started.");
}

void wipe(QString& text)
{
    sodium_memzero(text.data(), static_cast<std::size_t>(text.size()) * sizeof(QChar));
    text.clear();
}

/// Nullopt for what is no hash of ours.
std::optional<HashCost> cost_of(const QString& stored)
{
    const auto parts = stored.split(u'$');
    if (parts.size() != parts_of_hash || parts.front() != algorithm)
        return std::nullopt;
    const HashCost cost{parts[1].toInt(), parts[2].toInt()};
    const bool sensible = cost.operations > 0 && cost.operations <= highest_cost.operations && cost.memory > 0 &&
                          cost.memory <= highest_cost.memory;
    return sensible ? std::optional(cost) : std::nullopt;
}

bool same(const QString& one, const QString& other)
{
    const QByteArray first = one.toLatin1();
    const QByteArray second = other.toLatin1();
    return first.size() == second.size() &&
           sodium_memcmp(first.constData(), second.constData(), static_cast<std::size_t>(first.size())) == 0;
}

QString stored_salt(Session& session)
{
    auto rows = session.select(u"SELECT [password_salt] FROM [tbl_startup];"_s);
    const Row* row = rows.first();
    return row ? row->text(Column{0}) : QString();
}

QString new_salt()
{
    std::array<char, crypto_pwhash_SALTBYTES> salt{};
    randombytes_buf(salt.data(), salt.size());
    return QString::fromLatin1(QByteArray(salt.data(), static_cast<qsizetype>(salt.size())).toBase64(salt_encoding));
}

} // namespace

Password::Password(QString&& typed)
{
    start_sodium();
    QString normal = typed.normalized(QString::NormalizationForm_C);
    m_bytes = normal.toUtf8();
    wipe(normal);
    wipe(typed);
}

Password::~Password()
{
    if (!m_bytes.isEmpty())
        sodium_memzero(m_bytes.data(), static_cast<std::size_t>(m_bytes.size()));
}

QByteArray church_salt(Session& session)
{
    start_sodium();
    if (stored_salt(session).isEmpty()) // Of several that come first at the same time, one stores its own.
        session.execute(u"UPDATE [tbl_startup] SET [password_salt]=? WHERE [password_salt] IS NULL;"_s, new_salt());
    return QByteArray::fromBase64(stored_salt(session).toLatin1());
}

QString hash_password(const Password& password, const QByteArray& salt, HashCost cost)
{
    Q_ASSERT(salt.size() == crypto_pwhash_SALTBYTES);
    const QByteArray& bytes = password.bytes();
    std::array<unsigned char, hash_bytes> hash{};
    const auto* salt_start = reinterpret_cast<const unsigned char*>(salt.constData());
    if (crypto_pwhash(hash.data(), hash.size(), bytes.constData(), static_cast<unsigned long long>(bytes.size()),
                      salt_start, static_cast<unsigned long long>(cost.operations),
                      static_cast<std::size_t>(cost.memory) * 1024, crypto_pwhash_ALG_ARGON2ID13) != 0)
        throw std::bad_alloc();
    const QByteArray raw(reinterpret_cast<const char*>(hash.data()), hash_bytes);
    return u"%1$%2$%3$%4"_s.arg(algorithm, QString::number(cost.operations), QString::number(cost.memory),
                                QString::fromLatin1(raw.toBase64()));
}

PasswordCheck::PasswordCheck(const Password& password, QByteArray salt) : m_password(password), m_salt(std::move(salt))
{
}

bool PasswordCheck::matches(const QString& stored)
{
    const auto cost = cost_of(stored);
    if (!cost)
        return false;
    auto known = std::ranges::find(m_computed, *cost, &std::pair<HashCost, QString>::first);
    if (known == m_computed.end())
        known = m_computed.insert(known, {*cost, hash_password(m_password, m_salt, *cost)});
    return same(known->second, stored);
}

} // namespace kindrel::core
