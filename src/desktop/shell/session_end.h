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

} // namespace kindrel::desktop
