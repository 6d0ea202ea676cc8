#pragma once

#include "desktop/shell/area.h"
#include "desktop/shell/look.h"

#include <QMainWindow>

#include <span>
#include <vector>

class QLabel;
class QStackedWidget;

namespace kindrel::desktop {

class Page;
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
    [[nodiscard]] Page* page() const;
    /// Asks every page that is open; false when one of them stays.
    [[nodiscard]] bool leave_all();

Q_SIGNALS:
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
    /// False when the area does not let anybody in.
    [[nodiscard]] bool make_page(std::size_t place);
    [[nodiscard]] std::size_t place_of(const Page* page) const;
    /// What the rail shows of the pages' states.
    void show_marks();
    void set_idle(bool idle);
    void close_page();
    void show_status();
    void show_help();
    [[nodiscard]] bool granted(const AreaDefinition& area) const;

    Desk& m_desk;
    std::span<const AreaDefinition> m_areas;
    Look& m_look;
    Rail* m_rail;
    QStackedWidget* m_stack;
    QLabel* m_mode;
    QLabel* m_count;
    std::vector<Page*> m_pages; ///< Beside `m_areas`; null while an area is closed.
    bool m_idle = false;
};

} // namespace kindrel::desktop
