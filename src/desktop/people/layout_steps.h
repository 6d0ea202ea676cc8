#pragma once

#include "desktop/people/step_panel.h"
#include "desktop/shell/desk.h"

class QCheckBox;
class QComboBox;
class QLineEdit;

namespace kindrel::desktop {

/// Whether reports print what is kept hidden.
class HiddenPanel : public StepPanel
{
    Q_OBJECT

public:
    HiddenPanel(Desk& desk, TaggingSheet& sheet);
    void focus_first() override;
    [[nodiscard]] bool is_set() const override { return sheet().options.hidden_details; }

private:
    void turn(bool on);

    Desk& m_desk;
    QCheckBox* m_print;
};

/// The title of a report, and what else stands in its head.
class TitlePanel : public StepPanel
{
    Q_OBJECT

public:
    TitlePanel(Desk& desk, TaggingSheet& sheet);
    void focus_first() override;
    [[nodiscard]] bool is_set() const override;

private:
    void take();

    Desk& m_desk;
    QLineEdit* m_title;
    std::vector<QCheckBox*> m_parts;
};

/// Paper and text size.
class FormatPanel : public StepPanel
{
    Q_OBJECT

public:
    FormatPanel(Desk& desk, TaggingSheet& sheet);
    void focus_first() override;
    [[nodiscard]] bool is_set() const override;

private:
    void take();

    Desk& m_desk;
    QComboBox *m_paper, *m_text;
};

} // namespace kindrel::desktop
