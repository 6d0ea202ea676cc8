#pragma once

#include "desktop/backup/comparison.h"

#include <QTableWidget>

namespace kindrel::desktop {

class EmptyPanel;

/// What a backup holds beside what it would replace; what would be lost is marked.
class ComparisonTable : public QTableWidget
{
    Q_OBJECT

public:
    ComparisonTable();

    void show_lines(std::vector<ComparedLine> lines);
    /// Instead of lines: why there are none.
    void say(const QString& what, const QString& next_step);

protected:
    void changeEvent(QEvent* event) override;

private:
    void mark_losses();

    std::vector<ComparedLine> m_lines;
    EmptyPanel* m_nothing;
};

} // namespace kindrel::desktop
