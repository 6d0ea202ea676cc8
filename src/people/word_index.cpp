#include "people/word_index.h"

#include <QStringTokenizer>

#include <algorithm>

namespace kindrel::people {

namespace {

constexpr int bits_of_a_digit = 4;
constexpr int all_bits = 64;

/// The digits of a text from the left, each one more than it is worth.
quint64 packed(QStringView text)
{
    quint64 digits = 0;
    int place = all_bits;
    for (const QChar c : text) {
        if (!c.isDigit())
            continue;
        place -= bits_of_a_digit;
        digits |= quint64(c.digitValue() + 1) << place;
        if (place == 0)
            break;
    }
    return digits;
}

} // namespace

void WordIndex::add(int place, const QString& search_words)
{
    for (const QStringView word : qTokenize(search_words, u' ', Qt::SkipEmptyParts)) {
        auto& places = m_added[word.toString()];
        if (places.empty() || places.back() != place)
            places.push_back(place);
    }
}

void WordIndex::finish(int places)
{
    m_places = places;
    m_words.clear();
    m_words.reserve(std::size_t(m_added.size()));
    for (auto [word, at] : m_added.asKeyValueRange())
        m_words.push_back({word, std::move(at)});
    m_added.clear();
    std::ranges::sort(m_words, {}, &Word::word);
}

QBitArray WordIndex::with(QStringView wanted) const
{
    QBitArray found(m_places);
    const QStringView letters = wanted.trimmed();
    const auto before = [](const Word& one, QStringView other) {
        return one.word < other;
    };
    for (auto one = std::lower_bound(m_words.begin(), m_words.end(), letters, before);
         one != m_words.end() && one->word.startsWith(letters); ++one)
        for (const int place : one->places)
            found.setBit(place);
    return found;
}

void NumberIndex::add(int place, QStringView number)
{
    for (qsizetype at = 0; at < number.size(); ++at)
        if (number[at].isDigit() && (at == 0 || !number[at - 1].isDigit()))
            m_numbers.push_back({packed(number.sliced(at)), place});
}

void NumberIndex::finish()
{
    std::ranges::sort(m_numbers, {}, &Number::digits);
}

void NumberIndex::mark(QStringView digits, QBitArray& found) const
{
    const quint64 first = packed(digits);
    const int open_bits = std::max(0, all_bits - bits_of_a_digit * int(digits.size()));
    const quint64 last = open_bits == 0 ? first : first | ((quint64(1) << open_bits) - 1);
    for (auto number = std::ranges::lower_bound(m_numbers, first, {}, &Number::digits);
         number != m_numbers.end() && number->digits <= last; ++number)
        found.setBit(number->place);
}

} // namespace kindrel::people
