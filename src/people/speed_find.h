#pragma once

#include "core/office.h"
#include "people/records.h"
#include "people/word_index.h"

namespace kindrel::people {

/// A family as speed find lists it. What is hidden is left out.
struct SpeedFindLine
{
    int surname_id = 0;
    QString surname;
    QString people; ///< "Ann (Nan), Ben Brown, Carl (Dec)".
    QString suburb;
    QString phone;
    FileStatus Condition = FileStatus::active;
    bool booked_out = false;
};

struct SpeedFindHits
{
    std::vector<const SpeedFindLine*> lines; ///< The best first; valid until the next renew().
    int total = 0;

    [[nodiscard]] std::vector<int> surname_ids() const;
};

/// Finds families by the beginnings of any words of them and of their people: surnames, given, preferred and middle
/// names, and residential suburb and phones as far as they are not hidden. It holds all of them in memory.
class SpeedFind
{
public:
    explicit SpeedFind(core::Office& office) : m_office(office) {}

    /// Reads the families again when any workstation has stored something since. False, after saying so, without the
    /// right to it.
    [[nodiscard]] bool renew();
    /// Families that have all typed words, at most so many: first those with one in their surname, then the others, by
    /// surname. Nothing typed finds nothing.
    [[nodiscard]] SpeedFindHits find(const QString& typed, int most) const;

private:
    void read();
    void read_families();
    void read_people();
    void index();

    /// The words by which a family is sought.
    struct Searched
    {
        QString surname, others;
    };

    [[nodiscard]] QBitArray with(const QString& wanted) const;

    core::Office& m_office;
    std::optional<qint64> m_change_mark; ///< Nothing before the first reading.
    std::vector<SpeedFindLine> m_lines;  ///< By surname.
    std::vector<Searched> m_searched;    ///< Beside `m_lines`.
    WordIndex m_words;
    NumberIndex m_numbers;
};

} // namespace kindrel::people
