#pragma once

#include "core/entry.h"
#include "core/vision_setup.h"
#include "desktop/shell/desk.h"
#include "desktop/shell/page.h"

class QBoxLayout;

namespace kindrel::desktop {

class HeadPicture;
class SettingFields;

/// The church's vision statement and how reports print it, with a picture of a report's head and foot.
class VisionPage : public Page
{
    Q_OBJECT

public:
    /// Null after telling why the area stays closed.
    [[nodiscard]] static VisionPage* open(Desk& desk);

    [[nodiscard]] QString help() const override { return QStringLiteral("vision"); }
    void entered() override { find(); }
    void find() override;
    bool save() override;
    [[nodiscard]] bool altered() const override { return m_setup.altered(); }
    [[nodiscard]] bool leave() override;

private:
    VisionPage(Desk& desk, core::AreaEntry entry, core::VisionSetup setup);
    [[nodiscard]] QBoxLayout* make_statement();
    [[nodiscard]] QBoxLayout* make_look();
    [[nodiscard]] QBoxLayout* make_picture();
    void show_state();

    Desk& m_desk;
    core::AreaEntry m_entry;
    core::VisionSetup m_setup;
    SettingFields* m_fields;
    HeadPicture* m_picture;
};

} // namespace kindrel::desktop
