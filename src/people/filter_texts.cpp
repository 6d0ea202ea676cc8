#include "people/filter_texts.h"

#include "people/filter_search.h"
#include "people/fusion.h"

#include <algorithm>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

void tell_of_fusions(core::Session& session, const Filter& filter, QStringList& told)
{
    if (filter.fusions.empty())
        return;
    const auto fusions = read_fusions(session, filter.fusions);
    for (const auto& fusion : fusions) {
        for (const auto& [item, mode, lost] : fusion.entries) {
            if (lost)
                told += u"The %1 '%2' of the fusion '%3' no longer exists and is left out"_s.arg(
                    filter_kind(item.kind).noun, item.text, fusion.name);
        }
    }
    for (const int key : filter.fusions) {
        if (std::ranges::find(fusions, key, &Fusion::fusion_id) == fusions.end())
            told += u"A fusion of this filter no longer exists, so that nobody can be found"_s;
    }
}

} // namespace

std::optional<QString> ItemTexts::text(FilterKind kind, int item)
{
    if (!m_lists.contains(kind)) {
        auto& texts = m_lists[kind];
        for (const auto& stored : read_setup_items(m_session, filter_kind(kind).list))
            texts.insert(stored.key, stored.text);
    }
    const auto& texts = m_lists[kind];
    const auto found = texts.find(item);
    return found == texts.end() ? std::nullopt : std::optional(*found);
}

bool ItemTexts::refresh(FilterKind kind, int item, QString& text)
{
    const auto now = this->text(kind, item);
    if (now)
        text = *now;
    return now.has_value();
}

std::optional<FilterKind> kind_of_item(const DateCriterion& criterion)
{
    if (criterion.item == 0)
        return std::nullopt;
    if (criterion.source == DateSource::personal_date)
        return FilterKind::dates;
    return criterion.source == DateSource::family_date ? std::optional(FilterKind::family_dates) : std::nullopt;
}

void refresh_texts(core::Session& session, Filter& filter)
{
    ItemTexts texts(session);
    for (auto& item : filter.items)
        texts.refresh(item.kind, item.item, item.text);
    for (auto& criterion : filter.dates) {
        if (const auto kind = kind_of_item(criterion))
            texts.refresh(*kind, criterion.item, criterion.text);
    }
}

QStringList lost_items(core::Session& session, const Filter& filter)
{
    ItemTexts texts(session);
    QStringList told;
    const auto tell = [&](FilterKind kind, int item, const QString& text) {
        if (!texts.text(kind, item))
            told += u"The %1 '%2' no longer exists"_s.arg(filter_kind(kind).noun, text);
    };
    for (const auto& item : filter.items)
        tell(item.kind, item.item, item.text);
    for (const auto& criterion : filter.dates) {
        if (const auto kind = kind_of_item(criterion))
            tell(*kind, criterion.item, criterion.text);
    }
    tell_of_fusions(session, filter, told);
    return told;
}

} // namespace kindrel::people
