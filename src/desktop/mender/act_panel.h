#pragma once

#include "desktop/mender/account.h"

#include <QScrollArea>

#include <map>

class QPushButton;

namespace kindrel::desktop {

/// The buttons of what can be done to a church, each with a word on what it does.
class ActPanel : public QWidget
{
    Q_OBJECT

public:
    ActPanel();
    /// Offers what the account leaves to be done.
    void offer(const Account& account);
    /// The cursor goes to what helps most. False where that is none of these.
    bool lead_to(MenderAct act);

Q_SIGNALS:
    void chosen(MenderAct act);

private:
    std::map<MenderAct, QPushButton*> m_buttons;
};

} // namespace kindrel::desktop
