#pragma once

#include <QObject>

#include <chrono>

class QTimer;

namespace kindrel::desktop {

/// Notices when nobody has touched keyboard or mouse for a while, in any window of the program.
class IdleWatch : public QObject
{
    Q_OBJECT

public:
    static constexpr std::chrono::minutes patience{15};

    explicit IdleWatch(QObject* parent = nullptr);

Q_SIGNALS:
    void idle();
    /// Somebody is there again; follows idle() alone.
    void returned();

protected:
    bool eventFilter(QObject* target, QEvent* event) override;

private:
    QTimer* m_timer;
};

} // namespace kindrel::desktop
