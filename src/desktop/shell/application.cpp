#include "desktop/shell/application.h"

#include "core/files.h"
#include "core/session.h"

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

bool Application::notify(QObject* receiver, QEvent* event)
{
    try {
        return QApplication::notify(receiver, event);
    } catch (const core::DatabaseError& error) {
        tell(u"The database could not be read or written."_s, error.text());
    } catch (const core::FileError& error) {
        tell(u"A file could not be read or written."_s, error.text());
    }
    if (event->type() == QEvent::Close)
        event->ignore(); // What could not be settled is still in the window.
    return true;
}

void Application::tell(const QString& what, const QString& why)
{
    if (!m_dialogue)
        throw;
    m_dialogue->show({what, why});
}

} // namespace kindrel::desktop
