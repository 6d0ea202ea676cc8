#pragma once

#include "desktop/people/filter_choice_model.h"
#include "desktop/people/filter_part.h"

namespace kindrel::desktop {

class FilterChoiceList;
class FilterItemDetails;

/// The items of one kind, each not used, included or excluded, and what is asked of the chosen one.
class FilterItemsPart : public FilterPart
{
    Q_OBJECT

public:
    FilterItemsPart(Desk& desk, people::Filter& filter, const people::FilterKindRow& kind);

    [[nodiscard]] int uses() const override;
    void show_filter() override;
    void reload() override;
    void focus_first() override;

private:
    enum class Use { none, include, exclude };

    /// The criteria of the item, of which a flexi field may have one for each value; none while it is not used.
    [[nodiscard]] std::vector<people::FilterItem*> criteria(const people::FilterItem& item) const;
    [[nodiscard]] ChoiceUse use_of(const people::FilterItem& item) const;
    void step();
    void turn(Use wanted);
    void set_use(const people::FilterItem& item, Use use);
    void show_details();
    void take_details();
    void ask_for_another_value();
    void done();

    const people::FilterKindRow& m_kind;
    FilterChoiceList* m_list;
    FilterItemDetails* m_details;
    bool m_another = false; ///< The value beside is one more, and not in the filter yet.
};

/// The fusions, each applied or not. A fusion that is applied sets the switches of the people as it has them.
class FilterFusionsPart : public FilterPart
{
    Q_OBJECT

public:
    FilterFusionsPart(Desk& desk, people::Filter& filter);

    [[nodiscard]] int uses() const override { return int(filter().fusions.size()); }
    void show_filter() override;
    void reload() override;
    void focus_first() override;

private:
    [[nodiscard]] bool applied(int fusion_id) const;
    void turn(bool on);

    FilterChoiceList* m_list;
};

} // namespace kindrel::desktop
