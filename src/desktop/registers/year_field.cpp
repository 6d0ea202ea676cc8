#include "desktop/registers/year_field.h"

#include <QKeyEvent>
#include <QLineEdit>
#include <QWheelEvent>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int last_year = 9999; ///< That "YYYY" can hold.

/// On to later years upwards, as in a counter; 0 for a key that does something else.
int years_of(const QKeyEvent& event)
{
    if (event.modifiers() & (Qt::AltModifier | Qt::ControlModifier))
        return 0;
    switch (event.key()) {
    case Qt::Key_Up:
    case Qt::Key_PageUp:
        return 1;
    case Qt::Key_Down:
    case Qt::Key_PageDown:
        return -1;
    default:
        return 0;
    }
}

} // namespace

YearField::YearField(const QStringList& offered, QWidget* parent) : QComboBox(parent)
{
    setEditable(true);
    setInsertPolicy(NoInsert);
    setCompleter(nullptr);
    setFocusPolicy(Qt::StrongFocus); // The wheel alone does not bring the cursor here.
    addItems(offered);
    lineEdit()->setPlaceholderText(u"YYYY"_s);
}

void YearField::turn(int years)
{
    bool number = false;
    const int shown = currentText().toInt(&number);
    if (!number)
        return;
    const auto text = QString::number(std::clamp(shown + years, 1, last_year));
    setCurrentIndex(findText(text));
    setEditText(text);
    lineEdit()->selectAll();
}

void YearField::keyPressEvent(QKeyEvent* event)
{
    if (const int years = years_of(*event))
        turn(years);
    else
        QComboBox::keyPressEvent(event);
}

void YearField::wheelEvent(QWheelEvent* event)
{
    if (hasFocus() && event->angleDelta().y() != 0)
        turn(event->angleDelta().y() > 0 ? 1 : -1);
    else
        event->ignore();
}

} // namespace kindrel::desktop
