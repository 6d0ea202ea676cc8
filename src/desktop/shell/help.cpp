#include "desktop/shell/help.h"

#include "core/office.h"
#include "desktop/shell/look.h"

#include <QFile>
#include <QShortcut>
#include <QTextBrowser>
#include <QTextTable>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr QSize help_size{560, 600};

QString help_text(const QString& name)
{
    QFile file(u":/help/%1.md"_s.arg(name));
    return file.open(QIODevice::ReadOnly) ? QString::fromUtf8(file.readAll()) : QString();
}

/// Rows of keys read better without a frame around every word.
void lighten_tables(QTextDocument& text)
{
    const auto frames = text.rootFrame()->childFrames();
    for (QTextFrame* frame : frames)
        if (auto* table = qobject_cast<QTextTable*>(frame)) {
            QTextTableFormat format = table->format();
            format.setBorder(0);
            format.setCellSpacing(0);
            format.setCellPadding(space::field / 2);
            format.setBottomMargin(space::field);
            table->setFormat(format);
        }
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

} // namespace

void open_help(Windows& windows, const QString& name)
{
    QTextBrowser* window = help_window(windows);
    window->setMarkdown(help_text(name));
    lighten_tables(*window->document());
    bring_forward(*window);
}

} // namespace kindrel::desktop
