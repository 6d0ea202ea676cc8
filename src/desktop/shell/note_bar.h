#pragma once

#include <QFrame>

#include <functional>

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
    /// With a button that does what the note offers, after which the note is gone.
    void offer(const QString& text, const QString& button, std::function<void()> act);
    void clear();
    [[nodiscard]] QString text() const;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    void take_offer();

    QLabel* m_text;
    QPushButton* m_offer;
    QPushButton* m_close;
    std::function<void()> m_act;
};

} // namespace kindrel::desktop
