#pragma once

#include "pages/find.h"
#include "pages/painter.h"
#include "pages/spool.h"

#include <QAbstractScrollArea>

#include <optional>

namespace kindrel::desktop {

/// How large a page stands on the screen: fitted to the window, or in per cent of its size on paper.
struct Zoom
{
    enum class Fit { width, page, none };
    static constexpr int least = 50, most = 400;

    Fit fit = Fit::width;
    int percent = 100; ///< Counts where nothing is fitted.

    friend bool operator==(const Zoom&, const Zoom&) = default;
};

/// One page of a document on grey ground.
class PageView : public QAbstractScrollArea
{
    Q_OBJECT

public:
    explicit PageView(const pages::PageSpool& spool, QWidget* parent = nullptr);

    /// Numbers beyond the ends mean the first or last page.
    void show_page(int number);
    [[nodiscard]] int number() const { return m_page.number; }
    /// After the document has grown or its end is known.
    void refresh();

    void set_zoom(Zoom zoom);
    [[nodiscard]] Zoom zoom() const { return m_zoom; }
    /// To the next step of the scale; `steps` is negative for smaller.
    void zoom_by(int steps);
    /// What the page is drawn at now, fitted or not.
    [[nodiscard]] int shown_percent() const;

    /// Marks every place of the text on whichever page is shown; empty text marks nothing.
    void mark(const QString& text);

Q_SIGNALS:
    void page_changed(int number);
    void zoom_changed();

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;

private:
    /// Screen pixels for a point.
    [[nodiscard]] qreal scale() const;
    [[nodiscard]] qreal natural_scale() const;
    [[nodiscard]] QRectF page_place() const;
    [[nodiscard]] std::optional<int> page_for(int key) const;
    void lay_out();

    const pages::PageSpool& m_spool;
    pages::PagePainter m_painter;
    pages::Page m_page;
    Zoom m_zoom;
    QString m_marked;
    std::vector<pages::Found> m_marks;
};

} // namespace kindrel::desktop
