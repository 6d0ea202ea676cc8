#pragma once

#include "desktop/shell/date_field.h"

#include <QKeyEvent>
#include <QRegularExpression>

namespace kindrel::desktop {

/// An end of a span of dates. Where the span is of any year, day and month alone will do.
class FilterEndField : public DateField
{
public:
    using DateField::DateField;

    void allow_any_year(bool allowed)
    {
        m_any_year = allowed;
        setPlaceholderText(allowed ? m_pattern.left(m_pattern.lastIndexOf(u'/')) : m_pattern);
    }
    /// As finish(), which a key or the way out of the field bring about too.
    bool finish_end()
    {
        add_unknown_year();
        return finish();
    }

protected:
    void keyPressEvent(QKeyEvent* event) override
    {
        if (event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter)
            add_unknown_year();
        DateField::keyPressEvent(event);
    }
    void focusOutEvent(QFocusEvent* event) override
    {
        add_unknown_year();
        DateField::focusOutEvent(event);
    }

private:
    void add_unknown_year()
    {
        static const QRegularExpression day_and_month(QStringLiteral("^\\d{1,2}/\\d{1,2}$"));
        const QString typed = text().trimmed();
        if (!m_any_year || !isModified() || !day_and_month.match(typed).hasMatch())
            return;
        setText(typed + QStringLiteral("/XXXX"));
        setModified(true);
    }

    const QString m_pattern = placeholderText();
    bool m_any_year = false;
};

} // namespace kindrel::desktop
