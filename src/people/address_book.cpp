#include "people/address_book.h"

#include "people/names.h"

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

/// One family list: its name in selectors, the stored query it reads, and what it asks of a family's row.
struct ListRow
{
    FamilyList list;
    QStringView name;
    QStringView total_caption;
    QStringView query;
    QStringView condition;
};

constexpr QStringView living = u"qry_Kindrel_address_book";
constexpr QStringView everybody = u"qry_Kindrel_address_book_include_decease";

constexpr std::array<ListRow, family_list_count> list_table{{
    {FamilyList::all, u"All Families", u"Family File Total =", everybody, u""},
    {FamilyList::active, u"Active Families", u"Active Families", living, u"[condition] = 0"},
    {FamilyList::privacy, u"Privacy Request by Family", u"Privacy Request by Family", living, u"[condition] = 1"},
    {FamilyList::active_and_privacy, u"Active & Privacy Requested", u"Active & Privacy Requested", living,
     u"([condition] = 1 or [condition] = 0)"},
    {FamilyList::prospect, u"Prospect Families", u"Prospect Families", living, u"[condition] = 2"},
    {FamilyList::archive, u"Archive Families", u"Archive Families", living, u"[condition] = 3"},
    {FamilyList::booked_in, u"Families Booked In", u"Families Booked In", everybody, u"[active_in_book] = -1"},
    {FamilyList::booked_out, u"Families Booked Out", u"Families Booked Out", everybody, u"[booked_out] = -1"},
}};

/// The main menu's own order.
constexpr std::array totals_order{FamilyList::all,        FamilyList::active,   FamilyList::prospect,
                                  FamilyList::archive,    FamilyList::privacy,  FamilyList::active_and_privacy,
                                  FamilyList::booked_out, FamilyList::booked_in};

const ListRow& row_of(FamilyList list)
{
    return list_table[static_cast<std::size_t>(list)];
}

QString statement_of(const ListRow& list, bool of_a_group)
{
    QStringList conditions{list.condition.toString()};
    if (of_a_group)
        conditions +=
            u"[surname_id] IN (SELECT g.[surname_id] FROM [tbl_family_group] g WHERE g.[family_group_id]=?)"_s;
    conditions.removeAll(QString());
    const auto where = conditions.isEmpty() ? QString() : u" WHERE %1"_s.arg(conditions.join(u" AND "_s));
    return u"SELECT * FROM [%1]%2 ORDER BY [sort_key],[Primary_name],[surname_id];"_s.arg(list.query, where);
}

/// The columns of an address book query, resolved once.
struct BookColumns
{
    explicit BookColumns(const core::Rows& rows)
        : key(rows.column(u"surname_id")), surname(rows.column(u"surname")), name(rows.column(u"Name")),
          preferred(rows.column(u"preferred_name")), preferred_hidden(rows.column(u"Preferred_Name_hidden")),
          condition(rows.column(u"condition")), booked_out(rows.column(u"booked_out")),
          street(rows.column(u"res_street")), res_hidden(rows.column(u"res_hidden")), suburb(rows.column(u"suburb")),
          phone(rows.column(u"phone")), phone_hidden(rows.column(u"phone_hidden"))
    {
    }
    core::Column key, surname, name, preferred, preferred_hidden, condition, booked_out, street, res_hidden, suburb,
        phone, phone_hidden;
};

QString listed_name(const core::Row& row, const BookColumns& columns, bool use_preferred_names)
{
    if (use_preferred_names && !row.flag(columns.preferred_hidden)) {
        auto preferred = row.text(columns.preferred);
        if (!preferred.isEmpty())
            return preferred;
    }
    return row.text(columns.name);
}

} // namespace

QString family_list_name(FamilyList list)
{
    return row_of(list).name.toString();
}

std::vector<AddressBookEntry> read_address_book(core::Session& session, FamilyList list, bool use_preferred_names,
                                                std::optional<int> family_group)
{
    std::vector<core::Value> values;
    if (family_group)
        values.push_back(core::to_value(*family_group));
    auto rows = session.select_with(statement_of(row_of(list), family_group.has_value()), values);
    const BookColumns columns(rows);
    std::vector<AddressBookEntry> entries;
    for (const core::Row& row : rows) {
        auto& entry = entries.emplace_back();
        entry.Surname_ID = row.integer(columns.key);
        entry.surname = row.text(columns.surname);
        entry.name = listed_name(row, columns, use_preferred_names);
        entry.Condition = static_cast<FileStatus>(row.integer(columns.condition));
        entry.booked_out = row.flag(columns.booked_out);
        if (!row.flag(columns.res_hidden)) {
            entry.street = row.text(columns.street);
            entry.suburb = row.text(columns.suburb);
        }
        if (!row.flag(columns.phone_hidden))
            entry.phone = row.text(columns.phone);
    }
    return entries;
}

std::vector<FamilyTotal> family_totals(core::Session& session)
{
    QStringList sums;
    for (const auto list : totals_order) {
        const auto condition = row_of(list).condition;
        sums += u"SUM(CASE WHEN %1 THEN 1 ELSE 0 END)"_s.arg(condition.isEmpty() ? u"1=1" : condition);
    }
    auto rows = session.select(u"SELECT %1 FROM [tbl_surname];"_s.arg(sums.join(u',')));
    const auto* row = rows.first();
    std::vector<FamilyTotal> totals;
    for (int index = 0; const auto list : totals_order)
        totals.push_back({list, row_of(list).total_caption.toString(), row->integer(core::Column{index++})});
    return totals;
}

} // namespace kindrel::people
