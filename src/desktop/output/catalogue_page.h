#pragma once

#include "desktop/shell/desk.h"
#include "desktop/shell/page.h"
#include "output/run_options.h"
#include "people/working_list.h"

class QComboBox;
class QLabel;
class QLayout;

namespace kindrel::desktop {

struct ChosenPeople;
class ReportDrawing;
class ReportTree;

/// The reports that there are, in their families, each with what it prints and how it looks. Enter shows the chosen one
/// over everybody in the active families, or over the people chosen in Tagging, with what is set there.
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
    [[nodiscard]] QLayout* make_people();
    [[nodiscard]] QLayout* make_paper();
    /// Nothing: the report is about everybody.
    [[nodiscard]] const ChosenPeople* chosen_people() const;
    [[nodiscard]] output::RunOptions options() const;
    /// Reads again who there is to choose from; the choice stays.
    void show_people();
    void show_chosen();
    void open_chosen();

    Desk& m_desk;
    ReportTree* m_tree;
    QLabel* m_leaf;
    QLabel* m_description;
    QLabel* m_scope;
    QComboBox *m_people, *m_paper;
    ReportDrawing* m_drawing;
    bool m_tagging_wanted = false;                ///< Its people are, once there are any.
    std::shared_ptr<const ChosenPeople> m_chosen; ///< As it was when the page was last entered; null: there is no list.
    people::WorkingList m_everybody;              ///< The same, which is enough for the drawing.
};

} // namespace kindrel::desktop
