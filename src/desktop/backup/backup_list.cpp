#include "desktop/backup/backup_list.h"

#include "desktop/backup/backup_words.h"
#include "desktop/shell/empty_panel.h"
#include "desktop/shell/list_view.h"
#include "desktop/shell/palette.h"

#include <QDir>
#include <QEvent>
#include <QHeaderView>
#include <QVBoxLayout>

#include <utility>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int state_column = 2;

QBrush colour_of(const core::KnownBackup& backup, const QPalette& palette)
{
    if (backup.present && backup.verified)
        return palette.brush(QPalette::Text);
    return state_colour(backup.present ? State::altered : State::error, shade_of(palette));
}

} // namespace

BackupList::BackupList() : QTableWidget(0, 4), m_nothing(new EmptyPanel)
{
    setObjectName(u"backups"_s);
    setAccessibleName(u"Known backups"_s);
    setHorizontalHeaderLabels({u"Made"_s, u"Size"_s, u"State"_s, u"File"_s});
    make_row_list(*this);
    m_nothing->say(u"No backup is known"_s, u"Those of this church are listed here once they are made."_s);
    auto* over = new QVBoxLayout(viewport());
    over->setContentsMargins(0, 0, 0, 0);
    over->addWidget(m_nothing);
}

void BackupList::show_backups(std::vector<core::KnownBackup> backups, core::DayOrder order)
{
    const QString file = chosen() ? chosen()->file : QString();
    const QSignalBlocker quiet(this);
    clearSelection();
    setCurrentCell(-1, -1);
    m_backups = std::move(backups);
    setRowCount(static_cast<int>(m_backups.size()));
    for (int row = 0; row < rowCount(); ++row) {
        const core::KnownBackup& backup = m_backups[static_cast<std::size_t>(row)];
        const QStringList words{moment_words(backup.made, order), size_words(backup.size), state_words(backup),
                                QDir::toNativeSeparators(backup.file)};
        for (int column = 0; column < columnCount(); ++column) {
            auto* cell = new QTableWidgetItem(words[column]);
            cell->setToolTip(words[column]);
            setItem(row, column, cell);
        }
        if (backup.file == file)
            selectRow(row);
    }
    colour_states();
    m_nothing->setVisible(m_backups.empty());
}

const core::KnownBackup* BackupList::chosen() const
{
    const auto rows = selectionModel()->selectedRows();
    return rows.isEmpty() ? nullptr : &m_backups[static_cast<std::size_t>(rows.first().row())];
}

void BackupList::colour_states()
{
    for (int row = 0; row < rowCount(); ++row)
        item(row, state_column)->setForeground(colour_of(m_backups[static_cast<std::size_t>(row)], palette()));
}

void BackupList::start()
{
    setFocus(Qt::OtherFocusReason);
    if (!chosen())
        selectRow(0);
}

void BackupList::changeEvent(QEvent* event)
{
    QTableWidget::changeEvent(event);
    if (event->type() == QEvent::PaletteChange)
        colour_states();
}

} // namespace kindrel::desktop
