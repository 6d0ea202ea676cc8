#pragma once

#include "core/value.h"

#include <iterator>
#include <memory>

namespace kindrel::core {

/// A result's column, resolved once by name.
enum class Column : int {};

/// The row the cursor stands on; NULL reads as empty, 0 or nullopt.
class Row
{
public:
    virtual ~Row() = default;
    [[nodiscard]] virtual bool is_null(Column) const = 0;
    [[nodiscard]] virtual qint64 number(Column) const = 0;
    [[nodiscard]] virtual QString text(Column) const = 0;
    [[nodiscard]] virtual QByteArray bytes(Column) const = 0;
    [[nodiscard]] int integer(Column column) const { return static_cast<int>(number(column)); }
    [[nodiscard]] bool flag(Column column) const { return number(column) != 0; }
    [[nodiscard]] std::optional<Date> date(Column column) const { return Date::from_stored(text(column)); }
    [[nodiscard]] Amount amount(Column column) const { return {number(column)}; }
    /// The stored value as it is, for copying rows between databases.
    [[nodiscard]] virtual Value value(Column) const = 0;
};

/// A running statement of one engine; ends with its destruction.
class Cursor : public Row
{
public:
    /// Moves to the next row; false behind the last one.
    [[nodiscard]] virtual bool next() = 0;
    [[nodiscard]] virtual int column_count() const = 0;
    [[nodiscard]] virtual QString column_name(int index) const = 0;
};

/// One running statement, lent by the session: never kept across an event-loop turn; its end frees the read lock.
class Rows
{
public:
    class Iterator
    {
    public:
        using difference_type = std::ptrdiff_t;
        using value_type = Row;
        explicit Iterator(Cursor* cursor) : m_cursor(cursor) { ++*this; }
        const Row& operator*() const { return *m_cursor; }
        Iterator& operator++()
        {
            if (m_cursor && !m_cursor->next())
                m_cursor = nullptr;
            return *this;
        }
        void operator++(int) { ++*this; }
        bool operator==(std::default_sentinel_t) const { return m_cursor == nullptr; }

    private:
        Cursor* m_cursor;
    };

    explicit Rows(std::unique_ptr<Cursor> cursor) : m_cursor(std::move(cursor)) {}

    /// Without regard to case; throws DatabaseError when absent.
    [[nodiscard]] Column column(QStringView name) const;
    [[nodiscard]] int column_count() const { return m_cursor->column_count(); }
    [[nodiscard]] QString column_name(int index) const { return m_cursor->column_name(index); }
    /// May be called once: the rows are read as the iterator moves.
    [[nodiscard]] Iterator begin() { return Iterator(m_cursor.get()); }
    [[nodiscard]] std::default_sentinel_t end() const { return {}; }
    /// The first row, or null when there is none. Valid while this object lives; use instead of begin().
    [[nodiscard]] const Row* first() { return m_cursor->next() ? m_cursor.get() : nullptr; }

private:
    std::unique_ptr<Cursor> m_cursor;
};

} // namespace kindrel::core
