#pragma once

#include "desktop/shell/desk.h"

#include <QDialog>

#include <optional>

class QListWidget;

namespace kindrel::desktop {

struct ChurchChoice
{
    bool cancelled = true;
    std::optional<int> church; ///< Nothing when OK was pressed without a choice.
};

/// Chooses among the churches that a family can be moved to. None stands chosen at first.
class ChurchDialog : public QDialog
{
    Q_OBJECT

public:
    explicit ChurchDialog(const core::Office& office, QWidget* parent = nullptr);

    [[nodiscard]] ChurchChoice choice() const;

protected:
    bool eventFilter(QObject* target, QEvent* event) override;

private:
    QListWidget* m_churches;
};

[[nodiscard]] ChurchChoice choose_other_church(Desk& desk);

} // namespace kindrel::desktop
