#pragma once

#include <QObject>

#include <chrono>
#include <functional>

class QWidget;

namespace kindrel::desktop {

/// Since some fixed moment.
using Stopwatch = std::function<std::chrono::milliseconds()>;
[[nodiscard]] std::chrono::milliseconds since_start();

/// Keeps a box from being answered in its first moments, and by held keys at any time: neither key repeat nor a
/// scanner that is typing can reach it.
class InputGuard : public QObject
{
    Q_OBJECT

public:
    static constexpr std::chrono::milliseconds deaf_time{250};

    /// Lives with the box.
    InputGuard(QWidget& box, Stopwatch now);
    ~InputGuard() override;

protected:
    bool eventFilter(QObject* target, QEvent* event) override;

private:
    [[nodiscard]] bool is_answer(QEvent& event) const;

    QWidget& m_box;
    Stopwatch m_now;
    std::chrono::milliseconds m_shown_at;
};

} // namespace kindrel::desktop
