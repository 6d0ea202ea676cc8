#pragma once

#include <algorithm>
#include <cstddef>
#include <utility>
#include <vector>

namespace kindrel::core {

/// Items in the user's order, beside the same list as it is stored. Indices count from 0 and -1 means that no item is
/// chosen; stored positions count from 1.
template <class Item>
class OrderedList
{
public:
    OrderedList() = default;
    explicit OrderedList(std::vector<Item> stored) : m_items(stored), m_stored(std::move(stored)) {}

    [[nodiscard]] static int position(int index) { return index + 1; }
    [[nodiscard]] int size() const { return static_cast<int>(m_items.size()); }
    [[nodiscard]] bool empty() const { return m_items.empty(); }
    [[nodiscard]] bool holds(int index) const { return index >= 0 && index < size(); }
    [[nodiscard]] const Item& operator[](int index) const { return m_items[static_cast<std::size_t>(index)]; }
    [[nodiscard]] auto begin() const { return m_items.begin(); }
    [[nodiscard]] auto end() const { return m_items.end(); }
    [[nodiscard]] const std::vector<Item>& items() const { return m_items; }
    [[nodiscard]] const std::vector<Item>& stored() const { return m_stored; }
    /// Whether a save has anything to write: a list brought back to its stored state is not altered.
    [[nodiscard]] bool altered() const { return m_items != m_stored; }

    void add(Item item) { m_items.push_back(std::move(item)); }
    /// Before the item at `index`, or behind the last one.
    void insert(int index, Item item) { m_items.insert(m_items.begin() + index, std::move(item)); }
    void replace(int index, Item item) { m_items[static_cast<std::size_t>(index)] = std::move(item); }
    void remove(int index) { m_items.erase(m_items.begin() + index); }

    /// False at the top, and nothing is changed.
    [[nodiscard]] bool move_up(int index) { return swap(index - 1, index); }
    /// False at the bottom, and nothing is changed.
    [[nodiscard]] bool move_down(int index) { return swap(index, index + 1); }
    /// By what `key` makes of each item, asked once for each; equal ones keep their order.
    template <class Key>
    void sort_by(const Key& key)
    {
        using Keyed = std::pair<decltype(key(std::declval<const Item&>())), Item>;
        std::vector<Keyed> keyed;
        keyed.reserve(m_items.size());
        for (auto& item : m_items) {
            auto made = key(std::as_const(item));
            keyed.emplace_back(std::move(made), std::move(item));
        }
        std::ranges::stable_sort(keyed, {}, &Keyed::first);
        for (std::size_t i = 0; i < keyed.size(); ++i)
            m_items[i] = std::move(keyed[i].second);
    }

private:
    bool swap(int upper, int lower)
    {
        if (upper < 0 || lower >= size())
            return false;
        std::swap(m_items[static_cast<std::size_t>(upper)], m_items[static_cast<std::size_t>(lower)]);
        return true;
    }

    std::vector<Item> m_items;
    std::vector<Item> m_stored;
};

} // namespace kindrel::core
