#include "core/rows.h"

#include "core/session.h"

namespace kindrel::core {

using namespace Qt::StringLiterals;

Column Rows::column(QStringView name) const
{
    for (int index = 0; index < m_cursor->column_count(); ++index) {
        if (m_cursor->column_name(index).compare(name, Qt::CaseInsensitive) == 0)
            return static_cast<Column>(index);
    }
    throw DatabaseError(u"The result has no column '%1'."_s.arg(name));
}

} // namespace kindrel::core
