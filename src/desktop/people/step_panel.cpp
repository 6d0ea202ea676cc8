#include "desktop/people/step_panel.h"

#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QGridLayout>
#include <QLabel>

namespace kindrel::desktop {

QVBoxLayout* make_step_column(QWidget& panel, const QString& heading)
{
    auto* column = new QVBoxLayout(&panel);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field);
    column->addWidget(make_heading(heading));
    return column;
}

void add_step_words(QVBoxLayout& column, const QString& words)
{
    auto* label = new QLabel(words);
    label->setWordWrap(true);
    dress(*label, TextSize::secondary);
    column.addWidget(label);
}

void add_step_row(QGridLayout& rows, const QString& caption, QWidget* field)
{
    const int row = rows.rowCount();
    auto* label = new QLabel(caption);
    label->setBuddy(field);
    rows.addWidget(label, row, 0);
    rows.addWidget(field, row, 1);
}

} // namespace kindrel::desktop
