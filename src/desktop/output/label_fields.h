#pragma once

#include "output/labels/label_setup.h"

#include <QWidget>

#include <functional>
#include <optional>
#include <vector>

class QBoxLayout;
class QCheckBox;
class QComboBox;
class QGridLayout;
class QVBoxLayout;

namespace kindrel::desktop {

/// Alters a sheet of labels: its stock, its measures and the look of its texts. Each field bears its stored name as
/// object name.
class LabelFields : public QWidget
{
    Q_OBJECT

public:
    /// What is altered must outlive the fields. Their names begin with `prefix`.
    LabelFields(const QString& prefix, output::LabelGrid& grid, QWidget* parent = nullptr);

    void add_text(const QString& name, const QString& caption, output::LabelFont& font);
    void add_tick(const QString& name, const QString& text, bool& on);

    /// Shows the values as they are now.
    void show_values();

Q_SIGNALS:
    /// By the person.
    void edited();

private:
    struct Measure;
    void add_stock(QBoxLayout& column);
    void add_measures(QBoxLayout& column);
    void add_measure(QBoxLayout& column, const Measure& measure);
    void take_stock(int place);
    void show_stock();
    [[nodiscard]] QComboBox* make_family(const QString& name, const QString& accessible_name, output::LabelFont& font);
    [[nodiscard]] QCheckBox* make_tick(const QString& name, const QString& text, const QString& accessible_name,
                                       bool& on);
    /// How a field shows its value; it is shown at once.
    void shown_by(QWidget* field, std::function<void()> show);
    void altered();

    QString m_prefix;
    output::LabelGrid& m_grid;
    std::optional<output::LabelGrid> m_own; ///< The measures of no stock that were shown last.
    QComboBox* m_stock;
    QVBoxLayout* m_column;
    QGridLayout* m_texts;
    std::vector<std::function<void()>> m_shows;
};

} // namespace kindrel::desktop
