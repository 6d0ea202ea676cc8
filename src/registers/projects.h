#pragma once

#include "registers/register_kind.h"

#include <QString>

#include <vector>

namespace kindrel::registers {

/// A project as the choosers list it.
struct Project
{
    int key = 0;
    QString name;

    friend bool operator==(const Project&, const Project&) = default;
};

/// The pages of a register's screen, each with a project of its own.
enum class Page { entry, output };

/// In the order of the setup.
[[nodiscard]] std::vector<Project> read_projects(core::Session& session, const RegisterKind& kind);

/// The key of the project last chosen on the page, else of the first one; 0 when there is no project.
[[nodiscard]] int remembered_project(core::Session& session, const RegisterKind& kind, Page page);
void remember_project(core::Session& session, const RegisterKind& kind, Page page, int project);

} // namespace kindrel::registers
