#include "registers/belongings.h"

#include "registers/project_setup.h"

namespace kindrel::registers {

using namespace Qt::StringLiterals;

namespace {

/// Parts of a sentence about what goes.
class Told
{
public:
    void add(int count, const char16_t* one, const char16_t* many)
    {
        if (count > 0)
            m_parts += u"%1 %2"_s.arg(count).arg(QString::fromUtf16(count == 1 ? one : many));
        m_total += count;
    }
    /// What goes, then `one` or `many`; empty when nothing goes.
    [[nodiscard]] QString sentence(const QString& one, const QString& many) const
    {
        if (m_parts.isEmpty())
            return {};
        const auto last = m_parts.last();
        const auto before = m_parts.first(m_parts.size() - 1).join(u", "_s);
        return (before.isEmpty() ? last : before + u" and "_s + last) + (m_total == 1 ? one : many);
    }
    [[nodiscard]] QString sentence() const { return sentence(u" goes with it."_s, u" go with it."_s); }

private:
    QStringList m_parts;
    int m_total = 0;
};

/// Rows of a table whose `field` is as `condition` says; the condition takes one key.
int count(core::Session& session, const char16_t* table, const char16_t* field, const QString& condition, int key)
{
    auto rows =
        session.select(u"SELECT COUNT(*) FROM %1 WHERE %2 %3;"_s.arg(named(table), named(field), condition), key);
    return rows.first()->integer(core::Column{0});
}

/// Dates of the project, as a condition that takes its key.
QString dates_of_project(const RegisterKind& kind)
{
    return u"IN (SELECT %1 FROM %2 WHERE %3 = ?)"_s.arg(named(kind.date_key), named(kind.date_table),
                                                        named(kind.project_key));
}

QString hidden(const Told& told, const QString& what)
{
    const auto words = u" cannot be seen without it, until %1 has a name in its place again."_s.arg(what);
    return told.sentence(words, words);
}

} // namespace

QString told_with_date(core::Session& session, const RegisterKind& kind, int date_key)
{
    Told told;
    for (const auto& rows : kind.belonging_tables())
        told.add(count(session, rows.table, rows.date_key, u"= ?"_s, date_key), rows.one, rows.many);
    return told.sentence();
}

QString told_with_project(core::Session& session, const RegisterKind& kind, int project)
{
    Told told;
    told.add(count(session, kind.date_table, kind.project_key, u"= ?"_s, project), u"date", u"dates");
    const auto of_project = dates_of_project(kind);
    for (const auto& rows : kind.belonging_tables())
        told.add(count(session, rows.table, rows.date_key, of_project, project), rows.one, rows.many);
    return told.sentence();
}

QString told_without_service(core::Session& session, int project, int service)
{
    const auto of_project = dates_of_project(register_kind(Kind::roll));
    const int bit = 1 << (service_count - service);
    Told told;
    told.add(count(session, u"tbl_roll_attendance", u"roll_date_id",
                   of_project + u" AND [Attendance] > 0 AND ([Attendance] & %1) <> 0"_s.arg(bit), project),
             u"mark", u"marks");
    told.add(count(session, u"tbl_roll_visitors", u"roll_date_id",
                   of_project + u" AND [service_id] = %1"_s.arg(service), project),
             u"visitor figure", u"visitor figures");
    return hidden(told, u"a service"_s);
}

QString told_without_absence(core::Session& session, int project, int absence)
{
    Told told;
    told.add(count(session, u"tbl_roll_attendance", u"roll_date_id",
                   dates_of_project(register_kind(Kind::roll)) + u" AND [Attendance] = %1"_s.arg(-absence), project),
             u"mark", u"marks");
    return hidden(told, u"a reason"_s);
}

QString told_with_category(core::Session& session, int category)
{
    Told told;
    told.add(count(session, u"tbl_weekly_amount", u"group_id", u"= ?"_s, category), u"figure", u"figures");
    return told.sentence();
}

} // namespace kindrel::registers
