#pragma once

#include "registers/project_setup.h"

#include <QWidget>

class QHBoxLayout;

namespace kindrel::desktop {

class OrderedListEditor;
class RollFields;

/// The setup that a page works on; it may be replaced.
using SharedSetup = std::unique_ptr<registers::ProjectSetup>;

/// The list of one register's projects. Registers whose projects have details show those of the chosen one beside it.
class ProjectTab : public QWidget
{
    Q_OBJECT

public:
    ProjectTab(const SharedSetup& setup, registers::Kind kind, const QString& heading);

    /// After the setup was replaced or saved.
    void show_projects();
    void focus_list();
    /// Chooses the project and goes to where it can be completed.
    void go_to_fault(int project);

    /// Something stands in a line, cell or field that is not in the setup yet.
    [[nodiscard]] virtual bool typing() const;
    /// Brings it there; false when it was refused, with the cursor in it.
    [[nodiscard]] virtual bool finish_typing();
    virtual void drop_typing();

Q_SIGNALS:
    /// The setup, or what is being typed.
    void changed();

protected:
    [[nodiscard]] OrderedListEditor& list() const { return *m_list; }
    [[nodiscard]] const SharedSetup& setup() const { return m_setup; }
    [[nodiscard]] const int& project() const { return m_project; }
    void add_details(QWidget* details);

    /// Before another project is chosen. False: the chosen one stays.
    [[nodiscard]] virtual bool settle_details() { return true; }
    virtual void show_details() {}
    virtual void focus_details() {}

private:
    void choose(int row);

    const SharedSetup& m_setup;
    registers::Kind m_kind;
    OrderedListEditor* m_list;
    QHBoxLayout* m_row;
    int m_project = -1; ///< The chosen one.
};

/// Services and absence reasons beside the roll projects.
class RollProjectTab : public ProjectTab
{
    Q_OBJECT

public:
    explicit RollProjectTab(const SharedSetup& setup);

    [[nodiscard]] bool typing() const override;
    [[nodiscard]] bool finish_typing() override;
    void drop_typing() override;

protected:
    [[nodiscard]] bool settle_details() override;
    void show_details() override;
    void focus_details() override;

private:
    RollFields* m_fields;
};

/// The two kinds of categories beside the weekly projects.
class WeeklyProjectTab : public ProjectTab
{
    Q_OBJECT

public:
    explicit WeeklyProjectTab(const SharedSetup& setup);

    [[nodiscard]] bool typing() const override;
    [[nodiscard]] bool finish_typing() override;
    void drop_typing() override;

protected:
    [[nodiscard]] bool settle_details() override;
    void show_details() override;
    void focus_details() override;

private:
    [[nodiscard]] OrderedListEditor* make_categories(registers::FigureKind kind, const QString& name);

    std::vector<OrderedListEditor*> m_categories;
};

} // namespace kindrel::desktop
