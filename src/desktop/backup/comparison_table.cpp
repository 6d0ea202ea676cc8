#include "desktop/backup/comparison_table.h"

#include "desktop/shell/empty_panel.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/list_view.h"
#include "desktop/shell/palette.h"

#include <QEvent>
#include <QVBoxLayout>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int outcome_column = 3;

} // namespace

ComparisonTable::ComparisonTable() : QTableWidget(0, 4), m_nothing(new EmptyPanel)
{
    setObjectName(u"comparison"_s);
    setAccessibleName(u"What the backup holds, and what there is now"_s);
    setHorizontalHeaderLabels({u"What"_s, u"In the backup"_s, u"Now"_s, u"Restoring it"_s});
    make_row_list(*this);
    auto* over = new QVBoxLayout(viewport());
    over->setContentsMargins(0, 0, 0, 0);
    over->addWidget(m_nothing);
}

void ComparisonTable::show_lines(std::vector<ComparedLine> lines)
{
    m_lines = std::move(lines);
    m_nothing->setVisible(m_lines.empty());
    clearContents();
    setRowCount(static_cast<int>(m_lines.size()));
    for (int row = 0; row < rowCount(); ++row) {
        const ComparedLine& line = m_lines[static_cast<std::size_t>(row)];
        const QStringList words{line.what, line.then, line.now, line.outcome};
        for (int column = 0; column < columnCount(); ++column) {
            auto* cell = new QTableWidgetItem(words[column]);
            cell->setToolTip(words[column]);
            setItem(row, column, cell);
        }
    }
    mark_losses();
}

void ComparisonTable::say(const QString& what, const QString& next_step)
{
    show_lines({});
    m_nothing->say(what, next_step);
}

void ComparisonTable::mark_losses()
{
    for (int row = 0; row < rowCount(); ++row) {
        if (!m_lines[static_cast<std::size_t>(row)].loss)
            continue;
        QTableWidgetItem& outcome = *item(row, outcome_column);
        outcome.setIcon(icon(u"dialog-warning"_s));
        outcome.setForeground(state_colour(desktop::State::error, shade_of(palette())));
    }
}

void ComparisonTable::changeEvent(QEvent* event)
{
    QTableWidget::changeEvent(event);
    if (event->type() == QEvent::PaletteChange)
        mark_losses();
}

} // namespace kindrel::desktop
