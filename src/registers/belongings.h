#pragma once

#include "registers/register_kind.h"

namespace kindrel::registers {

// What a removal takes along, to stand beneath its question: "3 dates, 412 marks and 1 note go with it." Empty when
// nothing goes.

[[nodiscard]] QString told_with_date(core::Session& session, const RegisterKind& kind, int date_key);
[[nodiscard]] QString told_with_project(core::Session& session, const RegisterKind& kind, int project);
/// Of a roll project. Marks and visitor figures bear the number of their service or absence, from 1 on, so that they
/// stay without it but cannot be seen.
[[nodiscard]] QString told_without_service(core::Session& session, int project, int service);
[[nodiscard]] QString told_without_absence(core::Session& session, int project, int absence);
/// Of a weekly project.
[[nodiscard]] QString told_with_category(core::Session& session, int category);

} // namespace kindrel::registers
