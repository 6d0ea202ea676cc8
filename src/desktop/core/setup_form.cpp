#include "desktop/core/setup_form.h"

#include "desktop/shell/look.h"
#include "desktop/shell/page.h"

#include <QBoxLayout>
#include <QLabel>
#include <QScrollArea>
#include <QSpinBox>

namespace kindrel::desktop {

namespace {

QLabel* make_caption(const QString& caption, QWidget* field)
{
    auto* label = new QLabel(caption);
    label->setBuddy(field);
    field->setAccessibleName(QString(caption).remove(u'&'));
    return label;
}

} // namespace

void add_below_caption(QBoxLayout& column, const QString& caption, QWidget* field)
{
    column.addWidget(make_caption(caption, field));
    column.addWidget(field);
}

void add_beside_caption(QBoxLayout& column, const QString& caption, QWidget* field)
{
    auto* row = new QHBoxLayout;
    row->setSpacing(space::field);
    row->addWidget(make_caption(caption, field));
    row->addStretch(1);
    row->addWidget(field);
    column.addLayout(row);
}

QLabel* make_explanation(const QString& text)
{
    auto* words = new QLabel(text);
    words->setTextFormat(Qt::PlainText);
    words->setWordWrap(true);
    dress(*words, TextSize::secondary);
    return words;
}

QScrollArea* make_scrolling(QBoxLayout* content)
{
    auto* widget = new QWidget;
    widget->setLayout(content);
    content->setContentsMargins(space::group, 0, space::group, space::margin);
    auto* scroll = new QScrollArea;
    scroll->setFrameShape(QFrame::NoFrame);
    scroll->setFocusPolicy(Qt::NoFocus);
    scroll->setWidgetResizable(true);
    scroll->setWidget(widget);
    return scroll;
}

void lead_to(Page& page, const QString& field)
{
    auto* found = page.findChild<QWidget*>(field);
    if (!found)
        return;
    found->setFocus(Qt::OtherFocusReason);
    if (auto* number = qobject_cast<QSpinBox*>(found))
        number->selectAll();
}

} // namespace kindrel::desktop
