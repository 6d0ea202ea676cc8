#pragma once

#include "desktop/shell/area.h"

#include <QStackedWidget>

#include <span>
#include <vector>

namespace kindrel::desktop {

/// The pages that are open, one of them in front and the others parked, by the place of their area. The first place is
/// home: once it is open it is never closed.
class PageStack : public QStackedWidget
{
    Q_OBJECT

public:
    explicit PageStack(std::span<const AreaDefinition> areas) : m_areas(areas), m_pages(areas.size()) {}

    [[nodiscard]] std::size_t places() const { return m_pages.size(); }
    /// Null while the area is closed.
    [[nodiscard]] Page* at(std::size_t place) const { return m_pages[place]; }
    /// Null before the first page is put in.
    [[nodiscard]] Page* front() const;
    [[nodiscard]] std::size_t front_place() const;
    void put(std::size_t place, Page* page);
    void bring_forward(std::size_t place);

    /// Asks the page, in front; false when it stays.
    [[nodiscard]] bool leave(std::size_t place);
    /// Asks every page that is open; false when one of them stays. None is closed.
    [[nodiscard]] bool leave_all();
    /// Asks and closes the pages that have to leave before the area of this place is entered; false when one of them
    /// stays.
    [[nodiscard]] bool make_way(std::size_t place);
    /// The page is gone on return, and so is its lock.
    void close(std::size_t place);

Q_SIGNALS:
    void came_forward(std::size_t place);
    void closed(std::size_t place);

private:
    [[nodiscard]] bool stands_in_the_way(std::size_t place, Parked parked) const;

    std::span<const AreaDefinition> m_areas;
    std::vector<Page*> m_pages;
};

} // namespace kindrel::desktop
