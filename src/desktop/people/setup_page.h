#pragma once

#include "core/entry.h"
#include "desktop/shell/desk.h"
#include "desktop/shell/page.h"
#include "people/setup_editor.h"

class QCheckBox;
class QTabWidget;

namespace kindrel::desktop {

class OrderedListEditor;

/// The ten setup lists, one tab each. Nothing is stored before the page is saved; for as long as it is open nobody else
/// is in the setup area.
class SetupPage : public Page
{
    Q_OBJECT

public:
    /// Null, after saying why, when the area cannot be entered.
    [[nodiscard]] static SetupPage* open(Desk& desk);
    ~SetupPage() override;

    [[nodiscard]] QString help() const override { return QStringLiteral("setup"); }
    void entered() override;
    void find() override;
    bool save() override;
    [[nodiscard]] bool altered() const override;
    [[nodiscard]] bool holds_lock() const override { return m_desk.office.shared(); }
    [[nodiscard]] bool leave() override;

private:
    SetupPage(Desk& desk, core::AreaEntry entry);

    void add_tab(const people::SetupList& list);
    void add_group_controls(OrderedListEditor& groups);
    void add_actions();
    [[nodiscard]] OrderedListEditor& list_in_front() const;
    [[nodiscard]] OrderedListEditor& groups() const;
    /// What was typed and not entered yet goes into its list.
    [[nodiscard]] bool finish_typing();
    void cancel();
    void drop();
    void show_lists();
    void show_state();
    void show_group(int row);
    void set_group_not_active(bool not_active);
    void open_group_details();

    Desk& m_desk;
    core::AreaEntry m_entry;
    std::unique_ptr<people::SetupEditor> m_editor;
    QTabWidget* m_tabs;
    std::vector<OrderedListEditor*> m_lists; ///< In the order of the tabs.
    QCheckBox* m_not_active = nullptr;
    bool m_saved = false;
};

} // namespace kindrel::desktop
