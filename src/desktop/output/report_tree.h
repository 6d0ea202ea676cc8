#pragma once

#include "core/dialogue.h"
#include "output/report_choices.h"

#include <QTreeWidget>

namespace kindrel::desktop {

/// The families of reports with their leaves; empty until reload().
class ReportTree : public QTreeWidget
{
    Q_OBJECT

public:
    explicit ReportTree(const core::Office& office, QWidget* parent = nullptr);

    /// Looks for the church's own layouts as they are now. The choice stays; the first time it is the first report.
    void reload();
    [[nodiscard]] int reports() const { return int(m_choices.size()); }
    /// Null while none is.
    [[nodiscard]] const output::ReportChoice* chosen() const;
    /// The same, but says so when none is.
    [[nodiscard]] const output::ReportChoice* chosen_or_told(core::Dialogue& dialogue) const;
    void choose(const QString& key);

Q_SIGNALS:
    void chosen_changed();
    /// Enter or a double click on a report.
    void wanted();

protected:
    void keyPressEvent(QKeyEvent* event) override;

private:
    void fill();

    const core::Office& m_office;
    std::vector<output::ReportChoice> m_choices;
};

} // namespace kindrel::desktop
