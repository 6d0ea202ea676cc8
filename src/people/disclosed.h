#pragma once

#include "core/office.h"
#include "people/records.h"

#include <bitset>

namespace kindrel::people {

/// Kinds of details that a single run can keep to itself, beyond what is hidden anyway.
enum class Detail { addresses, phones, emails, birth_dates, work };
inline constexpr int detail_count = 5;
using Details = std::bitset<detail_count>;

/// What a reader may see: the church's options and the user's rights.
struct Disclosure
{
    bool use_preferred_names = false;
    bool birth_dates = true;
    bool pins = true;
    bool visits = true;
    core::DayOrder day_order = core::DayOrder::day_first;
    Details withheld = {};

    [[nodiscard]] static Disclosure of(const core::Office& office);
};

/// A family with everything that the reader may not see already blanked; the only form in which output ever sees one.
/// Made by disclose() alone.
class DisclosedFamily
{
public:
    [[nodiscard]] const FamilyFile& file() const { return m_file; }
    [[nodiscard]] const Family& family() const { return m_file.family; }
    [[nodiscard]] const Address& address() const { return m_file.address; }
    [[nodiscard]] const std::vector<Person>& people() const { return m_file.people; }
    /// The residential and postal suburb; null where there is none or the address is hidden.
    [[nodiscard]] const Suburb* residential() const { return m_file.residential ? &*m_file.residential : nullptr; }
    [[nodiscard]] const Suburb* postal() const { return m_file.postal ? &*m_file.postal : nullptr; }
    /// The name under which a person of this family is listed.
    [[nodiscard]] QString name(const Person& person) const;
    /// A day as the church writes it.
    [[nodiscard]] QString shown(const core::Date& date) const { return date.shown(m_day_order); }

private:
    friend DisclosedFamily disclose(FamilyFile file, const Disclosure& disclosure);
    DisclosedFamily() = default;
    FamilyFile m_file;
    bool m_use_preferred_names = false;
    core::DayOrder m_day_order = core::DayOrder::day_first;
};

[[nodiscard]] DisclosedFamily disclose(FamilyFile file, const Disclosure& disclosure);

} // namespace kindrel::people
