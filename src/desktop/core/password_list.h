#pragma once

#include "core/security_setup.h"

#include <QTableWidget>

namespace kindrel::desktop {

class EmptyPanel;

/// The passwords by whom they belong to, each with the number of its access areas.
class PasswordList : public QTableWidget
{
    Q_OBJECT

public:
    PasswordList();

    /// The chosen place stays chosen as long as there is one.
    void show_users(const core::SecuritySetup& setup);
    /// The place of the chosen password; -1 when there is none.
    [[nodiscard]] int chosen() const;
    void choose(int place);

Q_SIGNALS:
    void removal_wanted();

protected:
    void keyPressEvent(QKeyEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    void show_user(int place, const QString& title, int area_count);
    void colour();

    EmptyPanel* m_nothing;
};

} // namespace kindrel::desktop
