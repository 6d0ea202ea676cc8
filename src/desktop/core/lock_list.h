#pragma once

#include "core/locks.h"

#include <QTableWidget>

namespace kindrel::desktop {

class EmptyPanel;

/// What is locked, where and since when.
class LockList : public QTableWidget
{
    Q_OBJECT

public:
    LockList();

    /// Afterwards nothing is chosen.
    void show_locks(const std::vector<core::HeldLock>& locks, core::DayOrder order);
    [[nodiscard]] std::optional<int> chosen() const;

protected:
    /// Whoever comes by keyboard finds the first row chosen.
    void focusInEvent(QFocusEvent* event) override;

private:
    EmptyPanel* m_nothing;
};

} // namespace kindrel::desktop
