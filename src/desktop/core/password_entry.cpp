#include "desktop/core/password_entry.h"

#include "desktop/shell/chip.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

/// Shorter ones are soon found by trying.
constexpr qsizetype good_length = 12;

QString hint_of(const QString& first, const QString& second)
{
    if (first.isEmpty())
        return u"Three or four words that do not belong together are easy to keep and hard to guess."_s;
    if (first == second)
        return u"Both are the same."_s;
    if (first.size() < good_length)
        return u"%1 of at least %2 characters that make it hard to guess."_s.arg(first.size()).arg(good_length);
    return u"%1 characters: hard to guess. Type it again below."_s.arg(first.size());
}

/// Takes the text out of the field, and out of what the field could bring back.
QString taken_out(QLineEdit& field)
{
    QString text = field.text();
    field.setText({});
    return text;
}

} // namespace

PasswordEntry::PasswordEntry(QWidget* parent) : QWidget(parent), m_hint(new QLabel), m_difference(new Chip)
{
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field / 2);
    column->addWidget(make_heading(u"New password"_s));
    m_first = add_field(*column, u"&Password"_s, u"password"_s);
    m_second = add_field(*column, u"The same a&gain"_s, u"password_again"_s);
    dress(*m_hint, TextSize::secondary);
    m_hint->setObjectName(u"hint"_s);
    m_hint->setWordWrap(true);
    m_hint->setAlignment(Qt::AlignTop | Qt::AlignLeft);
    m_hint->setMinimumHeight(2 * m_hint->fontMetrics().lineSpacing());
    column->addWidget(m_difference);
    column->addWidget(m_hint);
    column->addSpacing(space::field / 2);
    column->addLayout(make_buttons());
    connect(m_first, &QLineEdit::returnPressed, this, [this] {
        if (m_second->text().isEmpty() && !m_first->text().isEmpty())
            m_second->setFocus(Qt::OtherFocusReason);
        else
            go_on();
    });
    connect(m_second, &QLineEdit::returnPressed, this, &PasswordEntry::go_on);
    show_hint();
}

QLineEdit* PasswordEntry::add_field(QBoxLayout& column, const QString& caption, const QString& name)
{
    auto* field = new QLineEdit;
    field->setObjectName(name);
    field->setEchoMode(QLineEdit::Password);
    field->setAccessibleName(QString(caption).remove(u'&'));
    connect(field, &QLineEdit::textChanged, this, &PasswordEntry::show_hint);
    auto* words = new QLabel(caption);
    words->setBuddy(field);
    column.addWidget(words);
    column.addWidget(field);
    return field;
}

QBoxLayout* PasswordEntry::make_buttons()
{
    auto* add = new QPushButton(icon(u"list-add"_s), u"&Add"_s);
    add->setObjectName(u"add"_s);
    add->setToolTip(u"Adds a password to the list (Enter)"_s);
    connect(add, &QPushButton::clicked, this, &PasswordEntry::go_on);
    auto* change = new QPushButton(u"C&hange the chosen one"_s);
    change->setObjectName(u"change"_s);
    change->setToolTip(u"Puts it in place of the password that is chosen in the list"_s);
    connect(change, &QPushButton::clicked, this, [this] {
        if (agreed())
            Q_EMIT change_wanted();
    });
    auto* row = new QHBoxLayout;
    row->setSpacing(space::field);
    row->addWidget(add);
    row->addWidget(change, 1);
    return row;
}

QString PasswordEntry::take()
{
    taken_out(*m_second).fill(QChar::Null);
    return taken_out(*m_first);
}

void PasswordEntry::start()
{
    m_first->setFocus(Qt::OtherFocusReason);
}

void PasswordEntry::go_on()
{
    if (agreed())
        Q_EMIT add_wanted();
}

bool PasswordEntry::agreed()
{
    if (m_first->text() == m_second->text())
        return true;
    m_difference->set(u"Not the same"_s, State::error);
    m_hint->setText(u"Both fields must hold the same password. Type it again."_s);
    m_second->setFocus(Qt::OtherFocusReason);
    m_second->selectAll();
    return false;
}

void PasswordEntry::show_hint()
{
    m_difference->set({}, State::error);
    m_hint->setText(hint_of(m_first->text(), m_second->text()));
}

} // namespace kindrel::desktop
