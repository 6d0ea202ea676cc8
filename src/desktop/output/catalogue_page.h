#pragma once

#include "desktop/shell/desk.h"
#include "desktop/shell/page.h"
#include "output/run_options.h"
#include "people/working_list.h"

class QComboBox;
class QLabel;
class QLayout;

namespace kindrel::desktop {

class ReportDrawing;
class ReportTree;

/// The reports that there are, in their families, each with what it prints and how it looks. Enter shows the chosen one
/// over the families of active people.
class CataloguePage : public Page
{
    Q_OBJECT

public:
    explicit CataloguePage(Desk& desk);

    [[nodiscard]] QString help() const override { return QStringLiteral("reports"); }
    void entered() override;
    void find() override;
    void print() override { open_chosen(); }

private:
    [[nodiscard]] QLayout* make_details();
    [[nodiscard]] QLayout* make_scope();
    [[nodiscard]] QLayout* make_paper();
    [[nodiscard]] output::RunOptions options() const;
    void show_chosen();
    void open_chosen();

    Desk& m_desk;
    ReportTree* m_tree;
    QLabel* m_leaf;
    QLabel* m_description;
    QComboBox* m_paper;
    ReportDrawing* m_drawing;
    people::WorkingList m_list; ///< As it was when the page was last entered: enough for the drawing.
};

} // namespace kindrel::desktop
