#include "desktop/shell/help.h"

#include "core/office.h"
#include "desktop/shell/look.h"

#include <QFile>
#include <QShortcut>
#include <QTextBrowser>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr QSize help_size{560, 600};

QString help_text(const QString& name)
{
    QFile file(u":/help/%1.md"_s.arg(name));
    return file.open(QIODevice::ReadOnly) ? QString::fromUtf8(file.readAll()) : QString();
}

QTextBrowser* help_window(Windows& windows)
{
    for (auto* window : windows.all<QTextBrowser>())
        return window;
    auto* window = new QTextBrowser;
    window->setObjectName(u"help"_s);
    window->setWindowTitle(core::product.toString() + u" Help"_s);
    window->document()->setDocumentMargin(space::group);
    QObject::connect(new QShortcut(Qt::Key_Escape, window), &QShortcut::activated, window, &QWidget::close);
    windows.open(window, help_size);
    return window;
}

}

void open_help(Windows& windows, const QString& name)
{
    QTextBrowser* window = help_window(windows);
    window->setMarkdown(help_text(name));
    bring_forward(*window);
}

}
