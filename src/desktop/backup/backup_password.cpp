#include "desktop/backup/backup_password.h"

#include "desktop/core/setup_form.h"
#include "desktop/shell/chip.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QBoxLayout>
#include <QLabel>
#include <QLineEdit>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

const QString open_to_all = u"Without a password everybody who gets hold of the backup can read it."_s;
const QString kept_nowhere =
    u"Without this password nobody can open the backup, neither you nor anybody else. It is kept nowhere: write it "
    "down and keep it apart from the backup."_s;
const QString type_again = u"Both fields must hold the same password. Type it again."_s;

} // namespace

BackupPassword::BackupPassword() : m_difference(new Chip), m_warning(make_explanation(open_to_all))
{
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field / 2);
    column->addWidget(make_heading(u"Password, if it is to be encrypted"_s));
    auto* row = new QHBoxLayout;
    row->setSpacing(space::margin);
    m_first = add_field(*row, u"Pass&word"_s, u"password"_s);
    m_second = add_field(*row, u"The same a&gain"_s, u"password_again"_s);
    column->addLayout(row);
    column->addWidget(m_difference);
    m_warning->setObjectName(u"password_warning"_s);
    m_warning->setAlignment(Qt::AlignTop | Qt::AlignLeft);
    m_warning->setMinimumHeight(3 * m_warning->fontMetrics().lineSpacing());
    column->addWidget(m_warning);
    connect(m_first, &QLineEdit::returnPressed, this, [this] {
        if (m_first->text().isEmpty())
            Q_EMIT finished();
        else
            m_second->setFocus(Qt::OtherFocusReason);
    });
    connect(m_second, &QLineEdit::returnPressed, this, &BackupPassword::finished);
}

QLineEdit* BackupPassword::add_field(QBoxLayout& row, const QString& caption, const QString& name)
{
    auto* field = new QLineEdit;
    field->setObjectName(name);
    field->setEchoMode(QLineEdit::Password);
    connect(field, &QLineEdit::textChanged, this, &BackupPassword::show_warning);
    auto* column = new QVBoxLayout;
    column->setSpacing(space::field / 2);
    add_below_caption(*column, caption, field);
    row.addLayout(column);
    return field;
}

bool BackupPassword::agreed()
{
    if (m_first->text() == m_second->text())
        return true;
    m_difference->set(u"Not the same"_s, State::error);
    m_warning->setText(type_again);
    m_second->setFocus(Qt::OtherFocusReason);
    m_second->selectAll();
    return false;
}

QString BackupPassword::password() const
{
    return m_first->text();
}

void BackupPassword::clear()
{
    m_first->setText({});
    m_second->setText({});
}

void BackupPassword::show_warning()
{
    m_difference->set({}, State::error);
    m_warning->setText(m_first->text().isEmpty() ? open_to_all : kept_nowhere);
}

} // namespace kindrel::desktop
