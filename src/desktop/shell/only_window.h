#pragma once

#include <QObject>

class QWidget;

namespace kindrel::desktop {

/// While it lives, keys and clicks reach this window and the boxes above it alone: a run that yields to the event loop
/// cannot be disturbed from elsewhere.
class OnlyWindow : public QObject
{
    Q_OBJECT

public:
    explicit OnlyWindow(QWidget& window);
    ~OnlyWindow() override;

protected:
    bool eventFilter(QObject* target, QEvent* event) override;

private:
    QWidget& m_window;
};

} // namespace kindrel::desktop
