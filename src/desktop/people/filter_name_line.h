#pragma once

#include "desktop/shell/icons.h"

#include <QAction>
#include <QKeyEvent>
#include <QLineEdit>

#include <functional>

namespace kindrel::desktop {

/// Asks for the name of a filter in the place of another widget, and is hidden while none is asked for.
class FilterNameLine : public QLineEdit
{
public:
    /// Takes the name, or asks again.
    using Use = std::function<void(const QString& name)>;

    explicit FilterNameLine(QWidget& in_place_of) : m_in_place_of(in_place_of)
    {
        setObjectName(QStringLiteral("filter_name"));
        setToolTip(QStringLiteral("Enter takes the name, Escape leaves everything as it is"));
        hide();
        connect(this, &QLineEdit::returnPressed, this, &FilterNameLine::take);
        auto* button = addAction(icon(QStringLiteral("dialog-ok-apply")), QLineEdit::TrailingPosition);
        button->setToolTip(QStringLiteral("Take the name (Enter)"));
        connect(button, &QAction::triggered, this, &FilterNameLine::take);
    }

    [[nodiscard]] bool asks() const { return !isHidden(); }
    /// `suggested` stands there to be changed.
    void ask(const QString& question, const QString& suggested, Use use)
    {
        m_use = std::move(use);
        setPlaceholderText(question);
        setAccessibleName(question);
        setText(suggested);
        m_in_place_of.hide();
        show();
        ask_again();
    }
    void ask_again()
    {
        setFocus(Qt::OtherFocusReason);
        selectAll();
    }
    void take() { m_use(text()); }
    /// What was typed is dropped.
    void end()
    {
        const bool had_cursor = hasFocus();
        hide();
        m_in_place_of.show();
        if (had_cursor)
            m_in_place_of.setFocus(Qt::OtherFocusReason);
    }

protected:
    void keyPressEvent(QKeyEvent* event) override
    {
        if (event->key() == Qt::Key_Escape)
            end();
        else
            QLineEdit::keyPressEvent(event);
    }

private:
    QWidget& m_in_place_of;
    Use m_use;
};

} // namespace kindrel::desktop
