#pragma once

#include "desktop/shell/palette.h"

#include <QLabel>

namespace kindrel::desktop {

/// A state in a word, framed in the state's colour.
class Chip : public QLabel
{
    Q_OBJECT

public:
    explicit Chip(QWidget* parent = nullptr);
    /// An empty word hides the chip.
    void set(const QString& word, State state);

protected:
    void paintEvent(QPaintEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    void colour();

    State m_state = State::plain;
};

} // namespace kindrel::desktop
