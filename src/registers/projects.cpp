#include "registers/projects.h"

#include <algorithm>

namespace kindrel::registers {

using namespace Qt::StringLiterals;

namespace {

QString position_field(const RegisterKind& kind, Page page)
{
    return named(page == Page::entry ? kind.entry_position : kind.output_position);
}

} // namespace

std::vector<Project> read_projects(core::Session& session, const RegisterKind& kind)
{
    auto rows = session.select(u"SELECT %1,%2 FROM %3 ORDER BY [position],%1;"_s.arg(
        named(kind.project_key), named(kind.project_name), named(kind.projects_query)));
    std::vector<Project> projects;
    for (const core::Row& row : rows)
        projects.push_back({row.integer(core::Column{0}), row.text(core::Column{1})});
    return projects;
}

int remembered_project(core::Session& session, const RegisterKind& kind, Page page)
{
    const auto projects = read_projects(session, kind);
    auto rows = session.select(u"SELECT %1 FROM [tbl_project_position];"_s.arg(position_field(kind, page)));
    const auto* row = rows.first();
    const int remembered = row ? row->integer(core::Column{0}) : 0;
    if (std::ranges::find(projects, remembered, &Project::key) != projects.end())
        return remembered;
    return projects.empty() ? 0 : projects.front().key;
}

void remember_project(core::Session& session, const RegisterKind& kind, Page page, int project)
{
    session.execute(u"UPDATE [tbl_project_position] SET %1=?;"_s.arg(position_field(kind, page)), project);
}

} // namespace kindrel::registers
