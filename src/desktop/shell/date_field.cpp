#include "desktop/shell/date_field.h"

#include "desktop/shell/typed_date.h"

#include <QKeyEvent>
#include <QScopedValueRollback>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

const QString shortcuts = u"t for today, +7 for a week from today"_s;

} // namespace

DateField::DateField(core::Office& office, QWidget* parent) : QLineEdit(parent), m_office(office)
{
    const bool month_first = office.day_order() == core::DayOrder::month_first;
    setPlaceholderText(month_first ? u"MM/DD/YYYY"_s : u"DD/MM/YYYY"_s);
    setToolTip(u"XXXX for a year that is not known, "_s + shortcuts);
    connect(this, &QLineEdit::editingFinished, this, &DateField::finish);
}

void DateField::require_year(Refusal refusal)
{
    m_year_refusal = refusal;
    setToolTip(shortcuts);
}

void DateField::show_date(std::optional<core::Date> date)
{
    m_date = date;
    const QString words = date ? date->shown(m_office.day_order()) : QString();
    if (!isModified() && text() != words)
        setText(words);
}

bool DateField::finish()
{
    if (!isModified() || m_telling)
        return !m_telling;
    const QString typed = text().trimmed();
    const auto date = typed_date(m_office, typed);
    const bool usable = date && (date->year_known() || !m_year_refusal);
    if (!typed.isEmpty() && !usable) {
        const auto order = m_office.day_order();
        refuse(m_year_refusal ? m_year_refusal(typed, order) : core::bad_date_message(order));
        return false;
    }
    setModified(false);
    const bool changed = date != m_date;
    show_date(date);
    if (changed)
        Q_EMIT entered(date);
    return true;
}

void DateField::refuse(const core::Message& why)
{
    const QScopedValueRollback telling(m_telling, true);
    m_office.dialogue.show(why);
    // After the click or key that led out of the field.
    QMetaObject::invokeMethod(
        this,
        [this] {
            setFocus();
            selectAll();
        },
        Qt::QueuedConnection);
}

void DateField::give_up()
{
    setModified(false);
    show_date(m_date);
    selectAll();
}

bool DateField::event(QEvent* event)
{
    if (!isModified() && asks_for_undo(*event)) {
        event->ignore();
        return false;
    }
    return QLineEdit::event(event);
}

void DateField::keyPressEvent(QKeyEvent* event)
{
    if (event->key() == Qt::Key_Escape && isModified())
        give_up();
    else
        QLineEdit::keyPressEvent(event);
}

bool asks_for_undo(const QEvent& event)
{
    return event.type() == QEvent::ShortcutOverride && static_cast<const QKeyEvent&>(event).matches(QKeySequence::Undo);
}

} // namespace kindrel::desktop
