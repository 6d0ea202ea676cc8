#pragma once

#include "desktop/people/editor_fields.h"
#include "people/setup_lists.h"

namespace kindrel::desktop {

class ChoiceLine;
class NoteBar;

/// The church's suburbs, as they were when they were read last.
class SuburbBook
{
public:
    void read(core::Session& session);
    [[nodiscard]] bool is_empty() const { return m_items.empty(); }
    /// "Mosman 2088", in the order of the list.
    [[nodiscard]] QStringList texts() const;
    /// By text, suburb or postcode; by a part of them when no other suburb has it. Null for none.
    [[nodiscard]] const people::SetupItem* find(const QString& typed) const;
    [[nodiscard]] const people::SetupItem* with_key(int key) const;

private:
    std::vector<people::SetupItem> m_items;
};

/// Suburb and postcode of one of the two addresses. The suburb comes from the church's list; the postcode may differ
/// from the list's.
class SuburbFields : public QObject
{
    Q_OBJECT

public:
    SuburbFields(EditorBench& bench, NoteBar& note, SuburbBook& book, people::SuburbType type, EditorForm& form);

    void show_file();
    void finish_typing();
    void focus_suburb();
    void focus_postcode();

private:
    using Place = std::optional<people::Suburb> people::FamilyFile::*;

    void add_to(EditorForm& form);
    void finish_suburb();
    void finish_postcode();
    void take(const people::SetupItem* item);
    void set(const std::optional<people::Suburb>& suburb, const char* what);
    void refuse(const QString& typed);
    void tell_empty();
    void add_new(const QString& typed);
    [[nodiscard]] const std::optional<people::Suburb>& suburb() const { return m_bench.editor.file().*m_place; }

    EditorBench& m_bench;
    NoteBar& m_note;
    SuburbBook& m_book;
    people::SuburbType m_type;
    Place m_place;
    ChoiceLine* m_suburb;
    TypedLine* m_postcode;
};

} // namespace kindrel::desktop
