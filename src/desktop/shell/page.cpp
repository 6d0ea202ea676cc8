#include "desktop/shell/page.h"

#include "core/session.h"
#include "desktop/shell/chip.h"
#include "desktop/shell/elided_label.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/note_bar.h"

#include <QAction>
#include <QHBoxLayout>
#include <QLabel>
#include <QToolButton>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int header_height = 32;

}

Page::Page(const QString& title, QWidget* parent)
    : QWidget(parent), m_title(new ElidedLabel(title)), m_chip(new Chip), m_note(new NoteBar),
      m_header(new QHBoxLayout), m_column(new QVBoxLayout(this))
{
    dress(*m_title, TextSize::title);
    m_header->setContentsMargins(space::group, space::field, space::margin, space::field);
    m_header->setSpacing(space::margin);
    m_header->addWidget(m_title);
    m_header->addStrut(header_height);
    m_header->addWidget(m_chip);
    m_header->addStretch(1);
    m_column->setContentsMargins(0, 0, 0, 0);
    m_column->setSpacing(0);
    m_column->addLayout(m_header);
    m_column->addWidget(m_note);
}

QString Page::title() const
{
    return m_title->text();
}

void Page::set_title(const QString& title)
{
    m_title->setText(title);
}

void Page::set_status(const QString& status)
{
    m_status = status;
    Q_EMIT status_changed();
}

QAction* Page::add_action(const QString& text, const QString& icon_name, const QString& tip)
{
    auto* action = new QAction(icon(icon_name), text, this);
    action->setToolTip(tip);
    action->setStatusTip(tip);
    addAction(action);
    auto* button = new QToolButton;
    button->setDefaultAction(action);
    button->setToolButtonStyle(Qt::ToolButtonTextBesideIcon);
    button->setAutoRaise(true);
    m_header->addWidget(button);
    return action;
}

void Page::set_content(QWidget* content)
{
    m_column->addWidget(content, 1);
}

bool Page::save_or_drop(core::Dialogue& dialogue, const QString& question, const std::function<void()>& drop)
{
    if (!altered())
        return true;
    const auto wanted = dialogue.confirm_or_cancel({.text = question, .icon = core::Icon::question});
    if (!wanted)
        return false;
    if (*wanted)
        return save();
    try {
        drop(); // The page may stay, for another one may not let go.
    } catch (const core::DatabaseError& error) {
        // What was given up must not keep anybody here.
        dialogue.show({u"What is stored could not be read again."_s, error.text()});
    }
    return true;
}

} // namespace kindrel::desktop
