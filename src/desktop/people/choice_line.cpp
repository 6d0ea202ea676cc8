#include "desktop/people/choice_line.h"

#include "desktop/shell/icons.h"

#include <QAbstractItemView>
#include <QAction>
#include <QApplication>
#include <QCompleter>
#include <QKeyEvent>
#include <QStringListModel>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

ChoiceLine::ChoiceLine(QWidget* parent)
    : TypedLine(parent), m_choices(new QStringListModel(this)), m_completer(new QCompleter(m_choices, this))
{
    m_completer->setCaseSensitivity(Qt::CaseInsensitive);
    m_completer->setFilterMode(Qt::MatchContains);
    setCompleter(m_completer);
    connect(m_completer, qOverload<const QString&>(&QCompleter::activated), this, &ChoiceLine::taken);
    // While the list is open it keeps from the line that the cursor has gone, by a key of another field for example.
    connect(qApp, &QApplication::focusChanged, this, [this](const QWidget* before) {
        if (before != this || !m_completer->popup()->isVisible())
            return;
        m_completer->popup()->hide();
        Q_EMIT editingFinished();
    });
    auto* list = addAction(icon(u"go-down"_s), QLineEdit::TrailingPosition);
    list->setToolTip(u"Show the list (Down)"_s);
    connect(list, &QAction::triggered, this, &ChoiceLine::open_list);
}

void ChoiceLine::set_choices(const QStringList& choices)
{
    if (m_choices->stringList() != choices)
        m_choices->setStringList(choices);
}

void ChoiceLine::open_list()
{
    if (isReadOnly())
        return;
    setFocus();
    if (m_choices->rowCount() == 0) {
        Q_EMIT nothing_to_choose();
        return;
    }
    m_completer->setCompletionPrefix(QString());
    m_completer->complete();
}

void ChoiceLine::keyPressEvent(QKeyEvent* event)
{
    if (event->key() == Qt::Key_Down)
        open_list();
    else
        TypedLine::keyPressEvent(event);
}

} // namespace kindrel::desktop
