#pragma once

#include "desktop/shell/desk.h"
#include "desktop/shell/page.h"

class QLabel;

namespace kindrel::desktop {

class ReportTree;

/// The reports that there are, in their families, each with what it prints. Enter shows the chosen one over the
/// families of active people.
class CataloguePage : public Page
{
    Q_OBJECT

public:
    explicit CataloguePage(Desk& desk);

    [[nodiscard]] QString help() const override { return QStringLiteral("reports"); }
    void entered() override;
    void print() override { open_chosen(); }

private:
    void show_chosen();
    void open_chosen();

    Desk& m_desk;
    ReportTree* m_tree;
    QLabel* m_leaf;
    QLabel* m_description;
};

} // namespace kindrel::desktop
