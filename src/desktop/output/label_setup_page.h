#pragma once

#include "core/entry.h"
#include "desktop/shell/desk.h"
#include "desktop/shell/page.h"
#include "output/labels/label_setup.h"
#include "output/report_choices.h"

#include <array>

class QTabWidget;

namespace kindrel::desktop {

class LabelFields;
class SheetPicture;

/// How mailing labels and name tags are printed: sheets, fonts and what is on them, with the first sheet as it would
/// come out now.
class LabelSetupPage : public Page
{
    Q_OBJECT

public:
    /// Null after telling why the area stays closed.
    [[nodiscard]] static LabelSetupPage* open(Desk& desk);

    [[nodiscard]] QString help() const override { return QStringLiteral("labels"); }
    void entered() override;
    void find() override;
    void print() override { open_test_sheet(); }
    bool save() override;
    [[nodiscard]] bool altered() const override { return m_setup != m_stored; }
    [[nodiscard]] bool leave() override;

private:
    /// What is printed on one kind of sheet.
    struct Tab
    {
        output::LabelGrid& grid;
        LabelFields* fields;
        SheetPicture* picture;
    };

    LabelSetupPage(Desk& desk, core::AreaEntry entry);
    [[nodiscard]] Tab make_labels();
    [[nodiscard]] Tab make_tags();
    [[nodiscard]] Tab make_tab(const QString& prefix, output::LabelGrid& grid);
    void add_tab(const Tab& tab, const QString& title);
    void add_actions();
    [[nodiscard]] const Tab& shown() const;
    [[nodiscard]] output::ReportChoice shown_report() const;
    void show_stored();
    void show_state();
    void draw();
    void open_test_sheet();
    /// Shows the tab of the field and puts the cursor into it, its text selected.
    void lead_to_field(const QString& name);

    Desk& m_desk;
    core::AreaEntry m_entry;
    output::LabelSetup m_stored, m_setup;
    QTabWidget* m_tabs;
    std::array<Tab, 2> m_sheets;
    people::WorkingList m_list; ///< Whom the pictures are made of, as it was when the page was last entered.
};

} // namespace kindrel::desktop
