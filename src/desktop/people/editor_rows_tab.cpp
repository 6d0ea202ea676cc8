#include "desktop/people/editor_rows_tab.h"

#include <algorithm>

namespace kindrel::desktop {

EditorRows* EditorRowsTab::add(people::RowList list)
{
    m_lists.push_back(new EditorRows(bench(), list));
    return m_lists.back();
}

void EditorRowsTab::show_file()
{
    for (EditorRows* list : m_lists)
        list->show_file();
}

bool EditorRowsTab::finish_typing()
{
    return std::ranges::all_of(m_lists, &EditorRows::finish_typing);
}

} // namespace kindrel::desktop
