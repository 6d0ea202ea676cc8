#pragma once

#include "people/records.h"
#include "sample/name_book.h"
#include "sample/setup_lists.h"

#include <QDate>
#include <QStringList>

namespace kindrel::sample {

/// What a person is like beyond what is stored; a portrait is drawn from it.
struct Figure
{
    bool female = false;
    int age = 0;  ///< Of someone deceased: what it would be.
    int tone = 0; ///< From 0, fair, to 5, dark.
    quint64 face = 0;
};

/// A present or past membership of a group.
struct Stay
{
    std::size_t place = 0; ///< Of the person in the family, counted from 0.
    int group = 0;
    core::Date in;
    std::optional<core::Date> out; ///< Unset for a present one, which the person carries too.
};

/// A family on its way into the church.
struct MadeFamily
{
    int index = 0; ///< Counted from 0 through the whole church.
    QString origin;
    int tone = 0; ///< Of its faces.
    people::FamilyFile file;
    std::vector<Figure> figures; ///< One for each person of the file.
    std::vector<Stay> stays;
};

/// What families are made from.
struct Stock
{
    Stock(const SetupLists& setup_lists, const QDate& day);

    const SetupLists& lists;
    QDate today;
    NameBook names;
    QStringList streets, events, contacts, visitors, comments;
};

/// A day on which somebody of that age today was `at` years old, never after today.
[[nodiscard]] core::Date day_at_age(const Stock& stock, int age, int at, Chance& chance);
/// A day of the last so many years, today included.
[[nodiscard]] core::Date recent_day(const Stock& stock, int years, Chance& chance);
[[nodiscard]] people::LinkRow link_to(const SetupItem& item);
[[nodiscard]] people::LinkRow dated_link(const SetupItem& item, const core::Date& date, bool tagged = false);
[[nodiscard]] QString phone_number(Chance& chance);
[[nodiscard]] QString mobile_number(Chance& chance);

} // namespace kindrel::sample
