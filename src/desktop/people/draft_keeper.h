#pragma once

#include "desktop/people/editor_tab.h"

class QTimer;

namespace kindrel::desktop {

class NoteBar;

/// Keeps unsaved work where a power cut does not reach it, a moment after the last change.
class DraftKeeper : public QObject
{
    Q_OBJECT

public:
    DraftKeeper(EditorBench& bench, NoteBar& note, QObject* parent);
    void keep();

private:
    EditorBench& m_bench;
    NoteBar& m_note;
    QTimer* m_timer;
};

} // namespace kindrel::desktop
