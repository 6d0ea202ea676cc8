#pragma once

#include "desktop/mender/account.h"

#include <QTextBrowser>

namespace kindrel::desktop {

/// An account to be read, selected and copied, in the colours and sizes of the program.
class AccountView : public QTextBrowser
{
    Q_OBJECT

public:
    AccountView();
    void show_account(const Account& account);

protected:
    void changeEvent(QEvent* event) override;

private:
    void draw();

    Account m_account;
};

} // namespace kindrel::desktop
