#pragma once

#include "desktop/shell/area.h"
#include "desktop/shell/look.h"

#include <QMainWindow>

#include <span>
#include <vector>

class QLabel;
class QMenu;
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

private:
    void add_areas();
    void add_foot();
    void add_status_bar();
    void add_keys();
    void open_place(std::size_t place);
    void close_page();
    void show_status();
    void show_help();
    void set_appearance(Appearance appearance, int percent);
    [[nodiscard]] QMenu* view_menu();
    [[nodiscard]] bool granted(const AreaDefinition& area) const;

    Desk& m_desk;
    std::span<const AreaDefinition> m_areas;
    Look& m_look;
    Rail* m_rail;
    QStackedWidget* m_stack;
    QLabel* m_mode;
    QLabel* m_count;
    std::vector<Page*> m_pages; ///< Beside `m_areas`; null while an area is closed.
};

}
