#pragma once

#include "desktop/people/step_panel.h"
#include "desktop/shell/desk.h"

class QCheckBox;
class QComboBox;
class QLineEdit;

namespace kindrel::desktop {

/// What reports of this list leave out beyond what is hidden anyway.
class HiddenPanel : public StepPanel
{
    Q_OBJECT

public:
    explicit HiddenPanel(TaggingSheet& sheet);
    void focus_first() override;
    [[nodiscard]] bool is_set() const override { return sheet().options.withheld.any(); }

private:
    std::vector<QCheckBox*> m_details;
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

/// Paper, text size and the address that letters go to.
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
    QComboBox *m_paper, *m_text, *m_address;
};

} // namespace kindrel::desktop
