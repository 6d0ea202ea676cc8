#pragma once

#include "people/records.h"

#include "core/session.h"

#include <span>
#include <variant>

namespace kindrel::people {

/// One stored field of a record, by its stored name and the member that holds it.
template <class Record>
struct Field
{
    const char* name;
    std::variant<int Record::*, bool Record::*, QString Record::*, std::optional<core::Date> Record::*,
                 std::optional<int> Record::*>
        member;
};

[[nodiscard]] std::span<const Field<Family>> family_fields(); ///< Without key, `Condition` and the booking state.
[[nodiscard]] std::span<const Field<Family>> booking_fields();
[[nodiscard]] std::span<const Field<Address>> address_fields();
[[nodiscard]] std::span<const Field<OtherContact>> other_contact_fields();
[[nodiscard]] std::span<const Field<Event>> event_fields();
[[nodiscard]] std::span<const Field<Visit>> visit_fields();
[[nodiscard]] std::span<const Field<RecordAccess>> access_fields();
[[nodiscard]] std::span<const Field<Person>> people_fields(); ///< Of `tbl_people`, without the keys.
[[nodiscard]] std::span<const Field<Person>> detail_fields(); ///< Of `tbl_personal_details`, without the key.

inline void read_cell(const core::Row& row, core::Column column, int& value)
{
    value = row.integer(column);
}
/// A number that may be missing is never 0.
inline void read_cell(const core::Row& row, core::Column column, std::optional<int>& value)
{
    const int number = row.integer(column);
    value = number ? std::optional(number) : std::nullopt;
}
inline void read_cell(const core::Row& row, core::Column column, bool& value)
{
    value = row.flag(column);
}
inline void read_cell(const core::Row& row, core::Column column, QString& value)
{
    value = row.text(column);
}
inline void read_cell(const core::Row& row, core::Column column, std::optional<core::Date>& value)
{
    value = row.date(column);
}

/// Fills records from rows; the columns are resolved once.
template <class Record>
class FieldReader
{
public:
    FieldReader(const core::Rows& rows, std::span<const Field<Record>> fields) : m_fields(fields)
    {
        for (const auto& field : fields)
            m_columns.push_back(rows.column(QString::fromLatin1(field.name)));
    }
    void read(const core::Row& row, Record& record) const
    {
        for (std::size_t i = 0; i < m_fields.size(); ++i)
            std::visit([&](auto member) { read_cell(row, m_columns[i], record.*member); }, m_fields[i].member);
    }

private:
    std::span<const Field<Record>> m_fields;
    std::vector<core::Column> m_columns;
};

template <class Record>
void append_names(QStringList& names, std::span<const Field<Record>> fields)
{
    for (const auto& field : fields)
        names += QString::fromLatin1(field.name);
}

template <class Record>
void append_values(std::vector<core::Value>& values, const Record& record, std::span<const Field<Record>> fields)
{
    for (const auto& field : fields)
        std::visit([&](auto member) { values.push_back(core::to_value(record.*member)); }, field.member);
}

} // namespace kindrel::people
