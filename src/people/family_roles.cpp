#include "people/family_roles.h"

#include <array>

namespace kindrel::people {

namespace {

constexpr std::array<QStringView, marital::codes> words{
    u"Single Adult",
    u"Single Parent",
    u"Married, No Child",
    u"Married, With Child",
    u"Child",
    u"Child",
    u"Child",
    u"Widower, No Child",
    u"Single Adult, Deceased Child",
    u"Widower, No Child, Deceased Child",
    u"Widower, with Child",
    u"Single Parent, Deceased Child",
    u"Widower, with Child, Deceased Child",
    u"Married, No Child, Deceased Child",
    u"Married, With Child, Deceased Child",
};

/// The codes of one adult's standing in each of the four households.
struct Standing
{
    int alone, with_child, with_spouse, with_both;
};
constexpr std::array standings{
    Standing{1, 2, 3, 4},
    Standing{8, 11, 3, 4},
    Standing{9, 12, 14, 15},
    Standing{10, 13, 14, 15},
};

} // namespace

std::span<const QStringView> marital_words()
{
    return words;
}

QString marital_word(int code)
{
    return code >= 1 && code <= marital::codes ? words[static_cast<std::size_t>(code - 1)].toString() : QString();
}

int with_child(int code)
{
    for (const auto& standing : standings) {
        if (code == standing.alone)
            return standing.with_child;
        if (code == standing.with_spouse)
            return standing.with_both;
    }
    return code;
}

int with_spouse(int code)
{
    for (const auto& standing : standings) {
        if (code == standing.alone)
            return standing.with_spouse;
        if (code == standing.with_child)
            return standing.with_both;
    }
    return code;
}

} // namespace kindrel::people
