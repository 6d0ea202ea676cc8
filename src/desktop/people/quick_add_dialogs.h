#pragma once

#include "core/office.h"
#include "people/setup_lists.h"

#include <QDialog>

namespace kindrel::desktop {

class AddLine;

/// Adds one occupation or suburb to its list at once, for whoever needs it while editing a family.
class QuickAddDialog : public QDialog
{
    Q_OBJECT

public:
    /// `kind` is occupations or suburbs. `texts` are what was typed already: a text, for a suburb its postcode too.
    QuickAddDialog(core::Office& office, people::SetupKind kind, const QStringList& texts, QWidget* parent = nullptr);

    void accept() override;
    /// Of the item that was added or was there already; nothing before accept().
    [[nodiscard]] std::optional<int> key() const { return m_key; }

private:
    core::Office& m_office;
    people::SetupKind m_kind;
    AddLine* m_line;
    std::optional<int> m_key;
};

/// Asks for the new item and adds it; its key, or nothing when the person turned away.
[[nodiscard]] std::optional<int> ask_for_new_item(core::Office& office, people::SetupKind kind,
                                                  const QStringList& texts, QWidget* parent);

} // namespace kindrel::desktop
