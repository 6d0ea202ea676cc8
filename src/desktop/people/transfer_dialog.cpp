#include "desktop/people/transfer_dialog.h"

#include "desktop/people/family_list.h"
#include "desktop/shell/look.h"

#include <QApplication>
#include <QDialogButtonBox>
#include <QLabel>
#include <QPushButton>
#include <QTableView>
#include <QVBoxLayout>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr QSize first_size{760, 480};

}

TransferDialog::TransferDialog(Desk& desk, int except, QWidget* parent)
    : QDialog(parent), m_except(except), m_list(new FamilyListWidget(desk)), m_words(new QLabel)
{
    setObjectName(u"transfer"_s);
    setWindowTitle(u"Transfer into which family?"_s);
    dress(*m_words, TextSize::secondary);
    auto* buttons = new QDialogButtonBox(QDialogButtonBox::Cancel);
    auto* choose = buttons->addButton(u"&Transfer"_s, QDialogButtonBox::AcceptRole);
    choose->setObjectName(u"choose"_s);
    for (QAbstractButton* button : buttons->buttons())
        static_cast<QPushButton*>(button)->setAutoDefault(false); // Enter belongs to the list.
    connect(buttons, &QDialogButtonBox::accepted, this, [this] { take(m_list->view().currentIndex().row()); });
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    connect(m_list, &FamilyListWidget::opened, this, &TransferDialog::take);
    connect(m_list, &FamilyListWidget::shown_changed, this, [this] { m_words->setText(m_list->count_words()); });

    auto* bottom = new QHBoxLayout;
    bottom->addWidget(m_words, 1);
    bottom->addWidget(buttons);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(space::group, space::group, space::group, space::margin);
    column->setSpacing(space::margin);
    column->addWidget(m_list, 1);
    column->addLayout(bottom);
    resize(first_size);
    m_list->choose(people::FamilyList::active);
    m_list->focus_filter();
}

void TransferDialog::take(int row)
{
    if (row < 0)
        return;
    const int family = m_list->model().entry(row).Surname_ID;
    if (family == m_except) {
        m_words->setText(u"The person is in this family already."_s);
        return;
    }
    m_family = family;
    accept();
}

std::optional<int> choose_family(Desk& desk, int except)
{
    TransferDialog dialog(desk, except, QApplication::activeWindow());
    dialog.exec();
    return dialog.family();
}

} // namespace kindrel::desktop
