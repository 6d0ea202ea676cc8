#include "desktop/people/filter_items_part.h"

#include "desktop/people/filter_choice_list.h"
#include "desktop/people/filter_item_details.h"
#include "desktop/shell/look.h"
#include "desktop/shell/side_panel.h"
#include "people/fusion.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QScrollArea>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::FilterItem;

namespace {

constexpr int details_width = 200;

QLabel* make_hint(const QString& text)
{
    auto* hint = new QLabel(text);
    hint->setWordWrap(true);
    dress(*hint, TextSize::secondary);
    return hint;
}

bool same(const FilterItem& left, const FilterItem& right)
{
    return left.kind == right.kind && left.item == right.item;
}

} // namespace

FilterItemsPart::FilterItemsPart(Desk& desk, people::Filter& filter, const people::FilterKindRow& kind)
    : FilterPart(desk, filter, kind.caption.toString()), m_kind(kind),
      m_list(new FilterChoiceList(desk.remembered, kind.caption.toString(), u"Use"_s,
                                  [this](const FilterItem& item) { return use_of(item); })),
      m_details(new FilterItemDetails(kind))
{
    connect(m_list, &FilterChoiceList::chosen_changed, this, &FilterItemsPart::show_details);
    connect(m_list, &FilterChoiceList::step_wanted, this, &FilterItemsPart::step);
    connect(m_list, &FilterChoiceList::plus_wanted, this, [this] { turn(Use::include); });
    connect(m_list, &FilterChoiceList::minus_wanted, this, [this] { turn(Use::exclude); });
    connect(m_details, &FilterItemDetails::chosen, this, &FilterItemsPart::take_details);
    connect(m_details, &FilterItemDetails::another_wanted, this, &FilterItemsPart::ask_for_another_value);
    auto* side = new QVBoxLayout;
    side->setContentsMargins(0, 0, 0, 0);
    side->setSpacing(space::group);
    side->addWidget(m_details);
    side->addWidget(make_hint(u"Enter includes the chosen item, then excludes it, then leaves it out of the filter. "
                              "While nothing is typed, Space does so too, + includes and \u2212 excludes at once."_s));
    side->addStretch(1);
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(space::group);
    row->addWidget(m_list, 1);
    row->addWidget(make_side_panel(side, details_width));
}

int FilterItemsPart::uses() const
{
    return int(std::ranges::count(filter().items, m_kind.kind, &FilterItem::kind));
}

std::vector<FilterItem*> FilterItemsPart::criteria(const FilterItem& item) const
{
    std::vector<FilterItem*> all;
    for (FilterItem& used : filter().items)
        if (same(used, item))
            all.push_back(&used);
    return all;
}

ChoiceUse FilterItemsPart::use_of(const FilterItem& item) const
{
    std::vector<FilterItem> used;
    std::ranges::copy_if(filter().items, std::back_inserter(used), [&](const auto& each) { return same(each, item); });
    if (used.empty())
        return {};
    if (used.front().exclude)
        return {u"exclude"_s + detail_words(used), State::error, u"list-remove"_s};
    return {u"include"_s + detail_words(used), State::contact, u"list-add"_s};
}

void FilterItemsPart::step()
{
    if (const FilterItem* item = m_list->chosen()) {
        const auto used = criteria(*item);
        set_use(*item, used.empty() ? Use::include : used.front()->exclude ? Use::none : Use::exclude);
    }
}

void FilterItemsPart::turn(Use wanted)
{
    if (const FilterItem* item = m_list->chosen()) {
        const auto used = criteria(*item);
        const bool is_so = !used.empty() && used.front()->exclude == (wanted == Use::exclude);
        set_use(*item, is_so ? Use::none : wanted);
    }
}

void FilterItemsPart::set_use(const FilterItem& item, Use use)
{
    const auto used = criteria(item);
    for (FilterItem* each : used)
        each->exclude = use == Use::exclude;
    if (use == Use::none) {
        m_another = false;
        std::erase_if(filter().items, [&](const FilterItem& other) { return same(other, item); });
    } else if (used.empty()) {
        FilterItem& added = filter().items.emplace_back(item);
        added.exclude = use == Use::exclude;
        m_details->read_into(added);
    }
    done();
}

