#pragma once

#include "people/filter.h"

namespace kindrel::people {

/// How an entry joins a fusion. The Or entries are alternatives of each other, whatever their kinds; each And entry
/// must hold for itself. An Or- entry holds for whoever carries nothing of its kind, or something else of it.
enum class FusionMode { or_plus, or_minus, and_plus, and_minus };
inline constexpr int fusion_mode_count = 4;
/// " (OR+ Can be in Group)", as it stands behind the entry's text.
[[nodiscard]] QStringView fusion_mode_words(FusionMode mode);

/// One entry. A ministry is asked for in one state; a date or flexi field may be asked for marked rows alone.
struct FusionEntry
{
    FilterItem item = {}; ///< Never `exclude`; of the choices only active, potential and marked are stored.
    FusionMode mode = FusionMode::or_plus;
    bool lost = false; ///< The setup list no longer has the item: the entry counts for nothing.

    /// As the fusion's list shows it.
    [[nodiscard]] QString shown() const;
    friend bool operator==(const FusionEntry&, const FusionEntry&) = default;
};

/// A named set of entries in their order.
struct Fusion
{
    int fusion_id = 0; ///< 0 until the first save.
    QString name = {};
    PersonStates states = {}; ///< What the filters screen's switches become when the fusion is applied.
    std::vector<FusionEntry> entries = {};

    friend bool operator==(const Fusion&, const Fusion&) = default;
};

/// All of them in their order, with the texts that their items have now. Throws core::DatabaseError.
[[nodiscard]] std::vector<Fusion> read_fusions(core::Session& session);
/// Those of these keys, in the order of the keys; one that is gone is passed over.
[[nodiscard]] std::vector<Fusion> read_fusions(core::Session& session, std::span<const int> keys);

/// Adds the fusion to the filter, and sets the switches as the fusion has them.
void apply(Filter& filter, const Fusion& fusion);

} // namespace kindrel::people
