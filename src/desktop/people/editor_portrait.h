#pragma once

#include "desktop/people/editor_tab.h"

class QPushButton;

namespace kindrel::desktop {

class Portrait;

/// The chosen person's photograph with what adds and removes it. Both are done at once, not with the next save.
class EditorPortrait : public QWidget
{
    Q_OBJECT

public:
    explicit EditorPortrait(EditorBench& bench, QWidget* parent = nullptr);

    void show_file();

private:
    /// Null while nobody is chosen.
    [[nodiscard]] const people::Person* person() const;
    void add();
    void remove();
    /// False, after saying why, when the file could not be written.
    bool store(const std::optional<QByteArray>& jpeg);

    EditorBench& m_bench;
    Portrait* m_portrait;
    QPushButton* m_add;
    QPushButton* m_remove;
};

} // namespace kindrel::desktop
