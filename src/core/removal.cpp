#include "core/removal.h"

#include "core/references.h"

#include <algorithm>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

const Home* home_at(const char* table, const char* field)
{
    const auto all = homes();
    const auto found = std::ranges::find_if(all, [&](const Home& home) {
        return QByteArrayView(home.table).compare(table, Qt::CaseInsensitive) == 0 &&
               QByteArrayView(home.field).compare(field, Qt::CaseInsensitive) != 0;
    });
    return found == all.end() ? nullptr : &*found;
}

bool goes_with(const Reference& reference, Entity entity)
{
    return reference.to == entity && reference.bond != Bond::keep;
}

bool has_belongings(Entity entity)
{
    return std::ranges::any_of(references(), [&](const Reference& each) { return goes_with(each, entity); });
}

/// One level of a removal. The keys lie in a temporary table of that level, so that deeper ones do not disturb them.
class Removal
{
public:
    Removal(Session& session, int depth) : m_session(session), m_depth(depth) {}

    void run(Entity entity, std::span<const int> keys)
    {
        std::vector<std::vector<Value>> rows;
        for (const int key : keys)
            rows.push_back({to_value(key)});
        m_session.fill_temporary(table(), {u"key"_s}, rows);
        for (const auto& reference : references()) {
            if (goes_with(reference, entity))
                remove_belongings(reference);
        }
        for (const auto& home : homes()) {
            if (home.entity == entity)
                remove_rows(home.table, home.field);
        }
    }

private:
    [[nodiscard]] QString table() const { return u"work_removed_%1"_s.arg(m_depth); }
    [[nodiscard]] QString among(const char* field) const
    {
        return u"[%1] IN (SELECT [key] FROM [%2])"_s.arg(QString::fromLatin1(field), table());
    }

    void remove_rows(const char* from, const char* field)
    {
        m_session.execute(u"DELETE FROM [%1] WHERE %2;"_s.arg(QString::fromLatin1(from), among(field)));
    }

    void remove_belongings(const Reference& reference)
    {
        const Home* home = home_at(reference.table, reference.field);
        if (home && has_belongings(home->entity)) {
            const auto keys = keys_of(*home, reference.field);
            if (!keys.empty())
                Removal(m_session, m_depth + 1).run(home->entity, keys);
        } else {
            remove_rows(reference.table, reference.field);
        }
    }

    [[nodiscard]] std::vector<int> keys_of(const Home& home, const char* field)
    {
        auto rows = m_session.select(u"SELECT [%1] FROM [%2] WHERE %3;"_s.arg(
            QString::fromLatin1(home.field), QString::fromLatin1(home.table), among(field)));
        std::vector<int> keys;
        for (const Row& row : rows)
            keys.push_back(row.integer(Column{0}));
        return keys;
    }

    Session& m_session;
    int m_depth;
};

} // namespace

void remove_entities(Session& session, Entity entity, std::span<const int> keys)
{
    if (!keys.empty())
        Removal(session, 0).run(entity, keys);
}

} // namespace kindrel::core
