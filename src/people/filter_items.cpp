#include "people/filter_items.h"

#include "people/filter_words.h"

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

QString field(const char* name)
{
    return u"[%1]"_s.arg(QString::fromLatin1(name));
}

/// What an item asks of a row, and what a row that is not meant fulfils: the contrary is written out, as NOT would
/// pass over empty values.
struct RowTest
{
    Condition holds, fails;
};

RowTest state_test(const char* name, MinistryChoice choice)
{
    const bool potential = choice == MinistryChoice::potential || choice == MinistryChoice::not_potential;
    const bool in_state = choice == MinistryChoice::active || choice == MinistryChoice::potential;
    const auto state = potential ? MinistryState::potential : MinistryState::active;
    const auto is = condition(field(name) + u"=?"_s, state);
    const auto is_not = condition(field(name) + u"<>?"_s, state);
    return in_state ? RowTest{is, is_not} : RowTest{is_not, is};
}

RowTest mark_test(const char* name, Marks marks)
{
    const Condition marked{field(name) + u"<>0"_s};
    const Condition unmarked{field(name) + u"=0"_s};
    return marks == Marks::marked ? RowTest{marked, unmarked} : RowTest{unmarked, marked};
}

RowTest value_test(const char* name, const QString& value)
{
    const auto value_field = field(name);
    if (value.isEmpty())
        return {{value_field + u" IS NULL"_s}, {value_field + u" IS NOT NULL"_s}};
    return {condition(value_field + u"=?"_s, value), condition(u"(%1 IS NULL OR %1<>?)"_s.arg(value_field), value)};
}

std::vector<RowTest> tests_of(const FilterItem& item)
{
    const auto& kind = filter_kind(item.kind);
    const auto key = field(kind.carriers().item);
    std::vector<RowTest> tests{{condition(key + u"=?"_s, item.item), condition(key + u"<>?"_s, item.item)}};
    if (kind.has_states() && item.ministry != MinistryChoice::any)
        tests.push_back(state_test(kind.state, item.ministry));
    if (kind.has_marks() && item.marks != Marks::any)
        tests.push_back(mark_test(kind.tagged, item.marks));
    if (kind.has_value() && item.value)
        tests.push_back(value_test(kind.value, *item.value));
    return tests;
}

/// A row that answers the item.
Condition match(const FilterItem& item)
{
    std::vector<Condition> parts;
    for (auto& test : tests_of(item))
        parts.push_back(std::move(test.holds));
    return joined(parts, u" AND ");
}

/// A row that does not.
Condition mismatch(const FilterItem& item)
{
    std::vector<Condition> parts;
    for (auto& test : tests_of(item))
        parts.push_back(std::move(test.fails));
    return joined(parts, u" OR ");
}

/// What holds for the rows of the kind that count.
Condition counted(const FilterKindRow& kind, const Condition& rows)
{
    Condition whole{kind.rows ? QString::fromLatin1(kind.rows) + u" AND "_s : QString()};
    return whole += rows;
}

/// "SELECT owner FROM table WHERE …" over the rows of the kind.
Condition owners(const FilterKindRow& kind, const Condition& rows)
{
    const auto& carriers = kind.carriers();
    Condition select{u"SELECT l.%1 FROM %2 l WHERE "_s.arg(field(carriers.owner), field(carriers.table))};
    return select += counted(kind, rows);
}

Condition among(const FilterKindRow& kind, QStringView in, const Condition& owners)
{
    Condition whole{u"%1 %2 ("_s.arg(field(kind.carriers().owner), in)};
    whole += owners;
    return whole += QString(u')');
}

/// The row's owner carries another row that answers.
Condition with_another(const FilterKindRow& kind, const Condition& rows)
{
    const auto owner = field(kind.carriers().owner);
    Condition exists{u"EXISTS (SELECT 1 FROM %1 o WHERE o.%2=l.%2 AND "_s.arg(field(kind.carriers().table), owner)};
    exists += counted(kind, rows);
    return exists += QString(u')');
}

struct Parted
{
    std::vector<FilterItem> included, excluded;
};

Parted parted(std::span<const FilterItem> items)
{
    Parted parts;
    for (const auto& item : items)
        (item.exclude ? parts.excluded : parts.included).push_back(item);
    return parts;
}

template <class Test>
std::vector<Condition> each(const std::vector<FilterItem>& items, Test test)
{
    std::vector<Condition> all;
    for (const auto& item : items)
        all.push_back(test(item));
    return all;
}

QString item_words(const FilterItem& item)
{
    static constexpr std::array<QStringView, 5> states{u"", u" (active)", u" (potential)", u" (not active)",
                                                       u" (not potential)"};
    static constexpr std::array<QStringView, 3> marks{u"", u" (marked)", u" (not marked)"};
    auto words = item.text;
    words += states[static_cast<std::size_t>(item.ministry)];
    words += marks[static_cast<std::size_t>(item.marks)];
    if (item.value)
        words += item.value->isEmpty() ? u" without a value"_s : u" = %1"_s.arg(*item.value);
    return words;
}

QString listed(const std::vector<FilterItem>& items)
{
    QStringList texts;
    for (const auto& item : items)
        texts += item_words(item);
    return alternatives(texts);
}

} // namespace

Condition carried(std::span<const FilterItem> items)
{
    const auto& kind = filter_kind(items.front().kind);
    const auto [included, excluded] = parted(items);
    if (excluded.empty())
        return among(kind, u"IN", owners(kind, joined(each(included, match), u" OR ")));
    const auto spared = joined(each(excluded, mismatch), u" AND ");
    if (!included.empty())
        return among(kind, u"IN", owners(kind, joined({joined(each(included, match), u" OR "), spared}, u" AND ")));
    auto rows = joined(each(excluded, match), u" OR ");
    rows += u" AND NOT "_s;
    rows += with_another(kind, spared);
    return among(kind, u"NOT IN", owners(kind, rows));
}

Condition never_carried(const FilterItem& item)
{
    const auto& kind = filter_kind(item.kind);
    return among(kind, u"NOT IN", owners(kind, match(item)));
}

QString carried_words(std::span<const FilterItem> items)
{
    const auto& kind = filter_kind(items.front().kind);
    const auto [included, excluded] = parted(items);
    if (included.empty())
        return u"%1 %2 %3 other than %4, or %1 none"_s.arg(kind.preposition, kind.article, kind.noun, listed(excluded));
    const auto words = u"%1 the %2 %3"_s.arg(kind.preposition, kind.noun, listed(included));
    return excluded.empty() ? words : u"%1, other than %2"_s.arg(words, listed(excluded));
}

} // namespace kindrel::people
