#pragma once

#include "core/entry.h"
#include "desktop/shell/desk.h"
#include "desktop/shell/page.h"

class QTabWidget;

namespace kindrel::desktop {

class SearchTab;

/// Families by a piece of text, and people by the parts of the record in which they have an entry.
class SearchPage : public Page
{
    Q_OBJECT

public:
    /// Null, after saying why, when the area cannot be entered.
    [[nodiscard]] static SearchPage* open(Desk& desk);

    [[nodiscard]] QString help() const override { return QStringLiteral("search"); }
    void entered() override;
    void find() override;
    void print() override;

private:
    SearchPage(Desk& desk, core::AreaEntry entry);

    template <class Tab>
    void add_tab(const QString& title);
    void add_actions();
    void add_keys();
    [[nodiscard]] SearchTab& tab() const;
    void show_count();
    void save_list();

    Desk& m_desk;
    core::AreaEntry m_entry;
    QTabWidget* m_tabs;
};

} // namespace kindrel::desktop