void FilterItemsPart::take_details()
{
    const FilterItem* item = m_list->chosen();
    if (!item)
        return;
    const auto used = criteria(*item);
    if (used.empty())
        return set_use(*item, Use::include);
    FilterItem read = *used.back();
    m_details->read_into(read);
    for (FilterItem* each : used)
        each->marks = read.marks;
    if (!m_another && (read.value || used.size() == 1)) {
        *used.back() = read;
    } else if (m_another && read.value) {
        filter().items.push_back(read);
        m_another = false;
    } else if (!m_another) { // Of several values the last was emptied.
        filter().items.erase(filter().items.begin() + (used.back() - filter().items.data()));
        m_another = true;
    }
    done();
}

void FilterItemsPart::ask_for_another_value()
{
    if (const FilterItem* item = m_list->chosen()) {
        const auto used = criteria(*item);
        m_another = !used.empty() && used.back()->value;
        m_details->ask_for_value();
    }
}

void FilterItemsPart::show_details()
{
    m_another = false;
    const FilterItem* item = m_list->chosen();
    if (!item)
        return m_details->show_nothing();
    const auto used = criteria(*item);
    const auto values = m_kind.has_value() ? people::flexi_values(*desk().office.session, item->item) : QStringList();
    m_details->show_item(used.empty() ? *item : *used.back(), values);
}

void FilterItemsPart::done()
{
    m_list->refresh();
    Q_EMIT changed();
}

void FilterItemsPart::show_filter()
{
    m_list->refresh();
    show_details();
}

void FilterItemsPart::reload()
{
    std::vector<FilterItem> items;
    for (const auto& stored : people::read_setup_items(*desk().office.session, m_kind.list))
        items.push_back({.kind = m_kind.kind, .item = stored.key, .text = stored.text});
    m_list->set_items(std::move(items));
}

void FilterItemsPart::focus_first()
{
    m_list->focus_line();
}

FilterFusionsPart::FilterFusionsPart(Desk& desk, people::Filter& filter)
    : FilterPart(desk, filter, u"Fusion"_s),
      m_list(new FilterChoiceList(desk.remembered, u"Fusion"_s, u"Use"_s, [this](const FilterItem& fusion) {
          return applied(fusion.item) ? ChoiceUse{u"include"_s, State::contact, u"list-add"_s} : ChoiceUse{};
      }))
{
    m_list->say_when_empty(u"Fusions are made on the page Filter Fusion."_s);
    connect(m_list, &FilterChoiceList::step_wanted, this, [this] {
        const FilterItem* fusion = m_list->chosen();
        turn(fusion && !applied(fusion->item));
    });
    connect(m_list, &FilterChoiceList::plus_wanted, this, [this] { turn(true); });
    connect(m_list, &FilterChoiceList::minus_wanted, this, [this] { turn(false); });
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field);
    column->addWidget(m_list, 1);
    column->addWidget(
        make_hint(u"Enter takes a fusion into the filter and out again, and so does Space while nothing is "
                  "typed. Taking it in turns the switches of the people as the fusion has them."_s));
}

bool FilterFusionsPart::applied(int fusion_id) const
{
    return std::ranges::find(filter().fusions, fusion_id) != filter().fusions.end();
}

void FilterFusionsPart::turn(bool on)
{
    const FilterItem* chosen = m_list->chosen();
    if (!chosen)
        return;
    const auto fusions = people::read_fusions(*desk().office.session, std::array{chosen->item});
    std::erase(filter().fusions, chosen->item);
    if (on && !fusions.empty())
        people::apply(filter(), fusions.front());
    m_list->refresh();
    Q_EMIT changed();
}

void FilterFusionsPart::show_filter()
{
    m_list->refresh();
}

void FilterFusionsPart::reload()
{
    std::vector<FilterItem> fusions;
    for (const auto& fusion : people::read_fusions(*desk().office.session))
        fusions.push_back({.item = fusion.fusion_id, .text = fusion.name});
    m_list->set_items(std::move(fusions));
}

void FilterFusionsPart::focus_first()
{
    m_list->focus_line();
}

} // namespace kindrel::desktop
