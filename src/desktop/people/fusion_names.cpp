#include "desktop/people/fusion_names.h"

#include "desktop/shell/icons.h"
#include "desktop/shell/in_place_editing.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QListView>
#include <QPushButton>
#include <QShortcut>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

FusionNamesModel::FusionNamesModel(const std::unique_ptr<people::FusionSetup>& setup, QObject* parent)
    : QAbstractListModel(parent), m_setup(setup)
{
}

void FusionNamesModel::refresh()
{
    beginResetModel();
    endResetModel();
}

int FusionNamesModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : m_setup->fusions().size();
}

QVariant FusionNamesModel::data(const QModelIndex& index, int role) const
{
    if (!m_setup->fusions().holds(index.row()) || (role != Qt::DisplayRole && role != Qt::EditRole))
        return {};
    return m_setup->fusions()[index.row()].name;
}

QVariant FusionNamesModel::headerData(int, Qt::Orientation, int role) const
{
    return role == Qt::DisplayRole ? QVariant(u"Fusion"_s) : QVariant();
}

Qt::ItemFlags FusionNamesModel::flags(const QModelIndex& index) const
{
    return QAbstractListModel::flags(index) | Qt::ItemIsEditable;
}

bool FusionNamesModel::setData(const QModelIndex& index, const QVariant& value, int role)
{
    if (role != Qt::EditRole || !m_setup->rename(index.row(), value.toString()))
        return false;
    Q_EMIT dataChanged(index, index);
    return true;
}

FusionNames::FusionNames(const std::unique_ptr<people::FusionSetup>& setup, QWidget* parent)
    : QWidget(parent), m_setup(setup), m_model(new FusionNamesModel(setup, this)), m_line(new QLineEdit),
      m_list(new QListView), m_cells(new InPlaceEditing(*m_list))
{
    auto* top = new QHBoxLayout;
    top->setSpacing(space::field / 2);
    top->addWidget(m_line, 1);
    top->addWidget(
        make_button(u"add_fusion"_s, u"&Add"_s, u"list-add"_s, u"Add the fusion (Enter)"_s, &FusionNames::add));
    auto* bottom = new QHBoxLayout;
    bottom->setSpacing(space::field / 2);
    bottom->addWidget(make_button(u"rename_fusion"_s, u"Re&name"_s, u"edit-rename"_s,
                                  u"Rename the chosen fusion (Enter in the list)"_s, &FusionNames::rename));
    bottom->addWidget(make_button(u"delete_fusion"_s, u"D&elete"_s, u"edit-delete"_s,
                                  u"Delete the chosen fusion (Delete in the list)"_s, &FusionNames::remove));
    bottom->addStretch(1);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field);
    column->addWidget(make_heading(u"Fusions"_s));
    column->addLayout(top);
    column->addWidget(m_list, 1);
    column->addLayout(bottom);
    furnish_line();
    furnish_list();
}

void FusionNames::furnish_line()
{
    m_line->setObjectName(u"new_fusion"_s);
    m_line->setAccessibleName(u"New fusion"_s);
    m_line->setPlaceholderText(u"New fusion"_s);
    connect(m_line, &QLineEdit::textChanged, this, &FusionNames::changed);
    connect(m_line, &QLineEdit::returnPressed, this, &FusionNames::add);
}

void FusionNames::furnish_list()
{
    m_list->setObjectName(u"fusions"_s);
    m_list->setAccessibleName(u"Fusions"_s);
    m_list->setModel(m_model);
    m_list->setEditTriggers(QAbstractItemView::NoEditTriggers);
    connect(m_list, &QListView::activated, this, &FusionNames::rename);
    connect(m_list->selectionModel(), &QItemSelectionModel::selectionChanged, this, &FusionNames::chosen_changed);
    connect(m_model, &QAbstractItemModel::dataChanged, this, &FusionNames::changed);
    auto* drop = new QShortcut(Qt::Key_Delete, m_list);
    drop->setContext(Qt::WidgetShortcut);
    connect(drop, &QShortcut::activated, this, &FusionNames::remove);
}

QPushButton* FusionNames::make_button(const QString& name, const QString& text, const QString& icon_name,
                                      const QString& tip, void (FusionNames::*run)())
{
    auto* button = new QPushButton(icon(icon_name), text);
    button->setObjectName(name);
    button->setToolTip(tip);
    connect(button, &QPushButton::clicked, this, run);
    return button;
}

int FusionNames::chosen() const
{
    const auto rows = m_list->selectionModel()->selectedIndexes();
    return rows.isEmpty() ? -1 : rows.front().row();
}

void FusionNames::show_names(int wanted)
{
    m_model->refresh();
    const int row = std::clamp(wanted, -1, m_setup->fusions().size() - 1);
    m_list->setCurrentIndex(m_model->index(row));
    Q_EMIT chosen_changed();
    Q_EMIT changed();
}

void FusionNames::focus_list()
{
    if (m_setup->fusions().empty())
        focus_line();
    else
        m_list->setFocus();
}

void FusionNames::focus_line()
{
    if (!m_cells->finish())
        return;
    m_line->setFocus();
    m_line->selectAll();
}

bool FusionNames::typing() const
{
    return m_cells->altered() || !m_line->text().trimmed().isEmpty();
}

bool FusionNames::finish_typing()
{
    return m_cells->finish() && (m_line->text().trimmed().isEmpty() || add_typed());
}

void FusionNames::drop_typing()
{
    m_cells->give_up();
    m_line->clear();
}

bool FusionNames::add_typed()
{
    if (!m_cells->finish())
        return false;
    if (!m_setup->add(m_line->text())) {
        focus_line();
        return false;
    }
    m_line->clear();
    show_names(m_setup->fusions().size() - 1);
    return true;
}

void FusionNames::add()
{
    (void)add_typed();
}

void FusionNames::rename()
{
    if (!m_cells->finish())
        return;
    const int fusion = chosen();
    if (fusion < 0) {
        (void)m_setup->rename(fusion, {}); // Tells what is missing.
        return focus_list();
    }
    m_list->setFocus();
    m_list->edit(m_model->index(fusion));
}

void FusionNames::remove()
{
    const int fusion = chosen();
    if (m_cells->finish() && m_setup->remove(fusion))
        show_names(fusion);
    focus_list();
}

} // namespace kindrel::desktop
