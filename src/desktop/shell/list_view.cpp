#include "desktop/shell/list_view.h"

#include "desktop/shell/look.h"
#include "desktop/shell/table_text.h"

#include <QEvent>
#include <QHeaderView>
#include <QTableView>

namespace kindrel::desktop {

namespace {

/// Lets rows grow with the text.
class RowHeight : public QObject
{
public:
    explicit RowHeight(QTableView& view) : QObject(&view), m_view(view)
    {
        view.installEventFilter(this);
        apply();
    }

protected:
    bool eventFilter(QObject* target, QEvent* event) override
    {
        if (event->type() == QEvent::FontChange || event->type() == QEvent::ApplicationFontChange)
            apply();
        return QObject::eventFilter(target, event);
    }

private:
    void apply()
    {
        m_view.verticalHeader()->setMinimumSectionSize(row_height());
        m_view.verticalHeader()->setDefaultSectionSize(row_height());
        m_view.horizontalHeader()->setFixedHeight(row_height() + 2);
    }

    QTableView& m_view;
};

} // namespace

void make_row_list(QTableView& view)
{
    view.setSelectionBehavior(QAbstractItemView::SelectRows);
    view.setSelectionMode(QAbstractItemView::SingleSelection);
    view.setEditTriggers(QAbstractItemView::NoEditTriggers);
    view.setShowGrid(false);
    view.setTabKeyNavigation(false);
    view.setWordWrap(false);
    view.setCornerButtonEnabled(false);
    view.setHorizontalScrollMode(QAbstractItemView::ScrollPerPixel);
    view.verticalHeader()->hide();
    view.verticalHeader()->setSectionResizeMode(QHeaderView::Fixed);
    view.horizontalHeader()->setHighlightSections(false);
    view.horizontalHeader()->setTextElideMode(Qt::ElideRight);
    view.horizontalHeader()->setMinimumSectionSize(2 * space::row);
    view.horizontalHeader()->setStretchLastSection(true);
    view.horizontalHeader()->setDefaultAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    new RowHeight(view);
    enable_copy(view);
}

} // namespace kindrel::desktop
