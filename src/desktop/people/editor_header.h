#pragma once

#include "desktop/people/editor_tab.h"

class QLabel;

namespace kindrel::desktop {

class Chip;

/// What the editor's page says of the family as a whole: its states in words, the days of the file, and why nothing
/// can be changed, where that is so.
class EditorHeader : public QWidget
{
    Q_OBJECT

public:
    explicit EditorHeader(EditorBench& bench);
    void show_file();

private:
    [[nodiscard]] QWidget* make_strip();

    EditorBench& m_bench;
    Chip* m_new;
    Chip* m_status;
    Chip* m_access;
    QLabel* m_dates;
    QLabel* m_reason;
    QWidget* m_strip;
};

} // namespace kindrel::desktop
