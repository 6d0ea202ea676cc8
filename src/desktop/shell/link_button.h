#pragma once

#include <QAbstractButton>

namespace kindrel::desktop {

/// A line that does something: an icon before it, a figure at its right end, a sentence beneath it, as far as they are
/// given. A checked one stands out.
class LinkButton : public QAbstractButton
{
    Q_OBJECT

public:
    explicit LinkButton(const QString& text, QWidget* parent = nullptr);

    void set_figure(const QString& figure);
    [[nodiscard]] QString figure() const { return m_figure; }
    void set_description(const QString& description);

    [[nodiscard]] QSize sizeHint() const override;
    [[nodiscard]] bool hasHeightForWidth() const override { return true; }
    [[nodiscard]] int heightForWidth(int width) const override;

protected:
    void paintEvent(QPaintEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    /// Where title and description may stand in a button of this width.
    [[nodiscard]] QRect text_place(int width) const;
    void paint_ground(QPainter& painter) const;
    void paint_texts(QPainter& painter) const;

    QString m_figure;
    QString m_description;
};

} // namespace kindrel::desktop
