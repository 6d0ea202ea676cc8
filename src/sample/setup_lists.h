#pragma once

#include "core/session.h"

#include <QStringList>

#include <array>
#include <vector>

namespace kindrel::sample {

/// The ten lists in the order in which the setup screen has them.
enum class SetupList {
    status,
    groups,
    ministries,
    personal_dates,
    flexi_fields,
    family_groups,
    family_dates,
    titles,
    occupations,
    suburbs
};
inline constexpr int setup_list_count = 10;

/// Whom an item is for.
enum class Audience { all, infants, children, youth, young_adults, adults, women, men, seniors, couples };

[[nodiscard]] bool is_for(Audience audience, int age, bool female);

struct SetupItem
{
    int key = 0;
    QString text;
    Audience audience = Audience::all;
    int share = 0;    ///< Of a hundred such people or families, how many carry it.
    QStringList more; ///< The columns of the list behind these.
};

class SetupLists
{
public:
    /// Reads the lists, gives every item a key and writes the setup tables.
    explicit SetupLists(core::Session& session);

    [[nodiscard]] const std::vector<SetupItem>& items(SetupList list) const
    {
        return m_items[static_cast<std::size_t>(list)];
    }
    /// False for a group that is kept for its history alone.
    [[nodiscard]] static bool meets(const SetupItem& group) { return group.more[0] == u"meets"; }

private:
    std::array<std::vector<SetupItem>, setup_list_count> m_items;
};

/// Writes the titles alone, which every church begins with.
void write_titles(core::Session& session);

} // namespace kindrel::sample
