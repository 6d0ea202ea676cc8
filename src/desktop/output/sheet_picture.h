#pragma once

#include "desktop/output/report_drawing.h"
#include "output/labels/label_setup.h"

namespace kindrel::desktop {

/// The first sheet of labels as it will be printed, with the edges of the labels, which are there at once. A click or
/// the arrow keys choose the label that printing starts at.
class SheetPicture : public ReportDrawing
{
    Q_OBJECT

public:
    explicit SheetPicture(Desk& desk, QWidget* parent = nullptr);

    /// `report` prints on the sheet; where it has nothing to print the sheet is empty.
    void show_sheet(const output::LabelGrid& grid, const output::ReportChoice& report, const people::WorkingList& list);
    /// Why there is no sheet that could be shown.
    void show_fault(const QString& fault);
    [[nodiscard]] const QString& fault() const { return m_fault; }
    /// The label's middle, counted from 1.
    [[nodiscard]] QPointF middle_of(int label) const { return on_screen(m_grid.label(label - 1)).center(); }

    [[nodiscard]] QSize sizeHint() const override;
    [[nodiscard]] QSize minimumSizeHint() const override;

Q_SIGNALS:
    /// Counted from 1.
    void start_chosen(int label);

protected:
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    [[nodiscard]] QRectF sheet() const;
    [[nodiscard]] QRectF on_screen(const QRectF& of_sheet) const;
    void paint_labels(QPainter& painter) const;

    output::LabelGrid m_grid;
    QString m_fault;
};

} // namespace kindrel::desktop
