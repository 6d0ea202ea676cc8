#pragma once

#include <QString>

#include <functional>
#include <optional>
#include <vector>

namespace kindrel::desktop {

class NoteBar;

/// What was done on a page, to be taken back step by step, the last first: offered in its note bar, and by a key.
class UndoOffers
{
public:
    /// What was done, in words, and what takes it back: that tells how it went, or nullopt where it could not.
    struct Act
    {
        QString words;
        std::function<std::optional<QString>()> undo;
    };

    /// The bar outlives the offers.
    explicit UndoOffers(NoteBar& note) : m_note(note) {}

    void offer(Act act);
    /// What takes it back always does.
    void offer(const QString& words, const std::function<void()>& undo);
    void take_back();

private:
    void show(const QString& told);

    NoteBar& m_note;
    std::vector<Act> m_acts; ///< The latest last.
};

} // namespace kindrel::desktop
