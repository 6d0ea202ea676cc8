#pragma once

#include "core/office.h"
#include "pages/page.h"
#include "pages/painter.h"
#include "pages/picture.h"

#include <QDateTime>
#include <QWidget>

#include <tuple>

namespace kindrel::desktop {

/// A picture that is shown again and again, but read anew only when its file is another one or was written to.
class PictureFile
{
public:
    explicit PictureFile(QSizeF within) : m_within(within) {}
    /// By the whole path; no file gives an empty picture.
    [[nodiscard]] const pages::Picture& read(const QString& file);

private:
    QSizeF m_within; ///< Points.
    std::tuple<QString, qint64, QDateTime> m_state;
    pages::Picture m_picture;
};

/// Head and foot of a report's page as settings that need not be saved yet would print them: two strips of paper.
class HeadPicture : public QWidget
{
    Q_OBJECT

public:
    /// The office gives what the settings do not say: the church's name and today's date.
    explicit HeadPicture(core::Office& office, QWidget* parent = nullptr);

    /// `logo` is a picture's whole path, or empty.
    void show_settings(const core::Settings& settings, const QString& logo);
    [[nodiscard]] const pages::Page& page() const { return m_page; }

    [[nodiscard]] QSize sizeHint() const override;
    [[nodiscard]] QSize minimumSizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    [[nodiscard]] QRectF strip(qreal top, qreal bottom) const;
    void paint_strip(QPainter& painter, const QRectF& of_page, QPointF at, qreal scale);

    core::Office& m_office;
    pages::PagePainter m_painter;
    pages::Page m_page;
    PictureFile m_logo;
    QRectF m_head, m_foot; ///< Parts of the page.
};

} // namespace kindrel::desktop
