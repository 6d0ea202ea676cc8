#pragma once

#include <QKeySequence>
#include <QWidget>

#include <functional>

class QVBoxLayout;

namespace kindrel::desktop {

/// Buttons beneath each other at the side of what they work on.
class CommandSide : public QWidget
{
    Q_OBJECT

public:
    struct Command
    {
        const char* name; ///< The button's object name.
        const char* text;
        const char* icon;
        QKeySequence key = {};
    };

    explicit CommandSide(QWidget* parent = nullptr);

    /// The key works in `reach`: with the widgets in it, or in it alone.
    void add(const Command& command, QWidget& reach, Qt::ShortcutContext context, const std::function<void()>& run);
    void start_group();
    /// Any other control, below what is there.
    void add_control(QWidget* control);

private:
    QVBoxLayout* m_column;
};

} // namespace kindrel::desktop
