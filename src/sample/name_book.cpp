#include "sample/name_book.h"

#include "sample/word_list.h"

#include <numeric>

namespace kindrel::sample {

using namespace Qt::StringLiterals;

namespace {

const QString home = u"home"_s;
constexpr int oldest_young = 35;
constexpr int youngest_old = 62;

} // namespace

NameBook::Generation NameBook::generation_of(int age)
{
    return age <= oldest_young ? Generation::young : age < youngest_old ? Generation::middle : Generation::old;
}

bool NameBook::is_for(const QString& listed, Generation generation)
{
    // The old bear the names of the middle generation too.
    if (listed == u"any" || (listed == u"middle" && generation != Generation::young))
        return true;
    return (listed == u"young" && generation == Generation::young) ||
           (listed == u"old" && generation == Generation::old);
}

NameBook::NameBook()
{
    for (const auto& line : read_list(u"surnames"_s))
        m_surnames.push_back({line[0], line[1]});
    for (const auto& line : read_list(u"surname_parts"_s))
        (line[0] == u"first" ? m_first_parts : m_last_parts).push_back(line[1]);
    for (const auto& line : read_list(u"given_names"_s)) {
        for (const auto generation : {Generation::young, Generation::middle, Generation::old}) {
            if (is_for(line[3], generation))
                m_given[{line[2], line[1] == u"f", generation}].push_back({line[0], line[4]});
        }
    }
}

Surname NameBook::surname(int family, quint32 seed, Chance& chance) const
{
    const int listed = static_cast<int>(m_surnames.size());
    if (family >= listed && chance.percent(55))
        return {made_up(chance), home};
    if (family >= listed || chance.percent(4))
        return any_surname(chance);
    // A stride that shares no divisor with the list's length visits every name once.
    quint64 stride = 89;
    while (std::gcd(stride, static_cast<quint64>(listed)) != 1)
        ++stride;
    return m_surnames[(seed + static_cast<quint64>(family) * stride) % static_cast<quint64>(listed)];
}

QString NameBook::made_up(Chance& chance) const
{
    auto name = chance.pick(m_first_parts);
    name += chance.pick(m_last_parts);
    if (chance.percent(12)) {
        name += u'-' + chance.pick(m_first_parts);
        name += chance.pick(m_last_parts);
    }
    return name;
}

Surname NameBook::any_surname(Chance& chance) const
{
    return chance.pick(m_surnames);
}

Surname NameBook::surname_from(const QString& origin, Chance& chance) const
{
    std::vector<Surname> found;
    for (const auto& surname : m_surnames) {
        if (surname.origin == origin)
            found.push_back(surname);
    }
    return chance.pick(found);
}

GivenName NameBook::given_name(const QString& origin, bool female, int age, Chance& chance) const
{
    // Families that write from right to left keep to one script.
    const bool own = origin.endsWith(u"own-letters") || chance.percent(70);
    return chance.pick(m_given.at({own ? origin : home, female, generation_of(age)}));
}

} // namespace kindrel::sample
