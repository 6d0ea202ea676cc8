#pragma once

#include "desktop/shell/remembered.h"
#include "people/fusion_setup.h"

#include <QWidget>

#include <functional>
#include <memory>

class QCheckBox;
class QComboBox;
class QGridLayout;
class QLabel;

namespace kindrel::desktop {

class FilterChoiceList;

/// The items that a fusion can be given, by their kinds, and the four ways to give them.
class FusionChooser : public QWidget
{
    Q_OBJECT

public:
    /// Of the chosen fusion: its entry of the item; null where it has none.
    using EntryOf = std::function<const people::FusionEntry*(const people::FilterItem&)>;

    /// Works on whatever stands in `setup`, which may be replaced.
    FusionChooser(core::Office& office, Remembered& remembered, const std::unique_ptr<people::FusionSetup>& setup,
                  EntryOf entry_of);

    /// Another fusion was chosen, or its entries changed.
    void show_entries();
    /// Reads the items of the kind again.
    void reload();

Q_SIGNALS:
    void add_wanted(const people::FilterItem& item, people::FusionMode mode);

private:
    void fill_kinds();
    void add_modes(QGridLayout& grid);
    void turn_kind(int by);
    [[nodiscard]] const people::FilterKindRow& kind() const;
    void show_values();
    void add(people::FusionMode mode);

    core::Office& m_office;
    const std::unique_ptr<people::FusionSetup>& m_setup;
    QComboBox* m_kinds;
    FilterChoiceList* m_list;
    QCheckBox* m_marked;
    QComboBox* m_value;
    QLabel* m_value_caption;
};

/// "OR+", the short name of a mode.
[[nodiscard]] QString short_words(people::FusionMode mode);

} // namespace kindrel::desktop
