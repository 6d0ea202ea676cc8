#pragma once

#include "desktop/shell/ordered_list_model.h"
#include "people/setup_editor.h"

namespace kindrel::desktop {

/// One of the ten setup lists for the ordered-list editor.
class SetupOperations : public ListOperations
{
public:
    /// Works on whatever stands in `editor`, which may be replaced.
    SetupOperations(const std::unique_ptr<people::SetupEditor>& editor, people::SetupKind kind)
        : m_editor(editor), m_kind(kind)
    {
    }

    [[nodiscard]] ListCaptions captions() const override;
    [[nodiscard]] int count() const override { return m_editor->list(m_kind).size(); }
    [[nodiscard]] ListRow row(int index) const override;
    [[nodiscard]] QString count_line() const override { return m_editor->count_line(m_kind); }

    [[nodiscard]] bool add(const QStringList& texts) override;
    [[nodiscard]] int faulty_field(const QStringList& texts) const override;
    [[nodiscard]] bool rename(int index, const QStringList& texts) override;
    [[nodiscard]] bool remove(int index) override { return m_editor->remove(m_kind, index); }
    [[nodiscard]] bool move_up(int index) override { return m_editor->move_up(m_kind, index); }
    [[nodiscard]] bool move_down(int index) override { return m_editor->move_down(m_kind, index); }
    [[nodiscard]] bool sort() override { return m_editor->sort(m_kind); }
    [[nodiscard]] std::optional<QString> import() override;

private:
    const std::unique_ptr<people::SetupEditor>& m_editor;
    people::SetupKind m_kind;
};

/// What is typed of an item of the list: one field, and of a suburb the postcode too.
[[nodiscard]] QStringList setup_fields(people::SetupKind kind);
/// The hundredths of the list's width that its columns take.
[[nodiscard]] std::vector<int> setup_shares(people::SetupKind kind);

} // namespace kindrel::desktop
