#pragma once

#include "output/run_options.h"
#include "people/list_plan.h"

#include <QWidget>

class QGridLayout;
class QVBoxLayout;

namespace kindrel::desktop {

/// What the steps of the tagging screen put together: the list, and how a report prints it.
struct TaggingSheet
{
    people::ListPlan plan;
    output::RunOptions options;
};

/// One step of the tagging screen: shows its part of the sheet and changes it.
class StepPanel : public QWidget
{
    Q_OBJECT

public:
    /// The sheet belongs to the page and outlives its panels.
    StepPanel(TaggingSheet& sheet, const QString& caption) : m_sheet(sheet) { setAccessibleName(caption); }

    /// Reads again what is chosen from.
    virtual void reload() {}
    virtual void focus_first() = 0;
    /// Whether the step says something that differs from doing nothing.
    [[nodiscard]] virtual bool is_set() const { return false; }
    /// False, after saying why, when the step lacks something: it stays open, with the cursor where it lacks.
    [[nodiscard]] virtual bool finish() { return true; }

Q_SIGNALS:
    /// The sheet was changed here.
    void changed();

protected:
    [[nodiscard]] TaggingSheet& sheet() const { return m_sheet; }

private:
    TaggingSheet& m_sheet;
};

/// The column of a step, begun with its heading.
[[nodiscard]] QVBoxLayout* make_step_column(QWidget& panel, const QString& heading);
/// What the step does, in quiet words.
void add_step_words(QVBoxLayout& column, const QString& words);
void add_step_row(QGridLayout& rows, const QString& caption, QWidget* field);

} // namespace kindrel::desktop
