#include "desktop/people/fusion_entries.h"

#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QGridLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QListWidget>
#include <QPushButton>
#include <QShortcut>

#include <algorithm>
#include <array>

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
    auto* grid = new QGridLayout(this);
    grid->setContentsMargins(0, 0, 0, 0);
    grid->setHorizontalSpacing(space::field / 2);
    grid->setVerticalSpacing(space::field);
    grid->addWidget(make_heading(u"Entries"_s), 0, 0, 1, 2);
    grid->addWidget(m_list, 1, 0, 1, 2);
    grid->setRowStretch(1, 1);
    add_commands(*grid);
}

void FusionEntries::add_commands(QGridLayout& grid)
{
    struct Command
    {
        const char *name, *text, *icon, *tip;
        QKeySequence key;
        void (FusionEntries::*run)();
    };
    const std::array commands{
        Command{"move_up", "Move &up", "go-up", "Alt+Up", Qt::ALT | Qt::Key_Up, &FusionEntries::move_up},
        Command{"step_mode",
                "&Change",
                "view-refresh",
                "The next of the four ways to join (Space)",
                {},
                &FusionEntries::step_mode},
        Command{"move_down", "Move &down", "go-down", "Alt+Down", Qt::ALT | Qt::Key_Down, &FusionEntries::move_down},
        Command{"remove_entry", "&Remove", "edit-delete", "Delete", Qt::Key_Delete, &FusionEntries::remove},
    };
    const int first_row = grid.rowCount();
    for (int place = 0; const Command& command : commands) {
        auto* button = new QPushButton(icon(QString::fromLatin1(command.icon)), QString::fromLatin1(command.text));
        button->setObjectName(QString::fromLatin1(command.name));
        button->setToolTip(QString::fromLatin1(command.tip));
        connect(button, &QPushButton::clicked, this, command.run);
        grid.addWidget(button, first_row + place / 2, place % 2);
        ++place;
        if (command.key.isEmpty())
            continue;
        auto* key = new QShortcut(command.key, m_list);
        key->setContext(Qt::WidgetShortcut);
        connect(key, &QShortcut::activated, this, command.run);
    }
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
