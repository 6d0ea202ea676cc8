#include "desktop/core/user_details.h"

#include "desktop/core/access_areas.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QBoxLayout>
#include <QCheckBox>
#include <QGridLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPlainTextEdit>
#include <QSignalBlocker>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int people_lines = 3;

QLabel* make_caption(const QString& text, QWidget& field)
{
    auto* caption = new QLabel(text);
    caption->setBuddy(&field);
    field.setAccessibleName(QString(text).remove(u'&'));
    return caption;
}

QLabel* make_small_heading(const QString& text)
{
    auto* heading = new QLabel(text);
    QFont bold = heading->font();
    bold.setBold(true);
    heading->setFont(bold);
    return heading;
}

} // namespace

UserDetails::UserDetails()
    : m_title(make_heading({})), m_people(new QPlainTextEdit), m_email_name(make_line(u"email_name"_s)),
      m_email_address(make_line(u"email_address"_s)), m_areas(new AccessAreas)
{
    m_title->setObjectName(u"user_title"_s);
    m_title->setTextFormat(Qt::PlainText);
    m_title->setWordWrap(true);
    auto* owner = new QHBoxLayout;
    owner->setSpacing(space::group);
    owner->addLayout(make_people(), 1);
    owner->addLayout(make_email(), 1);
    auto* details = new QWidget;
    auto* column = new QVBoxLayout(details);
    column->setContentsMargins(0, 0, space::group, space::group);
    column->setSpacing(space::field);
    column->addWidget(m_title);
    column->addLayout(owner);
    column->addSpacing(space::field);
    column->addWidget(make_heading(u"Access areas"_s));
    column->addWidget(m_areas);
    column->addStretch(1);

    setWidgetResizable(true);
    setFrameShape(QFrame::NoFrame);
    setFocusPolicy(Qt::NoFocus);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setWidget(details);
    details->setAutoFillBackground(false);
    viewport()->setAutoFillBackground(false);
}

QBoxLayout* UserDetails::make_people()
{
    m_people->setObjectName(u"people"_s);
    m_people->setTabChangesFocus(true);
    m_people->setFixedHeight(people_lines * m_people->fontMetrics().lineSpacing() + space::group);
    connect(m_people, &QPlainTextEdit::textChanged, this, &UserDetails::tell_people);
    auto* column = new QVBoxLayout;
    column->setSpacing(space::field / 2);
    column->addWidget(make_caption(u"&Belongs to, one person a line"_s, *m_people));
    column->addWidget(m_people);
    column->addStretch(1);
    return column;
}

QBoxLayout* UserDetails::make_email()
{
    auto* grid = new QGridLayout;
    grid->setHorizontalSpacing(space::field);
    grid->setVerticalSpacing(space::field / 2);
    grid->addWidget(make_caption(u"&Name"_s, *m_email_name), 0, 0);
    grid->addWidget(m_email_name, 0, 1);
    grid->addWidget(make_caption(u"Addr&ess"_s, *m_email_address), 1, 0);
    grid->addWidget(m_email_address, 1, 1);
    auto* column = new QVBoxLayout;
    column->setSpacing(space::field / 2);
    column->addWidget(make_small_heading(u"Sends e-mail as"_s));
    column->addLayout(grid);
    column->addStretch(1);
    return column;
}

QLineEdit* UserDetails::make_line(const QString& name)
{
    auto* line = new QLineEdit;
    line->setObjectName(name);
    line->setPlaceholderText(u"as the church"_s);
    connect(line, &QLineEdit::textEdited, this,
            [this] { Q_EMIT email_edited(m_email_name->text(), m_email_address->text()); });
    return line;
}

void UserDetails::tell_people()
{
    Q_EMIT people_edited(m_people->toPlainText().split(u'\n'));
}

void UserDetails::show_user(const QString& title, const core::User& user)
{
    const QSignalBlocker quiet(m_people);
    set_title(title);
    m_people->setPlainText(user.people.join(u'\n'));
    m_email_name->setText(user.email_name);
    m_email_address->setText(user.email_address);
    m_areas->show_rights(user.areas);
}

void UserDetails::set_title(const QString& title)
{
    m_title->setText(title);
}

void UserDetails::focus_people()
{
    m_people->setFocus(Qt::OtherFocusReason);
}

void UserDetails::focus_area(core::Area area)
{
    QCheckBox& box = m_areas->box(area);
    box.setFocus(Qt::OtherFocusReason);
    ensureWidgetVisible(&box);
}

} // namespace kindrel::desktop
