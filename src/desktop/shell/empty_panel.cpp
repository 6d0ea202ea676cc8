#include "desktop/shell/empty_panel.h"

#include "desktop/shell/look.h"

#include <QLabel>
#include <QVBoxLayout>

namespace kindrel::desktop {

EmptyPanel::EmptyPanel(QWidget* parent) : QWidget(parent), m_what(new QLabel), m_next_step(new QLabel)
{
    dress(*m_what, TextSize::group);
    dress(*m_next_step, TextSize::secondary);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(space::group, space::group, space::group, space::group);
    column->addStretch(1);
    for (QLabel* label : {m_what, m_next_step}) {
        label->setAlignment(Qt::AlignCenter);
        label->setWordWrap(true);
        label->setTextFormat(Qt::PlainText);
        column->addWidget(label);
    }
    column->addStretch(2);
}

void EmptyPanel::say(const QString& what, const QString& next_step)
{
    m_what->setText(what);
    m_next_step->setText(next_step);
}

} // namespace kindrel::desktop
