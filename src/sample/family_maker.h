#pragma once

#include "sample/made_family.h"

namespace kindrel::sample {

/// Makes the families of a church one after the other, rare cases included.
class FamilyMaker
{
public:
    FamilyMaker(const Stock& stock, quint32 seed) : m_stock(stock), m_seed(seed) {}

    [[nodiscard]] MadeFamily next();
    /// Above every giving number handed out.
    [[nodiscard]] int next_pin() const { return m_next_pin; }

private:
    void give_pins(MadeFamily& family, Chance& chance);

    const Stock& m_stock;
    quint32 m_seed;
    int m_next_index = 0;
    int m_next_pin = 100;
};

} // namespace kindrel::sample
