#pragma once

#include "core/office.h"

#include <optional>
#include <vector>

namespace kindrel::registers {

/// The areas whose dates bear notes.
enum class NotesArea { roll, roster, weekly, finance };

/// A date of the project with its note, empty when it has none.
struct DatedNote
{
    int key = 0;
    core::Date date;
    QString note;

    friend bool operator==(const DatedNote&, const DatedNote&) = default;
};

/// The title of the notes screen, for example "Weekly Notes".
[[nodiscard]] QString notes_title(NotesArea area);
/// What the button that leads to the notes says: "&Notes Exist" where the date has a note, else "&Add Notes".
[[nodiscard]] QString notes_button(core::Session& session, NotesArea area, int date_key);

/// The notes of a project's dates, one of them shown at a time. Operations say what stands in their way, then return
/// false and change nothing. Throws core::DatabaseError.
class Notes
{
public:
    /// Reads the dates; without the right, which is told, there are none. `date_key` is shown, else the newest date.
    Notes(core::Office& office, NotesArea area, int project, int date_key = 0);

    [[nodiscard]] NotesArea area() const { return m_area; }
    /// Newest first, as they are stored.
    [[nodiscard]] const std::vector<DatedNote>& dates() const { return m_dates; }
    /// The place in dates(); nullopt when the project has no date.
    [[nodiscard]] std::optional<int> shown() const { return m_shown; }
    /// As typed, or as stored.
    [[nodiscard]] const QString& text() const { return m_text; }

    /// Offers what was typed for saving first; false when the person stays.
    [[nodiscard]] bool show(int place);
    void type(const QString& text) { m_text = text; }
    [[nodiscard]] bool altered() const;
    /// A note that others changed meanwhile is told, not overwritten; saving once more puts what was typed in its
    /// place. A date that is gone is told too.
    [[nodiscard]] bool save();
    /// Offers what was typed for saving; false when the person stays.
    [[nodiscard]] bool leave();

private:
    void read_dates(int date_key);
    [[nodiscard]] DatedNote& at_shown();
    [[nodiscard]] bool refuse(const QString& text, const QString& more = {}) const;

    core::Office& m_office;
    NotesArea m_area;
    int m_project;
    std::vector<DatedNote> m_dates;
    std::optional<int> m_shown;
    QString m_text;
};

} // namespace kindrel::registers
