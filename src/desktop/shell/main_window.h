#pragma once

#include "desktop/shell/area.h"
#include "desktop/shell/look.h"
#include "desktop/shell/session_end.h"

#include <QMainWindow>

#include <functional>
#include <span>

class QLabel;

namespace kindrel::desktop {

class Page;
class PageStack;
class Rail;

/// The rail of areas and the pages they open. A page is made when its area is first chosen and stays parked until it
/// is closed.
class MainWindow : public QMainWindow
{
    Q_OBJECT

public:
    /// The first area is home: it is open from the start and is never closed.
    MainWindow(Desk& desk, std::span<const AreaDefinition> areas, Look& look);

    void open_area(const QString& key);
    /// Null while the area is closed.
    [[nodiscard]] Page* page_of(const QString& key) const;
    [[nodiscard]] Page* page() const;
    /// Asks every page that is open, in front; false when one of them stays.
    [[nodiscard]] bool leave_all();
    /// Asks and closes the pages that the area of this key does not work beside; false when one of them stays.
    [[nodiscard]] bool make_way_for(const QString& key);
    /// What is asked when every page has left and a person closes the window; false: it stays open.
    void set_last_question(std::function<bool()> may_close) { m_may_close = std::move(may_close); }

Q_SIGNALS:
    void page_made(Page* page);
    void closed();

protected:
    void closeEvent(QCloseEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    void fit_rail();
    void add_areas();
    void add_foot();
    void add_status_bar();
    void add_keys();
    void open_place(std::size_t place);
    void close_place(std::size_t place);
    /// As many as there are areas when there is none of this key.
    [[nodiscard]] std::size_t place_of(const QString& key) const;
    /// False when the area does not let anybody in, or when a page that had to leave first stays.
    [[nodiscard]] bool make_page(std::size_t place);
    /// What the rail shows of the pages' states.
    void show_marks();
    void set_idle(bool idle)
    {
        m_idle = idle;
        show_marks();
    }
    void close_page();
    void show_status();
    void show_help();
    [[nodiscard]] bool granted(const AreaDefinition& area) const;

    Desk& m_desk;
    std::span<const AreaDefinition> m_areas;
    Look& m_look;
    Rail* m_rail;
    PageStack* m_stack;
    QLabel* m_mode;
    QLabel* m_count;
    SessionEnd m_session_end;
    std::function<bool()> m_may_close;
    bool m_idle = false;
};

} // namespace kindrel::desktop
