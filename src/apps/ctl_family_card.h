#pragma once

#include "core/office.h"
#include "people/disclosed.h"

#include <QTextStream>

namespace kindrel::apps {

/// One word for a file status, as the command line writes it.
[[nodiscard]] QString file_status_word(people::FileStatus status);

/// Everything about a family that is not hidden and that the person has the right to see.
void print_family(QTextStream& out, const people::DisclosedFamily& family, const core::Office& office, bool json);

} // namespace kindrel::apps
