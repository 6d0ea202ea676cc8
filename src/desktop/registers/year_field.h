#pragma once

#include <QComboBox>

namespace kindrel::desktop {

/// A year to be typed or chosen. The arrow keys and, once the cursor is in the field, the wheel turn it on and back
/// from whatever year it shows.
class YearField : public QComboBox
{
    Q_OBJECT

public:
    explicit YearField(const QStringList& offered, QWidget* parent = nullptr);

protected:
    void keyPressEvent(QKeyEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;

private:
    /// What is no year stays as it is.
    void turn(int years);
};

} // namespace kindrel::desktop
