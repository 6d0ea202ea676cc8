#pragma once

#include "people/disclosed.h"
#include "people/family_store.h"
#include "people/names.h"

#include <QDate>

#include <span>

namespace kindrel::output {

/// Which address a run puts into its letters. `mailing` is the postal one, or the residential one where a family has
/// no postal one.
enum class LetterAddress { residential, postal, mailing };

/// Whom a copy of a letter goes to.
struct LetterFamily
{
    const people::DisclosedFamily& family;
    people::Household household;
    LetterAddress address = LetterAddress::mailing;
    QDate today = {};

    /// The living people of the family, whoever of them is on the list.
    [[nodiscard]] static LetterFamily of(const people::DisclosedFamily& family, LetterAddress address, QDate today);
};

/// What may stand in a letter to be replaced for each family.
struct LetterField
{
    const char16_t* text;  ///< As it stands in a letter, with its brackets.
    const char16_t* older; ///< Its other spelling, equal in everything; null when it has none.
    QString (*value)(const LetterFamily&);
    people::Extent extent = {}; ///< What the value asks the register for.
};

/// In the order in which a person is offered them.
[[nodiscard]] std::span<const LetterField> letter_fields();

/// The place among the fields of the one that `text` begins with, and the length of its spelling there.
struct FoundField
{
    std::size_t place = 0;
    qsizetype length = 0;
};
[[nodiscard]] std::optional<FoundField> field_at_start(QStringView text);

/// Marks the beginning and the end of what goes when the fields in it are empty.
inline constexpr QStringView removal_filter = u"[R]";

} // namespace kindrel::output
