#pragma once

#include "core/entry.h"
#include "desktop/shell/desk.h"
#include "desktop/shell/page.h"
#include "people/fusion_setup.h"

class QLabel;

namespace kindrel::desktop {

class FusionChooser;
class FusionEntries;
class FusionNames;
class PersonSwitches;

/// Named sets of filter entries to be made and changed. Nothing is stored before the page is saved.
class FusionPage : public Page
{
    Q_OBJECT

public:
    /// Null, after saying why, when the area cannot be entered.
    [[nodiscard]] static FusionPage* open(Desk& desk);
    ~FusionPage() override;

    [[nodiscard]] QString help() const override { return QStringLiteral("fusions"); }
    void entered() override;
    void find() override;
    bool save() override;
    [[nodiscard]] bool altered() const override;
    [[nodiscard]] bool leave() override;

private:
    FusionPage(Desk& desk, core::AreaEntry entry);

    void add_actions();
    [[nodiscard]] QWidget* make_content();
    void connect_parts();
    [[nodiscard]] const people::FusionEntry* entry_of(const people::FilterItem& item) const;
    void add_entry(const people::FilterItem& item, people::FusionMode mode);
    void set_states();
    void cancel();
    void drop();
    void show_fusion();
    void show_state();

    Desk& m_desk;
    core::AreaEntry m_entry;
    std::unique_ptr<people::FusionSetup> m_setup;
    FusionNames* m_names;
    FusionChooser* m_chooser;
    FusionEntries* m_entries;
    PersonSwitches* m_states;
    QLabel* m_sentence;
    bool m_saved = false;
};

} // namespace kindrel::desktop
