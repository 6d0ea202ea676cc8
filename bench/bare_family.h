#pragma once

#include "bare_sqlite.h"

#include <array>

namespace kindrel::bench {

/// One family's tables by the family's key and by its people's keys, as a load reads them and a save writes them.
inline constexpr std::array family_tables{"tbl_address", "tbl_record_access", "tbl_suburb",     "tbl_other_contact",
                                          "tbl_events",  "tbl_family_group",  "tbl_family_date"};
inline constexpr std::array person_tables{"tbl_personal_details", "tbl_pin",   "tbl_status",          "tbl_group",
                                          "tbl_ministry",         "tbl_flexi", "tbl_individual_date", "tbl_occupation"};
inline constexpr std::array family_views{
    "tbl_surname",       "tbl_people",      "tbl_address",    "tbl_record_access",     "Qry_suburb_load",
    "tbl_other_contact", "Qry_events_load", "tbl_visitation", "qry_family_group_load", "qry_family_date_load"};
inline constexpr std::array person_views{
    "tbl_personal_details", "tbl_pin",        "qry_status_load",          "qry_group_load",
    "qry_ministry_load",    "qry_flexi_load", "qry_individual_date_load", "qry_occupation_load"};

inline const std::string of_family = " WHERE [surname_id]=?1";
inline const std::string of_people =
    " WHERE [person_id] IN (SELECT [person_id] FROM [tbl_people] WHERE [Surname_ID]=?1)";

/// Opening a family: every table's rows, copied cell by cell.
class BareLoad
{
public:
    explicit BareLoad(const BareDatabase& database)
    {
        for (const auto* view : family_views)
            m_statements.emplace_back(database.get(), "SELECT * FROM [" + std::string(view) + "]" + of_family);
        for (const auto* view : person_views)
            m_statements.emplace_back(database.get(), "SELECT * FROM [" + std::string(view) + "]" + of_people);
    }
    void run(int key)
    {
        std::vector<std::string> cells;
        for (const auto& statement : m_statements) {
            sqlite3_bind_int(statement.get(), 1, key);
            statement.read(cells);
        }
    }

private:
    std::vector<BareStatement> m_statements;
};

/// Saving a family: its rows as they stand, deleted and written again in one transaction, and its own row updated.
class BareSave
{
public:
    explicit BareSave(const BareDatabase& database)
        : m_begin(database.get(), "BEGIN IMMEDIATE"), m_commit(database.get(), "COMMIT"),
          m_update(database.get(), "UPDATE [tbl_surname] SET [surname]=[surname],[last_edit]=?2" + of_family),
          m_groups(database.get(), "SELECT [person_id],[group_id] FROM [tbl_group]" + of_people),
          m_people(database.get(), "SELECT [person_id] FROM [tbl_people]" + of_family)
    {
        for (const auto* table : person_tables)
            add(database, table, of_people);
        for (const auto* table : family_tables)
            add(database, table, of_family);
        add(database, "tbl_people", of_family);
    }
    void run(int key, const std::string& date)
    {
        std::vector<std::vector<std::vector<sqlite3_value*>>> kept;
        for (const auto& table : m_tables)
            kept.push_back(values_of(table.read, key));
        m_begin.run();
        sqlite3_bind_int(m_update.get(), 1, key);
        sqlite3_bind_text(m_update.get(), 2, date.c_str(), -1, SQLITE_TRANSIENT);
        m_update.run();
        (void)values_of(m_groups, key);
        (void)values_of(m_people, key);
        for (const auto& table : m_tables) {
            sqlite3_bind_int(table.clear.get(), 1, key);
            table.clear.run();
        }
        for (std::size_t i = 0; i < m_tables.size(); ++i)
            write(m_tables[i].write, kept[i]);
        m_commit.run();
    }

private:
    struct Table
    {
        BareStatement read, clear, write;
    };
    void add(const BareDatabase& database, const std::string& table, const std::string& where)
    {
        BareStatement read(database.get(), "SELECT * FROM [" + table + "]" + where);
        std::string marks = "?";
        for (int column = 1; column < sqlite3_column_count(read.get()); ++column)
            marks += ",?";
        m_tables.push_back({std::move(read), BareStatement(database.get(), "DELETE FROM [" + table + "]" + where),
                            BareStatement(database.get(), "INSERT INTO [" + table + "] VALUES (" + marks + ")")});
    }
    static std::vector<std::vector<sqlite3_value*>> values_of(const BareStatement& statement, int key)
    {
        sqlite3_bind_int(statement.get(), 1, key);
        std::vector<std::vector<sqlite3_value*>> rows;
        while (sqlite3_step(statement.get()) == SQLITE_ROW) {
            auto& row = rows.emplace_back();
            for (int column = 0; column < sqlite3_column_count(statement.get()); ++column)
                row.push_back(sqlite3_value_dup(sqlite3_column_value(statement.get(), column)));
        }
        sqlite3_reset(statement.get());
        return rows;
    }
    static void write(const BareStatement& statement, const std::vector<std::vector<sqlite3_value*>>& rows)
    {
        for (const auto& row : rows) {
            for (std::size_t column = 0; column < row.size(); ++column) {
                sqlite3_bind_value(statement.get(), static_cast<int>(column) + 1, row[column]);
                sqlite3_value_free(row[column]);
            }
            statement.run();
        }
    }
    BareStatement m_begin, m_commit, m_update, m_groups, m_people;
    std::vector<Table> m_tables;
};

} // namespace kindrel::bench
