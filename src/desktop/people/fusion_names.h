#pragma once

#include "people/fusion_setup.h"

#include <QAbstractListModel>
#include <QWidget>

#include <memory>

class QLineEdit;
class QListView;
class QPushButton;

namespace kindrel::desktop {

class InPlaceEditing;

/// The names of the fusions, which can be edited in place.
class FusionNamesModel : public QAbstractListModel
{
    Q_OBJECT

public:
    FusionNamesModel(const std::unique_ptr<people::FusionSetup>& setup, QObject* parent);

    void refresh();
    [[nodiscard]] int rowCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] QVariant data(const QModelIndex& index, int role) const override;
    [[nodiscard]] QVariant headerData(int section, Qt::Orientation orientation, int role) const override;
    [[nodiscard]] Qt::ItemFlags flags(const QModelIndex& index) const override;
    bool setData(const QModelIndex& index, const QVariant& value, int role) override;

private:
    const std::unique_ptr<people::FusionSetup>& m_setup;
};

/// The fusions by name. Insert goes to the line at the top, Enter there adds a fusion, Enter in the
/// list renames the chosen one, Delete removes it.
class FusionNames : public QWidget
{
    Q_OBJECT

public:
    /// Works on whatever stands in `setup`, which may be replaced.
    explicit FusionNames(const std::unique_ptr<people::FusionSetup>& setup, QWidget* parent = nullptr);

    /// The chosen fusion, -1 when none is.
    [[nodiscard]] int chosen() const;
    /// After the fusions were changed elsewhere. A place that is not there becomes the nearest one.
    void show_names(int chosen);
    void focus_list();
    void focus_line();

    /// Something is typed that is not in the list yet.
    [[nodiscard]] bool typing() const;
    /// Brings it into the list; false when it was refused.
    [[nodiscard]] bool finish_typing();
    void drop_typing();

Q_SIGNALS:
    void chosen_changed();
    /// The names, or what is being typed.
    void changed();

private:
    void furnish_line();
    void furnish_list();
    [[nodiscard]] QPushButton* make_button(const QString& name, const QString& text, const QString& icon_name,
                                           const QString& tip, void (FusionNames::*run)());
    void add();
    [[nodiscard]] bool add_typed();
    void rename();
    void remove();

    const std::unique_ptr<people::FusionSetup>& m_setup;
    FusionNamesModel* m_model;
    QLineEdit* m_line;
    QListView* m_list;
    InPlaceEditing* m_cells;
};

} // namespace kindrel::desktop
