#pragma once

#include "people/disclosed.h"
#include "people/family_store.h"

#include <QJsonValue>

#include <functional>

namespace kindrel::apps {

/// A column of the people's list.
struct PeopleField
{
    QString name; ///< The stored one, where there is one.
    QString heading;
    people::Extent extent = people::Part::address; ///< How much of a family it needs.
    std::function<QJsonValue(const people::DisclosedFamily&, const people::Person&)> value;
};

/// All that can be asked for, in the order of a card. Ages are those of `today`.
[[nodiscard]] std::vector<PeopleField> people_list_fields(const QDate& today);

} // namespace kindrel::apps
