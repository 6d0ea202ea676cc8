#pragma once

#include "desktop/people/editor_rows.h"

namespace kindrel::desktop {

/// A tab made of lists of rows.
class EditorRowsTab : public EditorTab
{
    Q_OBJECT

public:
    using EditorTab::EditorTab;

    void show_file() override;
    [[nodiscard]] bool finish_typing() override;

protected:
    [[nodiscard]] EditorRows* add(people::RowList list);

private:
    std::vector<EditorRows*> m_lists;
};

} // namespace kindrel::desktop
