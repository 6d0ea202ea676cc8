#pragma once

#include "core/entry.h"
#include "core/security_setup.h"
#include "desktop/shell/desk.h"
#include "desktop/shell/page.h"

class QCheckBox;

namespace kindrel::desktop {

class PasswordEntry;
class PasswordList;
class UserDetails;

/// The passwords of the church, whom they belong to and what each opens. Leaving the page saves.
class SecurityPage : public Page
{
    Q_OBJECT

public:
    /// Null after telling why the area stays closed.
    [[nodiscard]] static SecurityPage* open(Desk& desk);

    [[nodiscard]] QString help() const override { return QStringLiteral("security"); }
    void entered() override;
    void find() override;
    bool save() override { return leave(); }
    [[nodiscard]] bool altered() const override { return m_setup.altered(); }
    [[nodiscard]] bool holds_lock() const override { return m_desk.office.shared(); }
    [[nodiscard]] bool leave() override;

private:
    SecurityPage(Desk& desk, core::AreaEntry entry, core::SecuritySetup setup);
    void connect_parts();
    [[nodiscard]] QWidget* make_side();

    void show_all(int place);
    void show_chosen();
    void show_state();
    void lead_to_fault();

    void add_password();
    void change_password();
    void remove_password();
    void set_people(const QStringList& people);
    void set_email(const QString& name, const QString& address);
    void set_area(core::Area area, bool granted);
    void drop_changes();

    Desk& m_desk;
    core::AreaEntry m_entry;
    core::SecuritySetup m_setup;
    QCheckBox* m_switch;
    PasswordList* m_list;
    PasswordEntry* m_password;
    UserDetails* m_details;
};

} // namespace kindrel::desktop
