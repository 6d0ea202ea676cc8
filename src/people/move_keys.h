#pragma once

#include "core/session.h"
#include "people/records.h"

#include <QMap>
#include <QSet>

namespace kindrel::people {

/// A family on its way into another church: the keys it had and those it gets. Noted in the other church for as long as
/// the move lasts, so that a second try knows what the first one left there.
struct Passage
{
    int from_church = 0;
    int from = 0;               ///< `surname_id` here.
    int to = 0;                 ///< `surname_id` there; 0 until keys are set aside.
    QMap<int, int> people = {}; ///< `person_id` here and there; also of those who left the family between two tries.
};

/// The passages from a church that were never ended.
[[nodiscard]] std::vector<Passage> read_passages(core::Session& there, int from_church);
/// Sets the keys aside that the passage lacks, and notes it. One transaction.
void keep_passage(core::Session& there, Passage& passage, const FamilyFile& file);
void forget_passage(core::Session& there, const Passage& passage);

/// Where the family was on its way to when an earlier try was cut off: it may have arrived there.
[[nodiscard]] std::optional<int> earlier_destination(core::Session& here, int surname_id);
void keep_destination(core::Session& here, int surname_id, int church);
void forget_destination(core::Session& here, int surname_id);

[[nodiscard]] QSet<int> present_families(core::Session& session, const QList<int>& surname_ids);
[[nodiscard]] QSet<int> present_people(core::Session& session, const QList<int>& person_ids);
/// As many question marks as there are values, for an IN.
[[nodiscard]] QString places_for(qsizetype values);

} // namespace kindrel::people
