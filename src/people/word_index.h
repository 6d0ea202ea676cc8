#pragma once

#include <QBitArray>
#include <QHash>
#include <QString>

#include <vector>

namespace kindrel::people {

/// Which of many things hold a word that begins with given letters. Things are told by their places from 0; words are
/// those of search_words() and wanted_words().
class WordIndex
{
public:
    /// The things are to be added in the order of their places.
    void add(int place, const QString& search_words);
    /// Puts the words in order; asking begins after this.
    void finish(int places);

    /// A bit for each place. `wanted` is one of wanted_words().
    [[nodiscard]] QBitArray with(QStringView wanted) const;

private:
    struct Word
    {
        QString word;
        std::vector<int> places;
    };

    QHash<QString, std::vector<int>> m_added;
    std::vector<Word> m_words; ///< In order.
    int m_places = 0;
};

/// Which of many things hold a phone number with given digits, from any of its groups of digits on and whatever stands
/// between them. Only the first sixteen digits count.
class NumberIndex
{
public:
    void add(int place, QStringView number);
    /// Puts the numbers in order; asking begins after this.
    void finish();

    /// Sets the bits of those places; the others stay.
    void mark(QStringView digits, QBitArray& found) const;

private:
    struct Number
    {
        quint64 digits = 0; ///< From the left, four bits each; 0 where there are no more.
        int place = 0;
    };

    std::vector<Number> m_numbers;
};

} // namespace kindrel::people
