#pragma once

#include <QLabel>

namespace kindrel::desktop {

/// One line of text that ends in dots where it has no room; the whole of it stands in the tool tip.
class ElidedLabel : public QLabel
{
    Q_OBJECT

public:
    explicit ElidedLabel(const QString& text = {}, QWidget* parent = nullptr);
    [[nodiscard]] QSize minimumSizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;
};

} // namespace kindrel::desktop
