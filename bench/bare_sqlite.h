#pragma once

#include <sqlite3.h>

#include <stdexcept>
#include <string>
#include <variant>
#include <vector>

namespace kindrel::bench {

/// SQLite's C interface with nothing around it: kept statements, values copied out as they are.
class BareStatement
{
public:
    BareStatement(sqlite3* database, const std::string& text)
    {
        if (sqlite3_prepare_v2(database, text.c_str(), -1, &m_statement, nullptr) != SQLITE_OK)
            throw std::runtime_error(text + ": " + sqlite3_errmsg(database));
    }
    BareStatement(const BareStatement&) = delete;
    BareStatement(BareStatement&& other) noexcept : m_statement(other.m_statement) { other.m_statement = nullptr; }
    ~BareStatement() { sqlite3_finalize(m_statement); }
    [[nodiscard]] sqlite3_stmt* get() const { return m_statement; }

    /// Runs it and copies every column of every row. The number of rows.
    int read(std::vector<std::string>& cells) const
    {
        int rows = 0;
        const int columns = sqlite3_column_count(m_statement);
        while (sqlite3_step(m_statement) == SQLITE_ROW) {
            ++rows;
            for (int column = 0; column < columns; ++column) {
                const auto* text = reinterpret_cast<const char*>(sqlite3_column_text(m_statement, column));
                cells.emplace_back(text ? text : "");
            }
        }
        sqlite3_reset(m_statement);
        return rows;
    }
    void run() const
    {
        const int result = sqlite3_step(m_statement);
        sqlite3_reset(m_statement);
        if (result != SQLITE_DONE && result != SQLITE_ROW)
            throw std::runtime_error(sqlite3_errmsg(sqlite3_db_handle(m_statement)));
    }

private:
    sqlite3_stmt* m_statement = nullptr;
};

class BareDatabase
{
public:
    explicit BareDatabase(const std::string& file)
    {
        if (sqlite3_open_v2(file.c_str(), &m_database, SQLITE_OPEN_READWRITE, nullptr) != SQLITE_OK)
            throw std::runtime_error("cannot open " + file);
        run("PRAGMA synchronous=EXTRA");
        run("PRAGMA temp_store=MEMORY");
        sqlite3_busy_timeout(m_database, 15000);
    }
    BareDatabase(const BareDatabase&) = delete;
    ~BareDatabase() { sqlite3_close(m_database); }
    [[nodiscard]] sqlite3* get() const { return m_database; }
    void run(const char* text) const { sqlite3_exec(m_database, text, nullptr, nullptr, nullptr); }

private:
    sqlite3* m_database = nullptr;
};

} // namespace kindrel::bench
