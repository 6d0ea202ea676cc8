#pragma once

#include "core/entry.h"
#include "core/network_setup.h"
#include "desktop/shell/desk.h"
#include "desktop/shell/page.h"

class QBoxLayout;
class QCheckBox;
class QLineEdit;

namespace kindrel::desktop {

class LockList;

/// Where this workstation finds the data files, and what is locked in the church.
class NetworkPage : public Page
{
    Q_OBJECT

public:
    /// Null after telling why the area stays closed.
    [[nodiscard]] static NetworkPage* open(Desk& desk);

    [[nodiscard]] QString help() const override { return QStringLiteral("network"); }
    void entered() override;
    void find() override;
    void print() override;
    bool save() override;
    [[nodiscard]] bool altered() const override { return m_setup.altered(); }
    [[nodiscard]] bool leave() override;

private:
    NetworkPage(Desk& desk, core::AreaEntry entry, core::NetworkSetup setup);
    [[nodiscard]] QBoxLayout* make_place();
    [[nodiscard]] QBoxLayout* make_path();
    [[nodiscard]] QBoxLayout* make_locks();

    void show_place();
    void show_locks();
    void show_state();

    void browse();
    void test();
    void refresh();
    void unlock();

    Desk& m_desk;
    core::AreaEntry m_entry;
    core::NetworkSetup m_setup;
    QCheckBox* m_switch;
    QLineEdit* m_path;
    LockList* m_locks;
};

} // namespace kindrel::desktop
