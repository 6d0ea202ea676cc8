#pragma once

#include "core/entry.h"
#include "core/global_variables.h"
#include "desktop/shell/desk.h"
#include "desktop/shell/page.h"

class QBoxLayout;
class QSpinBox;

namespace kindrel::desktop {

class HeadPicture;
class LogoFields;
class SettingFields;

/// The options that hold everywhere in the program, by whom they hold for, and the logo on reports.
class GlobalVariablesPage : public Page
{
    Q_OBJECT

public:
    /// Null after telling why the area stays closed.
    [[nodiscard]] static GlobalVariablesPage* open(Desk& desk);

    [[nodiscard]] QString help() const override { return QStringLiteral("global_data"); }
    void entered() override { find(); }
    void find() override;
    bool save() override;
    [[nodiscard]] bool altered() const override { return m_variables.altered(); }
    [[nodiscard]] bool leave() override;

private:
    GlobalVariablesPage(Desk& desk, core::AreaEntry entry, core::GlobalVariables variables);
    [[nodiscard]] QBoxLayout* make_church();
    [[nodiscard]] QBoxLayout* make_head();
    [[nodiscard]] QBoxLayout* make_logos();
    [[nodiscard]] QBoxLayout* make_picture();
    void choose_logo(core::LogoOf whose);
    void show_all();
    void show_state();

    Desk& m_desk;
    core::AreaEntry m_entry;
    core::GlobalVariables m_variables;
    SettingFields* m_fields;
    QSpinBox* m_starts;
    LogoFields* m_logos;
    HeadPicture* m_picture;
};

} // namespace kindrel::desktop
