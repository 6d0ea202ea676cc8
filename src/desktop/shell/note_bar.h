#pragma once

#include <QFrame>

class QLabel;
class QPushButton;

namespace kindrel::desktop {

/// The quiet line under a page's header for what the program adds of its own. It stays until it is closed or replaced.
class NoteBar : public QFrame
{
    Q_OBJECT

public:
    explicit NoteBar(QWidget* parent = nullptr);

    void say(const QString& text);
    void clear();
    [[nodiscard]] QString text() const;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QLabel* m_text;
    QPushButton* m_close;
};

} // namespace kindrel::desktop
