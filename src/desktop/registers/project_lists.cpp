#include "desktop/registers/project_lists.h"

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

QString ProjectOperations::count_line() const
{
    return count() == 1 ? u"1 project"_s : u"%1 projects"_s.arg(count());
}

const std::vector<registers::CategoryItem>& CategoryOperations::items() const
{
    static const std::vector<registers::CategoryItem> none;
    return m_setup->list(registers::Kind::weekly).holds(m_project) ? m_setup->categories(m_project, m_kind) : none;
}

QString CategoryOperations::count_line() const
{
    return count() == 1 ? u"1 category"_s : u"%1 categories"_s.arg(count());
}

} // namespace kindrel::desktop
