#include "desktop/people/quick_add_dialogs.h"

#include "desktop/people/setup_operations.h"
#include "desktop/shell/add_line.h"
#include "desktop/shell/look.h"
#include "people/quick_add.h"

#include <QDialogButtonBox>
#include <QPushButton>
#include <QVBoxLayout>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::SetupKind;

namespace {

constexpr int first_width = 460;

std::optional<int> add(core::Office& office, SetupKind kind, const QStringList& texts)
{
    return kind == SetupKind::suburbs ? people::add_new_suburb(office, texts.value(0), texts.value(1))
                                      : people::add_occupation(office, texts.value(0));
}

} // namespace

QuickAddDialog::QuickAddDialog(core::Office& office, SetupKind kind, const QStringList& texts, QWidget* parent)
    : QDialog(parent), m_office(office), m_kind(kind), m_line(new AddLine(setup_fields(kind)))
{
    const bool suburb = kind == SetupKind::suburbs;
    setObjectName(suburb ? u"add_new_suburb"_s : u"add_occupation"_s);
    setWindowTitle(suburb ? u"Add a new suburb"_s : u"Add an occupation"_s);
    m_line->set_texts(texts);
    auto* buttons = new QDialogButtonBox(QDialogButtonBox::Cancel);
    auto* button = buttons->addButton(u"&Add"_s, QDialogButtonBox::AcceptRole);
    button->setObjectName(u"add"_s);
    button->setAutoDefault(false); // Enter goes on to the next field first.
    buttons->button(QDialogButtonBox::Cancel)->setAutoDefault(false);
    connect(m_line, &AddLine::entered, this, &QDialog::accept);
    connect(buttons, &QDialogButtonBox::accepted, this, &QDialog::accept);
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);

    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(space::group, space::group, space::group, space::margin);
    column->setSpacing(space::group);
    column->addWidget(m_line);
    column->addWidget(buttons);
    resize(first_width, sizeHint().height());
    m_line->focus_lacking_field();
}

void QuickAddDialog::accept()
{
    try {
        m_key = add(m_office, m_kind, m_line->texts());
    } catch (const core::DatabaseError& error) {
        m_office.dialogue.show({u"Unable to add this item"_s, error.text()});
    }
    if (m_key)
        QDialog::accept();
    else
        m_line->focus_field(people::faulty_field(m_kind, m_line->texts().value(0), m_line->texts().value(1)));
}

std::optional<int> ask_for_new_item(core::Office& office, SetupKind kind, const QStringList& texts, QWidget* parent)
{
    QuickAddDialog dialog(office, kind, texts, parent);
    dialog.exec();
    return dialog.key();
}

} // namespace kindrel::desktop
