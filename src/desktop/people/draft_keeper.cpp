#include "desktop/people/draft_keeper.h"

#include "core/files.h"
#include "desktop/shell/note_bar.h"

#include <QTimer>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using namespace std::chrono_literals;

DraftKeeper::DraftKeeper(EditorBench& bench, NoteBar& note, QObject* parent)
    : QObject(parent), m_bench(bench), m_note(note), m_timer(new QTimer(this))
{
    m_timer->setSingleShot(true);
    m_timer->setInterval(2s);
    connect(m_timer, &QTimer::timeout, this, &DraftKeeper::keep);
    connect(&bench, &EditorBench::changed, this, [this] {
        if (m_bench.editor.altered())
            m_timer->start();
    });
}

void DraftKeeper::keep()
{
    try {
        m_bench.editor.keep_draft();
    } catch (const core::FileError& error) {
        m_note.say(u"What is typed is not safe from a power cut until it is saved. "_s + error.text());
    }
}

} // namespace kindrel::desktop
