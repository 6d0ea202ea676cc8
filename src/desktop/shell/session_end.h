#pragma once

#include <QObject>

namespace kindrel::desktop {

/// Whether windows are being closed because the desktop's session ends: nobody may be there to answer a question then.
class SessionEnd : public QObject
{
    Q_OBJECT

public:
    SessionEnd();

    [[nodiscard]] bool under_way() const;

protected:
    bool eventFilter(QObject* target, QEvent* event) override;

private:
    bool m_told_to_quit = false;
};

/// While it lives the program does not end, and no window closes but the boxes in front: work is under way that must
/// not be cut off.
class SessionHold : public QObject
{
    Q_OBJECT

public:
    SessionHold();

protected:
    bool eventFilter(QObject* target, QEvent* event) override;
};

} // namespace kindrel::desktop
