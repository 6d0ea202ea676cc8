#pragma once

#include "desktop/people/editor_fields.h"

class QCheckBox;

namespace kindrel::desktop {

/// The marks of a person: current member, privacy, prospect and the others, as switches.
[[nodiscard]] QWidget* make_person_flags(EditorBench& bench, EditorForm& form);
/// Keeps everything about the person's work out of lists and reports.
[[nodiscard]] QCheckBox* make_business_switch(EditorBench& bench, EditorForm& form);

} // namespace kindrel::desktop
