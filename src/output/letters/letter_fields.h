#pragma once

#include "output/run_options.h"
#include "people/disclosed.h"
#include "people/family_store.h"
#include "people/names.h"

#include <QDate>
#include <QStringList>

#include <span>

namespace kindrel::output {

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

/// How a joint form of address names a person.
enum class Called { by_name, by_initial };

/// "Ann & Ben", "A & B"; a single name stands for itself.
[[nodiscard]] QString couple_names(const people::DisclosedFamily& family, const people::Household& household,
                                   Called called = Called::by_name);
/// "Mrs & Mr Ann & Ben". Titles stand together before the names when both have one; a single title stays with its own
/// name.
[[nodiscard]] QString titled_couple(const people::DisclosedFamily& family, const people::Household& household,
                                    Called called = Called::by_name);
/// "Cid, Dot & Eve".
[[nodiscard]] QString listed_with_and(QStringList texts);

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
