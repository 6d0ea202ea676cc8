#include "desktop/people/editor_tab.h"

#include <algorithm>

namespace kindrel::desktop {

void EditorBench::choose_person(int person)
{
    const int last = int(editor.file().people.size()) - 1;
    m_person = std::clamp(person, last < 0 ? -1 : 0, last);
    Q_EMIT person_chosen();
}

} // namespace kindrel::desktop
