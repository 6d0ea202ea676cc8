#include "desktop/registers/name_field.h"

#include <QKeyEvent>
#include <QScopedValueRollback>

namespace kindrel::desktop {

NameField::NameField(Take take, QWidget* parent) : QLineEdit(parent), m_take(std::move(take))
{
    connect(this, &QLineEdit::editingFinished, this, &NameField::finish);
}

void NameField::show_name(const QString& name)
{
    m_name = name;
    if (!isModified() && text() != name)
        setText(name);
}

bool NameField::finish()
{
    if (!typing() || m_asking)
        return !m_asking;
    {
        const QScopedValueRollback asking(m_asking, true);
        if (m_take(text())) {
            drop();
            return true;
        }
    }
    // After the click or key that led out of the field.
    QMetaObject::invokeMethod(
        this,
        [this] {
            if (!typing())
                return;
            setFocus();
            selectAll();
        },
        Qt::QueuedConnection);
    return false;
}

void NameField::drop()
{
    setModified(false);
    setText(m_name);
}

void NameField::keyPressEvent(QKeyEvent* event)
{
    const bool enter = event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter;
    if (event->key() == Qt::Key_Escape && typing()) {
        drop();
        selectAll();
        return;
    }
    QLineEdit::keyPressEvent(event);
    if (enter && !typing() && hasFocus())
        focusNextChild();
}

} // namespace kindrel::desktop
