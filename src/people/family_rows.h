#pragma once

#include "core/session.h"
#include "people/fields.h"
#include "people/link_tables.h"

#include <vector>

namespace kindrel::people {

/// Collects the rows of whole families, table by table, and writes each table at once.
class FamilyRows
{
public:
    /// Everything but the family's own row. All keys must be set.
    void add(const FamilyFile& file);
    /// The rows that only a new family brings: its own and its visits.
    void add_new(const FamilyFile& file);
    void insert(core::Session& session) const;

private:
    struct Table
    {
        QString name;
        QStringList fields;
        std::vector<std::vector<core::Value>> rows;
    };
    std::vector<core::Value>& row_of(const QString& table, const QStringList& fields);
    template <class Record>
    void add_record(const QString& table, const QString& owner, int key, const Record& record,
                    std::span<const Field<Record>> fields);
    template <class Record>
    void add_list(const QString& table, const QString& place, int key, const std::vector<Record>& records,
                  std::span<const Field<Record>> fields);
    void add_links(const LinkTable& table, int owner, const std::vector<LinkRow>& links);
    void add_suburbs(const FamilyFile& file);
    void add_person(const Person& person);

    std::vector<Table> m_tables;
};

/// Deletes the rows that FamilyRows::add() writes.
void clear_family_rows(core::Session& session, int surname_id);
/// Rewrites the family's own row, the booking state excepted. False when it is gone.
[[nodiscard]] bool update_family_row(core::Session& session, const Family& family);

} // namespace kindrel::people
