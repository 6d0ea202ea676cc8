#pragma once

#include <QBitArray>
#include <QHash>
#include <QStringList>

#include <span>
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

    [[nodiscard]] QBitArray with_all(const QStringList& wanted) const;
    [[nodiscard]] QBitArray with_any(const QStringList& wanted) const;

private:
    struct Word
    {
        QString word;
        std::vector<int> places;
    };

    [[nodiscard]] QBitArray with(QStringView wanted) const;

    QHash<QString, std::vector<int>> m_added;
    std::vector<Word> m_words; ///< In order.
    int m_places = 0;
};

} // namespace kindrel::people
