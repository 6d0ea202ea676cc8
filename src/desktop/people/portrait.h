#pragma once

#include <QPixmap>
#include <QWidget>

namespace kindrel::desktop {

/// A person's photograph, or an empty frame.
class Portrait : public QWidget
{
    Q_OBJECT

public:
    explicit Portrait(QWidget* parent = nullptr);
    /// A file that is missing or unreadable leaves the frame empty.
    void show_file(const QString& file);
    [[nodiscard]] bool empty() const { return m_picture.isNull(); }

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QPixmap m_picture;
};

} // namespace kindrel::desktop
