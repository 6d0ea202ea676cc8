#pragma once

#include "desktop/output/page_view.h"

#include <QToolBar>

class QComboBox;
class QLineEdit;
class QSpinBox;

namespace kindrel::desktop {

/// The preview's tools: turning pages, zoom, find, print and PDF.
class PreviewBar : public QToolBar
{
    Q_OBJECT

public:
    explicit PreviewBar(QWidget* parent = nullptr);

    void show_page(int number, int count, bool finished);
    void show_zoom(const PageView& view);
    void focus_find();
    void focus_page();
    /// Whether the whole document is there to be printed and saved.
    void set_complete(bool complete);

Q_SIGNALS:
    void page_wanted(int number);
    void turn_wanted(int pages);
    void zoom_wanted(kindrel::desktop::Zoom zoom);
    void zoom_step_wanted(int steps);
    void find_wanted(const QString& text, bool backwards);
    void print_wanted();
    void pdf_wanted();

protected:
    bool eventFilter(QObject* target, QEvent* event) override;

private:
    void add_page_tools();
    void add_zoom_tools();
    void add_find();
    void add_output_tools();
    QAction* add_tool(const QString& icon_name, const QString& text, const QString& tip);

    QSpinBox* m_page;
    QComboBox* m_zoom;
    QLineEdit* m_find;
    QAction* m_print = nullptr;
    QAction* m_pdf = nullptr;
};

} // namespace kindrel::desktop
