#pragma once

#include "sample/chance.h"

#include <QString>

#include <map>
#include <tuple>
#include <vector>

namespace kindrel::sample {

struct Surname
{
    QString name;
    QString origin; ///< Where the family's given names come from.
};

struct GivenName
{
    QString name;
    QString preferred; ///< Empty for most.
};

/// Surnames and given names that go together.
class NameBook
{
public:
    NameBook();

    /// The listed surnames come first, each once; the families behind them repeat some and bear made-up ones.
    [[nodiscard]] Surname surname(int family, quint32 seed, Chance& chance) const;
    [[nodiscard]] Surname any_surname(Chance& chance) const;
    [[nodiscard]] Surname surname_from(const QString& origin, Chance& chance) const;
    [[nodiscard]] GivenName given_name(const QString& origin, bool female, int age, Chance& chance) const;

private:
    enum class Generation { young, middle, old };
    using Kind = std::tuple<QString, bool, Generation>; ///< Origin, female, generation.
    [[nodiscard]] static Generation generation_of(int age);
    [[nodiscard]] static bool is_for(const QString& listed, Generation generation);
    [[nodiscard]] QString made_up(Chance& chance) const;

    std::vector<Surname> m_surnames;
    std::vector<QString> m_first_parts;
    std::vector<QString> m_last_parts;
    std::map<Kind, std::vector<GivenName>> m_given;
};

} // namespace kindrel::sample
