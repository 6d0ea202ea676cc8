#pragma once

#include "core/dialogue.h"
#include "output/catalogue.h"

#include <QTreeWidget>

namespace kindrel::desktop {

/// The catalogue's families with their reports, the first one chosen.
class ReportTree : public QTreeWidget
{
    Q_OBJECT

public:
    explicit ReportTree(QWidget* parent = nullptr);

    [[nodiscard]] int reports() const { return m_reports; }
    /// Null while none is.
    [[nodiscard]] const output::ReportDefinition* chosen() const;
    /// The same, but says so when none is.
    [[nodiscard]] const output::ReportDefinition* chosen_or_told(core::Dialogue& dialogue) const;

Q_SIGNALS:
    void chosen_changed();
    /// Enter or a double click.
    void wanted();

protected:
    void keyPressEvent(QKeyEvent* event) override;

private:
    void fill();

    int m_reports = 0;
};

} // namespace kindrel::desktop
