#pragma once

#include "people/fusion_setup.h"

#include <QWidget>

#include <memory>

class QGridLayout;
class QListWidget;

namespace kindrel::desktop {

/// The entries of the chosen fusion in their order, each with the way it joins. Space steps through the four ways.
class FusionEntries : public QWidget
{
    Q_OBJECT

public:
    /// Works on whatever stands in `setup`, which may be replaced.
    explicit FusionEntries(const std::unique_ptr<people::FusionSetup>& setup, QWidget* parent = nullptr);

    /// -1: no fusion is chosen. A place that is not there becomes the nearest one.
    void show_fusion(int fusion, int entry);
    [[nodiscard]] int chosen() const;

Q_SIGNALS:
    void changed();

protected:
    bool eventFilter(QObject* target, QEvent* event) override;

private:
    void add_commands(QGridLayout& grid);
    void show_row(const people::FusionEntry& entry);
    void step_mode();
    void remove();
    void move_up();
    void move_down();
    /// Shows the entries again when the change was made; the cursor is in the list either way.
    void done(bool made, int entry);

    const std::unique_ptr<people::FusionSetup>& m_setup;
    int m_fusion = -1;
    QListWidget* m_list;
};

} // namespace kindrel::desktop
