#pragma once

#include <QWidget>

class QLabel;

namespace kindrel::desktop {

/// Stands where a list would be when there is nothing to list, and says what to do next.
class EmptyPanel : public QWidget
{
    Q_OBJECT

public:
    explicit EmptyPanel(QWidget* parent = nullptr);
    void say(const QString& what, const QString& next_step);

private:
    QLabel* m_what;
    QLabel* m_next_step;
};

} // namespace kindrel::desktop
