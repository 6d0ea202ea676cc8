#include "people/word_index.h"

#include <algorithm>

namespace kindrel::people {

void WordIndex::add(int place, const QString& search_words)
{
    for (const QStringView word : QStringView(search_words).split(u' ', Qt::SkipEmptyParts)) {
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
    const auto before = [](const Word& one, QStringView letters) {
        return one.word < letters;
    };
    for (auto one = std::lower_bound(m_words.begin(), m_words.end(), wanted, before);
         one != m_words.end() && one->word.startsWith(wanted); ++one)
        for (const int place : one->places)
            found.setBit(place);
    return found;
}

QBitArray WordIndex::with_all(const QStringList& wanted) const
{
    QBitArray found(m_places, true);
    for (const QString& word : wanted)
        found &= with(QStringView(word).trimmed());
    return found;
}

QBitArray WordIndex::with_any(const QStringList& wanted) const
{
    QBitArray found(m_places);
    for (const QString& word : wanted)
        found |= with(QStringView(word).trimmed());
    return found;
}

} // namespace kindrel::people
