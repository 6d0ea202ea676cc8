#pragma once

#include "core/dialogue.h"

#include <QApplication>

namespace kindrel::desktop {

/// Turns what went wrong in answer to a key or click into a box, so that one failed screen does not take the program
/// with it. A window whose closing failed stays open.
class Application : public QApplication
{
    Q_OBJECT

public:
    Application(int& argc, char** argv) : QApplication(argc, argv) {}
    void set_dialogue(core::Dialogue& dialogue) { m_dialogue = &dialogue; }
    bool notify(QObject* receiver, QEvent* event) override;

private:
    void tell(const QString& what, const QString& why);

    core::Dialogue* m_dialogue = nullptr;
};

} // namespace kindrel::desktop
