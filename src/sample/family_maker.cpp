#include "sample/family_maker.h"

#include "sample/belongings.h"
#include "sample/contact_details.h"
#include "sample/rare_cases.h"

namespace kindrel::sample {

namespace {

constexpr int youngest_giver = 18;

} // namespace

MadeFamily FamilyMaker::next()
{
    const int index = m_next_index++;
    Chance chance(m_seed, static_cast<quint64>(index));
    const auto origin = wished_origin(index);
    const auto surname =
        origin.isEmpty() ? m_stock.names.surname(index, m_seed, chance) : m_stock.names.surname_from(origin, chance);
    const auto* wished = wished_plan(index);
    auto family = make_household(wished ? *wished : any_plan(chance), surname, m_stock, chance);
    family.index = index;
    grow_rare(family, m_stock, chance);
    give_standing(family, wished_status(index), m_stock, chance);
    give_address(family, m_stock, chance);
    give_personal_contacts(family, m_stock, chance);
    give_records(family, m_stock, chance);
    give_items(family, m_stock, chance);
    hide_some(family, chance);
    make_rare(family, m_stock, chance);
    give_pins(family, chance);
    return family;
}

void FamilyMaker::give_pins(MadeFamily& family, Chance& chance)
{
    for (std::size_t place = 0; place < family.file.people.size(); ++place) {
        auto& person = family.file.people[place];
        if (person.Active && !person.Decease && family.figures[place].age >= youngest_giver && chance.percent(62))
            person.personal_pin = QString::number(m_next_pin++);
    }
}

} // namespace kindrel::sample
