#include "desktop/people/editor_rows_tab.h"
#include "desktop/people/editor_tabs.h"
#include "desktop/shell/look.h"

#include <QVBoxLayout>

namespace kindrel::desktop {

using people::RowList;

namespace {

class DatesTab : public EditorRowsTab
{
public:
    explicit DatesTab(EditorBench& bench) : EditorRowsTab(bench)
    {
        auto* column = new QVBoxLayout(this);
        column->setContentsMargins(space::margin, space::field, space::margin, space::margin);
        column->setSpacing(space::field);
        for (const RowList list : {RowList::dates, RowList::flexi, RowList::family_dates})
            column->addWidget(add(list), 1);
    }
};

} // namespace

EditorTab* make_dates_tab(EditorBench& bench)
{
    return new DatesTab(bench);
}

} // namespace kindrel::desktop
