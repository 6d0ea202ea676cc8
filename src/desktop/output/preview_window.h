#pragma once

#include "desktop/shell/desk.h"
#include "pages/spool.h"

#include <QWidget>

#include <functional>

namespace kindrel::desktop {

class NoteBar;
class PageView;
class PreviewBar;
class RunStrip;
class Thumbnails;

/// Writes a document into the spool. False when it was refused or cancelled.
using Producer = std::function<bool(core::Progress&, pages::PageSpool&)>;

/// A document as it will lie on paper. It can be read from its first page on while the others are still being made.
class PreviewWindow : public QWidget
{
    Q_OBJECT

public:
    /// `printed` is said when the document has been printed.
    PreviewWindow(Desk& desk, const QString& title, const QString& printed);

    /// Fills the window; one without a document closes itself.
    void run(const Producer& produce);
    [[nodiscard]] const pages::PageSpool& document() const { return m_spool; }
    [[nodiscard]] PageView& view() { return *m_view; }
    [[nodiscard]] NoteBar& note() { return *m_note; }

protected:
    void closeEvent(QCloseEvent* event) override;

private:
    void lay_out();
    void connect_tools();
    void add_keys();
    void page_came(int number);
    [[nodiscard]] bool produced(const Producer& produce);
    void show_state();
    void find(const QString& text, bool backwards);
    void print();
    void save_pdf();

    Desk& m_desk;
    pages::PageSpool m_spool;
    PreviewBar* m_bar;
    NoteBar* m_note;
    Thumbnails* m_thumbnails;
    PageView* m_view;
    RunStrip* m_strip;
    QString m_printed, m_sought;
    bool m_running = false;
};

/// Opens a preview and fills it once the caller has returned. `printed` is said when the document has been printed;
/// where it is empty, that it went to the printer.
void open_preview(Desk& desk, const QString& title, const Producer& produce, const QString& printed = {});

} // namespace kindrel::desktop
