#pragma once

#include "registers/project_setup.h"

#include <QWidget>

class QCheckBox;
class QGridLayout;

namespace kindrel::desktop {

class NameField;

/// What a roll project counts: its services, and its absence reasons with the mark that counts them as attendances.
class RollFields : public QWidget
{
    Q_OBJECT

public:
    /// Works on whatever stands in `setup`, which may be replaced, and in it on the project at the place `project`.
    RollFields(const std::unique_ptr<registers::ProjectSetup>& setup, const int& project, QWidget* parent = nullptr);

    /// After another project was chosen or the setup was changed elsewhere.
    void show_project();
    void focus_services();
    [[nodiscard]] bool typing() const;
    /// False when something typed was refused; the cursor is then in it.
    [[nodiscard]] bool finish_typing();
    void drop_typing();

Q_SIGNALS:
    /// The setup, or what is being typed.
    void changed();
    /// Something was typed while no project is chosen.
    void project_wanted();

private:
    /// `set` takes over the name of service or absence number `place`.
    using Set = bool (registers::ProjectSetup::*)(int project, int place, const QString& name);
    NameField* make_field(const QString& caption, int place, Set set);
    void add_services(QGridLayout& grid);
    void add_absences(QGridLayout& grid);
    [[nodiscard]] bool take(int place, const QString& name, Set set);
    void include(int place, bool on);

    const std::unique_ptr<registers::ProjectSetup>& m_setup;
    const int& m_project;
    std::vector<NameField*> m_services, m_absences;
    std::vector<QCheckBox*> m_includes;
};

} // namespace kindrel::desktop
