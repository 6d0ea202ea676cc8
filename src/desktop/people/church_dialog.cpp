#include "desktop/people/church_dialog.h"

#include "desktop/shell/look.h"
#include "people/move_family.h"

#include <QApplication>
#include <QDialogButtonBox>
#include <QKeyEvent>
#include <QLabel>
#include <QListWidget>
#include <QVBoxLayout>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr QSize first_size{380, 300};

}

ChurchDialog::ChurchDialog(const core::Office& office, QWidget* parent) : QDialog(parent), m_churches(new QListWidget)
{
    setObjectName(u"other_church"_s);
    setWindowTitle(u"Move to another church"_s);
    const auto churches = people::other_churches(office);
    auto* words = new QLabel(churches.empty() ? u"There is no other church to move the family to"_s
                                              : u"&Church that the family moves to"_s);
    words->setBuddy(m_churches);
    m_churches->setObjectName(u"churches"_s);
    m_churches->setAccessibleName(u"Churches"_s);
    for (const auto& [church, name] : churches) {
        auto* row = new QListWidgetItem(name, m_churches);
        row->setData(Qt::UserRole, church);
    }
    auto* buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
    connect(buttons, &QDialogButtonBox::accepted, this, &QDialog::accept);
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    connect(m_churches, &QListWidget::itemDoubleClicked, this, &QDialog::accept);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(space::group, space::group, space::group, space::margin);
    column->setSpacing(space::field);
    column->addWidget(words);
    column->addWidget(m_churches, 1);
    column->addWidget(buttons);
    resize(first_size);
    m_churches->installEventFilter(this);
    m_churches->setFocus();
}

bool ChurchDialog::eventFilter(QObject* target, QEvent* event)
{
    const bool key = target == m_churches && event->type() == QEvent::KeyPress;
    if (!key || static_cast<QKeyEvent*>(event)->key() != Qt::Key_Down || !m_churches->selectedItems().empty())
        return QDialog::eventFilter(target, event);
    m_churches->setCurrentRow(0); // The first Down chooses the first church, also where it is the only one.
    return true;
}

ChurchChoice ChurchDialog::choice() const
{
    if (result() != Accepted)
        return {};
    const auto chosen = m_churches->selectedItems();
    return {.cancelled = false,
            .church = chosen.empty() ? std::nullopt : std::optional(chosen.front()->data(Qt::UserRole).toInt())};
}

ChurchChoice choose_other_church(Desk& desk)
{
    ChurchDialog dialog(desk.office, QApplication::activeWindow());
    dialog.exec();
    return dialog.choice();
}

} // namespace kindrel::desktop
