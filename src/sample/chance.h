#pragma once

#include <QtGlobal>

#include <iterator>

namespace kindrel::sample {

/// Chance that falls alike on every machine: own generator, own mapping onto whole numbers. Each family draws from a
/// stream of its own, so that what one family needs never shifts the next. Never draw twice within one expression
/// whose order the compiler may choose.
class Chance
{
public:
    explicit Chance(quint64 seed, quint64 stream = 0) : m_state(mixed(seed) ^ mixed(~stream)) {}

    [[nodiscard]] quint64 next() { return mixed(m_state += 0x9e3779b97f4a7c15u); }
    /// From 0 up to, without, `limit`, which must be positive.
    [[nodiscard]] int below(int limit)
    {
        return static_cast<int>(((next() >> 32) * static_cast<quint64>(limit)) >> 32);
    }
    /// Both ends included.
    [[nodiscard]] int between(int low, int high) { return low + below(high - low + 1); }
    [[nodiscard]] bool percent(int share) { return below(100) < share; }
    template <class List>
    [[nodiscard]] const auto& pick(const List& list)
    {
        return list[static_cast<typename List::size_type>(below(static_cast<int>(std::size(list))))];
    }

private:
    [[nodiscard]] static constexpr quint64 mixed(quint64 value)
    {
        value = (value ^ (value >> 30)) * 0xbf58476d1ce4e5b9u;
        value = (value ^ (value >> 27)) * 0x94d049bb133111ebu;
        return value ^ (value >> 31);
    }

    quint64 m_state;
};

} // namespace kindrel::sample
