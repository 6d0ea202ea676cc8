#include "desktop/people/undo_offers.h"

#include "desktop/shell/note_bar.h"

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr std::size_t most_acts = 50;

} // namespace

void UndoOffers::offer(Act act)
{
    m_acts.push_back(std::move(act));
    if (m_acts.size() > most_acts)
        m_acts.erase(m_acts.begin());
    show({});
}

void UndoOffers::offer(const QString& words, const std::function<void()>& undo)
{
    offer({words, [undo] {
               undo();
               return QString();
           }});
}

void UndoOffers::take_back()
{
    if (m_acts.empty())
        return;
    const auto told = m_acts.back().undo();
    if (told)
        m_acts.pop_back();
    show(told.value_or(QString()));
}

void UndoOffers::show(const QString& told)
{
    if (m_acts.empty())
        return m_note.say(told);
    const QString& words = m_acts.back().words;
    m_note.offer(told.isEmpty() ? words : u"%1 Before that: %2"_s.arg(told, words), u"&Undo"_s,
                 [this] { take_back(); });
}

} // namespace kindrel::desktop
