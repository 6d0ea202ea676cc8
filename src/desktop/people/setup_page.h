#pragma once

#include "desktop/shell/setup_tabs_page.h"
#include "people/setup_editor.h"

class QCheckBox;

namespace kindrel::desktop {

class OrderedListEditor;

/// The ten setup lists, one tab each.
class SetupPage : public SetupTabsPage
{
    Q_OBJECT

public:
    /// Null, after saying why, when the area cannot be entered.
    [[nodiscard]] static SetupPage* open(Desk& desk);
    ~SetupPage() override;

    [[nodiscard]] QString help() const override { return QStringLiteral("setup"); }

protected:
    [[nodiscard]] bool list_altered() const override { return m_editor->altered(); }
    [[nodiscard]] bool store() override { return m_editor->save(); }
    void reread() override;

private:
    SetupPage(Desk& desk, core::AreaEntry entry);

    [[nodiscard]] OrderedListEditor* make_list(const people::SetupList& list);
    void add_group_controls(OrderedListEditor& list);
    void show_group(int row);
    void set_group_not_active(bool not_active);
    void open_group_details();

    std::unique_ptr<people::SetupEditor> m_editor;
    OrderedListEditor* m_groups = nullptr;
    QCheckBox* m_not_active = nullptr;
};

} // namespace kindrel::desktop
