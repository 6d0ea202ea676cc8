#include "desktop/people/fusion_entries.h"

#include "desktop/shell/command_side.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QGridLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QListWidget>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::FusionMode;

FusionEntries::FusionEntries(const std::unique_ptr<people::FusionSetup>& setup, QWidget* parent)
    : QWidget(parent), m_setup(setup), m_list(new QListWidget)
{
    m_list->setObjectName(u"entries"_s);
    m_list->setAccessibleName(u"Entries of the fusion"_s);
    m_list->setWordWrap(true);
    m_list->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    m_list->installEventFilter(this);
    connect(m_list, &QListWidget::itemDoubleClicked, this, &FusionEntries::step_mode);
    auto* side = new CommandSide;
    add_commands(*side);
    auto* grid = new QGridLayout(this);
    grid->setContentsMargins(0, 0, 0, 0);
    grid->setHorizontalSpacing(space::field);
    grid->setVerticalSpacing(space::field);
    grid->addWidget(make_heading(u"Entries"_s), 0, 0);
    grid->addWidget(m_list, 1, 0);
    grid->addWidget(side, 1, 1);
    grid->setColumnStretch(0, 1);
    grid->setRowStretch(1, 1);
}

void FusionEntries::add_commands(CommandSide& side)
{
    const auto add = [&](const CommandSide::Command& command, void (FusionEntries::*run)(), QWidget& reach,
                         Qt::ShortcutContext context) {
        side.add(command, reach, context, [this, run] { (this->*run)(); });
    };
    add({"move_up", "Move &up", "go-up", Qt::ALT | Qt::Key_Up}, &FusionEntries::move_up, *this,
        Qt::WidgetWithChildrenShortcut);
    add({"move_down", "Move &down", "go-down", Qt::ALT | Qt::Key_Down}, &FusionEntries::move_down, *this,
        Qt::WidgetWithChildrenShortcut);
    side.start_group();
    add({"step_mode", "&Change", "view-refresh"}, &FusionEntries::step_mode, *this, Qt::WidgetWithChildrenShortcut);
    add({"remove_entry", "&Remove", "edit-delete", Qt::Key_Delete}, &FusionEntries::remove, *m_list,
        Qt::WidgetShortcut);
}

void FusionEntries::show_fusion(int fusion, int entry)
{
    m_fusion = fusion;
    m_list->clear();
    if (m_setup->fusions().holds(fusion))
        for (const auto& shown : m_setup->fusions()[fusion].entries)
            show_row(shown);
    m_list->setCurrentRow(std::clamp(entry, -1, m_list->count() - 1));
}

void FusionEntries::show_row(const people::FusionEntry& entry)
{
    const QString words = entry.shown();
    auto* row = new QListWidgetItem(entry.lost ? words + u" \u2014 no longer exists"_s : words, m_list);
    if (entry.lost)
        row->setForeground(state_colour(State::error, shade_of(palette())));
}

int FusionEntries::chosen() const
{
    return m_list->currentRow();
}

void FusionEntries::done(bool made, int entry)
{
    if (made) {
        show_fusion(m_fusion, entry);
        Q_EMIT changed();
    }
    m_list->setFocus();
}

void FusionEntries::step_mode()
{
    const int entry = chosen();
    int next = 0;
    if (entry >= 0)
        next = (int(m_setup->fusions()[m_fusion].entries[std::size_t(entry)].mode) + 1) % people::fusion_mode_count;
    done(m_setup->set_mode(m_fusion, entry, FusionMode(next)), entry);
}

void FusionEntries::remove()
{
    const int entry = chosen();
    done(m_setup->remove_entry(m_fusion, entry), entry);
}

void FusionEntries::move_up()
{
    const int entry = chosen();
    done(m_setup->move_entry_up(m_fusion, entry), entry - 1);
}

void FusionEntries::move_down()
{
    const int entry = chosen();
    done(m_setup->move_entry_down(m_fusion, entry), entry + 1);
}

bool FusionEntries::eventFilter(QObject* target, QEvent* event)
{
    if (event->type() == QEvent::KeyPress && static_cast<QKeyEvent*>(event)->key() == Qt::Key_Space) {
        step_mode();
        return true;
    }
    return QWidget::eventFilter(target, event);
}

} // namespace kindrel::desktop
