#include "desktop/shell/page_stack.h"

#include "desktop/shell/page.h"

#include <algorithm>
#include <memory>
#include <utility>

namespace kindrel::desktop {

Page* PageStack::front() const
{
    return static_cast<Page*>(currentWidget());
}

std::size_t PageStack::front_place() const
{
    return std::size_t(std::ranges::find(m_pages, front()) - m_pages.begin());
}

void PageStack::put(std::size_t place, Page* page)
{
    m_pages[place] = page;
    addWidget(page);
}

void PageStack::bring_forward(std::size_t place)
{
    setCurrentWidget(m_pages[place]);
    Q_EMIT came_forward(place);
}

bool PageStack::leave(std::size_t place)
{
    bring_forward(place); // What it asks is about what one sees.
    return m_pages[place]->leave();
}

bool PageStack::leave_all()
{
    for (std::size_t place = 0; place < m_pages.size(); ++place)
        if (m_pages[place] && !leave(place))
            return false;
    return true;
}

bool PageStack::stands_in_the_way(std::size_t place, Parked parked) const
{
    const Page* page = m_pages[place];
    if (!page || !(page->altered() || page->holds_lock()))
        return false;
    return parked == Parked::leave_first ||
           (parked == Parked::setups_leave && m_areas[place].parked == Parked::leave_first);
}

bool PageStack::make_way(std::size_t place)
{
    if (m_areas[place].parked == Parked::stay)
        return true;
    const std::size_t in_front = front_place();
    for (std::size_t other = 0; other < m_pages.size(); ++other) {
        if (!stands_in_the_way(other, m_areas[place].parked))
            continue;
        if (!leave(other))
            return false;
        close(other);
    }
    bring_forward(m_pages[in_front] ? in_front : 0);
    return true;
}

void PageStack::close(std::size_t place)
{
    if (place == 0)
        return;
    const std::unique_ptr<Page> closing(std::exchange(m_pages[place], nullptr));
    if (front() == closing.get())
        bring_forward(0);
    removeWidget(closing.get());
    Q_EMIT closed(place);
}

} // namespace kindrel::desktop
