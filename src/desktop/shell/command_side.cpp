#include "desktop/shell/command_side.h"

#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"

#include <QPushButton>
#include <QShortcut>
#include <QVBoxLayout>

namespace kindrel::desktop {

CommandSide::CommandSide(QWidget* parent) : QWidget(parent), m_column(new QVBoxLayout(this))
{
    m_column->setContentsMargins(0, 0, 0, 0);
    m_column->setSpacing(space::field / 2);
    m_column->addStretch(1);
}

void CommandSide::add(const Command& command, QWidget& reach, Qt::ShortcutContext context,
                      const std::function<void()>& run)
{
    auto* button = new QPushButton(icon(QString::fromLatin1(command.icon)), QString::fromLatin1(command.text));
    button->setObjectName(QString::fromLatin1(command.name));
    connect(button, &QPushButton::clicked, this, run);
    add_control(button);
    if (command.key.isEmpty())
        return;
    button->setToolTip(command.key.toString(QKeySequence::NativeText));
    auto* key = new QShortcut(command.key, &reach);
    key->setContext(context);
    connect(key, &QShortcut::activated, this, run);
}

void CommandSide::start_group()
{
    m_column->insertSpacing(m_column->count() - 1, space::margin);
}

void CommandSide::add_control(QWidget* control)
{
    m_column->insertWidget(m_column->count() - 1, control);
}

} // namespace kindrel::desktop
