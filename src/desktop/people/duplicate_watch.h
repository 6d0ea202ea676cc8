#pragma once

#include "desktop/people/editor_tab.h"
#include "people/likely_duplicates.h"

namespace kindrel::desktop {

class NoteBar;

/// Tells in the note bar when the family being typed may be in the church already.
class DuplicateWatch : public QObject
{
    Q_OBJECT

public:
    DuplicateWatch(EditorBench& bench, NoteBar& note, QObject* parent);

    /// Looks whenever a name, a phone or an e-mail among the page's fields has been typed.
    void follow(const QWidget& page);
    void look();
    /// Another family has come.
    void forget() { m_alike.clear(); }

private:
    EditorBench& m_bench;
    NoteBar& m_note;
    std::vector<people::Likeness> m_alike; ///< As told last.
};

} // namespace kindrel::desktop
