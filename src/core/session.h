#pragma once

#include "core/entity.h"
#include "core/rows.h"

#include <QStringList>

#include <array>
#include <span>
#include <stdexcept>
#include <vector>

namespace kindrel::core {

/// The database or its file failed. The text is the engine's own, for the log and the "more" part of a message.
class DatabaseError : public std::runtime_error
{
public:
    explicit DatabaseError(const QString& what, bool constraint_broken = false)
        : std::runtime_error(what.toStdString()), m_constraint_broken(constraint_broken)
    {
    }
    [[nodiscard]] bool constraint_broken() const { return m_constraint_broken; }
    [[nodiscard]] QString text() const { return QString::fromUtf8(what()); }

private:
    bool m_constraint_broken;
};

enum class EngineKind { sqlite, postgres };

/// One open database; the only place that knows an engine. Statements are written once, in the house's dialect:
/// names in brackets without regard to case, `?` for values, no engine's own functions. Everything throws
/// DatabaseError when the engine refuses.
class Session
{
public:
    Session() = default;
    Session(const Session&) = delete;
    Session& operator=(const Session&) = delete;
    virtual ~Session() = default;

    [[nodiscard]] virtual EngineKind engine() const = 0;

    template <class... V>
    [[nodiscard]] Rows select(const QString& text, const V&... values)
    {
        const std::array<Value, sizeof...(V)> bound{to_value(values)...};
        return Rows(run_select(text, bound));
    }
    /// The number of rows touched. Outside a transaction the statement is one of its own.
    template <class... V>
    int execute(const QString& text, const V&... values)
    {
        const std::array<Value, sizeof...(V)> bound{to_value(values)...};
        return run(text, bound);
    }
    [[nodiscard]] Rows select_with(const QString& text, std::span<const Value> values)
    {
        return Rows(run_select(text, values));
    }
    int execute_with(const QString& text, std::span<const Value> values) { return run(text, values); }

    /// Adds many rows at the price of few statements. Each row holds one value for each field.
    virtual void insert(const QString& table, const QStringList& fields, std::span<const std::vector<Value>> rows) = 0;
    /// Empties or makes a temporary table of whole numbers, seen by this session alone, and fills it. The first column
    /// is its key. Takes no write lock on the church's own tables.
    virtual void fill_temporary(const QString& table, const QStringList& columns,
                                std::span<const std::vector<Value>> rows) = 0;
    /// Runs the statements of a schema file one after another; nothing is bound.
    virtual void run_script(const QString& script) = 0;

    /// First of `count` new keys that follow each other. Atomic across workstations.
    [[nodiscard]] int allocate(Entity entity, int count = 1);
    /// Differs once any workstation has committed.
    [[nodiscard]] virtual qint64 change_mark() = 0;
    /// Whole content into a fresh .kdl file, which must not exist yet.
    virtual void copy_to(const QString& file) = 0;
    /// Replaces the whole content by that of a .kdl file: all or nothing, and open workstations see it.
    virtual void replace_content(const QString& file) = 0;
    /// How many transactions are open, one inside the other.
    [[nodiscard]] int transaction_depth() const { return m_depth; }

protected:
    [[nodiscard]] virtual std::unique_ptr<Cursor> run_select(const QString& text, std::span<const Value> values) = 0;
    virtual int run(const QString& text, std::span<const Value> values) = 0;
    virtual void begin_outermost() = 0;

private:
    friend class Transaction;
    int m_depth = 0;
};

/// Takes the write lock at once; nested ones are savepoints; rolls back unless committed.
class Transaction
{
public:
    explicit Transaction(Session& session);
    Transaction(const Transaction&) = delete;
    Transaction& operator=(const Transaction&) = delete;
    ~Transaction();
    void commit();

private:
    Session& m_session;
    int m_level;
    bool m_done = false;
};

} // namespace kindrel::core
