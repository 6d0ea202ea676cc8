#pragma once

#include "desktop/shell/desk.h"
#include "output/report_choices.h"
#include "pages/painter.h"

#include <QWidget>

class QTimer;

namespace kindrel::desktop {

/// The first page of a report as it will come out, drawn small: what its layout looks like. A moment after the last
/// call, so that running through the tree does not wait for pictures.
class ReportDrawing : public QWidget
{
    Q_OBJECT

public:
    explicit ReportDrawing(Desk& desk, QWidget* parent = nullptr);

    /// Null draws nothing. A drawing that is out of sight waits until it is seen.
    void show_report(const output::ReportChoice* report, const people::WorkingList& list,
                     const output::RunOptions& options);
    /// Draws at once what waits. A report that cannot be drawn leaves no picture: its run will say why.
    void draw_now();
    [[nodiscard]] bool empty() const { return !m_page; }
    /// As it was drawn last.
    [[nodiscard]] const std::optional<pages::Page>& page() const { return m_page; }

protected:
    void paintEvent(QPaintEvent* event) override;
    void showEvent(QShowEvent* event) override;
    /// Nothing while there is no page. `paper` has the page's shape.
    void paint_page(QPainter& painter, const QRectF& paper);

private:
    Desk& m_desk;
    QTimer* m_pause;
    std::optional<output::ReportChoice> m_report;
    people::WorkingList m_list;
    output::RunOptions m_options;
    std::optional<pages::Page> m_page;
    pages::PagePainter m_painter;
};

} // namespace kindrel::desktop
