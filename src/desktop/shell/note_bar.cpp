#include "desktop/shell/note_bar.h"

#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QPainter>
#include <QPushButton>

#include <utility>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

NoteBar::NoteBar(QWidget* parent)
    : QFrame(parent), m_text(new QLabel), m_offer(new QPushButton), m_close(new QPushButton)
{
    setObjectName(u"note_bar"_s);
    m_text->setTextFormat(Qt::PlainText);
    m_text->setWordWrap(true);
    m_text->setTextInteractionFlags(Qt::TextSelectableByMouse);
    m_offer->setObjectName(u"offer"_s);
    connect(m_offer, &QPushButton::clicked, this, &NoteBar::take_offer);
    m_close->setFlat(true);
    m_close->setText(u"\u00d7"_s);
    m_close->setFixedWidth(space::control);
    m_close->setAccessibleName(u"Close this note"_s);
    connect(m_close, &QPushButton::clicked, this, &NoteBar::clear);

    auto* mark = new QLabel;
    mark->setPixmap(icon(u"dialog-information"_s).pixmap(16, 16));
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(space::group, 2, space::field / 2, 2);
    row->addWidget(mark);
    row->addWidget(m_text, 1);
    row->addWidget(m_offer);
    row->addWidget(m_close);
    hide();
}

void NoteBar::say(const QString& text)
{
    offer(text, {}, {});
}

void NoteBar::offer(const QString& text, const QString& button, std::function<void()> act)
{
    m_text->setText(text);
    setAccessibleName(text);
    m_act = std::move(act);
    m_offer->setText(button);
    m_offer->setVisible(!button.isEmpty());
    setVisible(!text.isEmpty());
}

void NoteBar::take_offer()
{
    const auto act = std::exchange(m_act, {});
    clear();
    if (act)
        act();
}

void NoteBar::clear()
{
    say({});
}

QString NoteBar::text() const
{
    return m_text->text();
}

void NoteBar::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.fillRect(rect(), palette().color(QPalette::Button));
    painter.fillRect(QRect(0, 0, 3, height()), palette().color(QPalette::Highlight));
}

} // namespace kindrel::desktop
