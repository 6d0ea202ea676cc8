#include "core/recovery.h"

#include <sodium.h>

#include <algorithm>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr qsizetype letters_of_recovery = 8;

bool is_capital(char letter)
{
    return letter >= 'A' && letter <= 'Z';
}

/// Nullopt for what cannot be one by its form: such a one is not worth the time of a hash.
std::optional<Password> in_form(const Password& typed)
{
    QByteArray capitals = typed.bytes().trimmed().toUpper();
    const bool fits = capitals.size() == letters_of_recovery && std::ranges::all_of(capitals, is_capital);
    std::optional<Password> password;
    if (fits)
        password.emplace(QString::fromLatin1(capitals));
    sodium_memzero(capitals.data(), static_cast<std::size_t>(capitals.size()));
    return password;
}

/// The place in the list, from 1; 0 for none of it.
int number_in(const RecoveryList& list, const Password& password)
{
    PasswordCheck check(password, list.salt);
    int found = 0;
    for (int number = 1; number <= list.hashes.size(); ++number) {
        if (check.matches(list.hashes[number - 1]))
            found = number;
    }
    return found;
}

} // namespace

const RecoveryList& recovery_list()
{
    static const RecoveryList list{QByteArray::fromBase64("CZ4vxWqWvmRn6ubhNnN7qA=="),
                                   {
                                       u"argon2id$3$262144$Vk4qLk/KZK3WoJhWhOAG2hIMBTSUNlp7/QG3jfyT4Mw="_s,
                                       u"argon2id$3$262144$Gx+HLSzRQtMOxZlsXzg6/LzgyynF7scJ3JCJ6OC1/v8="_s,
                                       u"argon2id$3$262144$UANKW2IfszeZHLmWaHbC6VpffLmIo3ItNZJ+3qmYqnE="_s,
                                       u"argon2id$3$262144$BIpTYyeIrOkgAltiUjTTTCFXKaHYXP2PqAsbmtZ5K00="_s,
                                       u"argon2id$3$262144$2RR65AQ57Bzhmo8ylwqDwTHa+n5xHNPX/DL4clyIQFg="_s,
                                       u"argon2id$3$262144$A3HmsjN4htm6Cl1xCUCOVS9maUVmk8FpBIM2JdKpvRc="_s,
                                       u"argon2id$3$262144$P66DAIjfi0PPOCRZ/+Za3ZqXARrzfGU/qn5sJr2dw+c="_s,
                                       u"argon2id$3$262144$Qx6N4zrJKbFGb4gHh4XZSSZ+dorhZi8D/a93I1J1hm8="_s,
                                       u"argon2id$3$262144$lCn7f1Gf0zLOrHeCwmqOE7n/4KmTq7C2jEGtfb9HOEA="_s,
                                       u"argon2id$3$262144$5vBkcM7KdS71UpDdv6ski9pNzA0VDHN7NX5JydC0g0s="_s,
                                       u"argon2id$3$262144$ux/+HjOKHTyiTHlorjOobG1gSGXPjyYqxe4RTIRuN8E="_s,
                                       u"argon2id$3$262144$wMSLFm9TjaUOt2pXrwt6v0PVNoeMWz8g6i0Iu+HgR2k="_s,
                                       u"argon2id$3$262144$RUyMAvwwEPpLaN5NMvbN5wCwjhIrMQuwjO23YyL7aQE="_s,
                                       u"argon2id$3$262144$UghNWDxbu4XBpwbq0DSFMwhiTDAjYImNndqDk0XQDQQ="_s,
                                       u"argon2id$3$262144$vB6B/lrkhHgn3sRNba2v2aGtSCWvykYR0cZDtT+N3jw="_s,
                                       u"argon2id$3$262144$BNpRnTp+PLC0lQ46A8HPqRwlSIK5AxhIDKfIQaBKngg="_s,
                                   }};
    return list;
}

Recovery use_recovery_password(Session& session, const Clock& clock, const Password& typed, const RecoveryList& list)
{
    const auto password = in_form(typed);
    const int number = password ? number_in(list, *password) : 0;
    if (number == 0)
        return Recovery::unknown;
    try {
        session.execute(u"INSERT INTO [tbl_security_recovery] ([number],[used]) VALUES (?,?);"_s, number,
                        clock.now().toString(Qt::ISODate));
        return Recovery::admitted;
    } catch (const DatabaseError& error) {
        if (error.constraint_broken())
            return Recovery::used_before;
        throw;
    }
}

} // namespace kindrel::core
