#include "registers/belongings.h"

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
    [[nodiscard]] QString sentence() const
    {
        if (m_parts.isEmpty())
            return {};
        const auto last = m_parts.last();
        const auto before = m_parts.first(m_parts.size() - 1).join(u", "_s);
        return (before.isEmpty() ? last : before + u" and "_s + last) +
               (m_total == 1 ? u" goes with it."_s : u" go with it."_s);
    }

private:
    QStringList m_parts;
    int m_total = 0;
};

/// Rows of a table whose `field` is as `condition` says; the condition takes one key.
int count(core::Session& session, const char16_t* table, const char16_t* field, const QString& condition, int key)
{
    auto rows = session.select(u"SELECT COUNT(*) FROM [%1] WHERE [%2] %3;"_s.arg(QString::fromUtf16(table),
                                                                                 QString::fromUtf16(field), condition),
                               key);
    return rows.first()->integer(core::Column{0});
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
    const auto of_project = u"IN (SELECT [%1] FROM [%2] WHERE [%3] = ?)"_s.arg(
        QString::fromUtf16(kind.date_key), QString::fromUtf16(kind.date_table), QString::fromUtf16(kind.project_key));
    for (const auto& rows : kind.belonging_tables())
        told.add(count(session, rows.table, rows.date_key, of_project, project), rows.one, rows.many);
    return told.sentence();
}

QString told_with_category(core::Session& session, int category)
{
    Told told;
    told.add(count(session, u"tbl_weekly_amount", u"group_id", u"= ?"_s, category), u"figure", u"figures");
    return told.sentence();
}

} // namespace kindrel::registers
