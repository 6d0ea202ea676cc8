#pragma once

#include <QWidget>

#include <vector>

class QPushButton;

namespace kindrel::desktop {

/// The steps of the tagging screen beside each other, one of them open. A tick marks those that say something.
class StepBar : public QWidget
{
    Q_OBJECT

public:
    enum Step { filter, sort, hidden, range, title, format, suppress, process, step_count };

    explicit StepBar(QWidget* parent = nullptr);

    void open(Step step);
    [[nodiscard]] Step open_step() const { return m_open; }
    void mark(Step step, bool set);

Q_SIGNALS:
    /// Nothing is opened by this alone.
    void wanted(StepBar::Step step);

private:
    std::vector<QPushButton*> m_buttons;
    Step m_open = filter;
};

} // namespace kindrel::desktop
