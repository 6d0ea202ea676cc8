#pragma once

#include "people/filter.h"

#include <QHash>

namespace kindrel::people {

/// The texts that setup items have now. Each list is read once, when it is first asked for.
class ItemTexts
{
public:
    explicit ItemTexts(core::Session& session) : m_session(session) {}

    /// Nullopt when the church no longer has the item. Throws core::DatabaseError.
    [[nodiscard]] std::optional<QString> text(FilterKind kind, int item);
    /// Gives `text` the item's present text; false, and the old one stays, when it is gone.
    bool refresh(FilterKind kind, int item, QString& text);

private:
    core::Session& m_session;
    QHash<FilterKind, QHash<int, QString>> m_lists;
};

/// The kind of item that a date criterion asks for; nullopt where it asks for none.
[[nodiscard]] std::optional<FilterKind> kind_of_item(const DateCriterion& criterion);

/// Gives the items of a kept filter the texts that they have now.
void refresh_texts(core::Session& session, Filter& filter);

} // namespace kindrel::people
