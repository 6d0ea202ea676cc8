#pragma once

#include "desktop/people/editor_fields.h"

class QCompleter;
class QStringListModel;

namespace kindrel::desktop {

/// A line that offers what fits of a list while one types; Down shows the whole list.
class ChoiceLine : public TypedLine
{
    Q_OBJECT

public:
    explicit ChoiceLine(QWidget* parent = nullptr);

    void set_choices(const QStringList& choices);
    void open_list();

Q_SIGNALS:
    /// An entry of the list was taken.
    void taken(const QString& text);
    /// The list was asked for and is empty.
    void nothing_to_choose();

protected:
    void keyPressEvent(QKeyEvent* event) override;

private:
    QStringListModel* m_choices;
    QCompleter* m_completer;
};

} // namespace kindrel::desktop
