#include "desktop/people/group_details_dialog.h"

#include "desktop/shell/look.h"

#include <QDialogButtonBox>
#include <QGridLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPlainTextEdit>

#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::GroupDetails;

namespace {

constexpr int first_width = 600;
constexpr int comment_lines = 5;

/// One line of the form: the left or right half of a row, or the whole of it.
struct Line
{
    const char* label;
    QString GroupDetails::*member;
    int row, half;
    bool whole = false;
};

constexpr std::array form{
    Line{"&Day", &GroupDetails::Day, 0, 0},
    Line{"&Time", &GroupDetails::Time, 0, 1},
    Line{"&Frequency", &GroupDetails::Frequency, 1, 0, true},
    Line{"&Address", &GroupDetails::Address, 2, 0, true},
    Line{"&Leader", &GroupDetails::leader, 3, 0},
    Line{"Phone", &GroupDetails::leader_phone, 3, 1},
    Line{"A&ssistant leader", &GroupDetails::assistant_leader, 4, 0},
    Line{"Phone", &GroupDetails::assistant_leader_phone, 4, 1},
    Line{"&Host", &GroupDetails::host, 5, 0},
    Line{"Phone", &GroupDetails::host_phone, 5, 1},
};
constexpr int comments_row = 6;

QLabel* label_of(const QString& text, QWidget& buddy)
{
    auto* label = new QLabel(text);
    label->setBuddy(&buddy);
    return label;
}

} // namespace

GroupDetailsDialog::GroupDetailsDialog(core::Office& office, int group_id, const QString& group, QWidget* parent)
    : QDialog(parent), m_office(office), m_stored(people::load_group_details(*office.session, group_id)),
      m_comments(new QPlainTextEdit(m_stored.comments))
{
    setObjectName(u"group_details"_s);
    setWindowTitle(u"Group details"_s);
    auto* title = new QLabel(group);
    title->setTextFormat(Qt::PlainText);
    title->setWordWrap(true);
    dress(*title, TextSize::title);
    auto* buttons = new QDialogButtonBox(QDialogButtonBox::Save | QDialogButtonBox::Cancel);
    connect(buttons, &QDialogButtonBox::accepted, this, &QDialog::accept);
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);

    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(space::group, space::group, space::group, space::margin);
    column->setSpacing(space::group);
    column->addWidget(title);
    column->addLayout(make_fields(), 1);
    column->addWidget(buttons);
    resize(first_width, sizeHint().height());
    m_lines.front()->setFocus();
}

QGridLayout* GroupDetailsDialog::make_fields()
{
    auto* grid = new QGridLayout;
    grid->setHorizontalSpacing(space::margin);
    grid->setVerticalSpacing(space::field);
    grid->setColumnStretch(1, 3);
    grid->setColumnStretch(3, 2);
    for (const Line& line : form) {
        auto* field = new QLineEdit(m_stored.*line.member);
        auto* label = label_of(QString::fromLatin1(line.label), *field);
        grid->addWidget(label, line.row, 2 * line.half, Qt::AlignRight);
        grid->addWidget(field, line.row, 2 * line.half + 1, 1, line.whole ? 3 : 1);
        m_lines.push_back(field);
    }
    m_comments->setObjectName(u"comments"_s);
    m_comments->setTabChangesFocus(true);
    m_comments->setMinimumHeight(comment_lines * m_comments->fontMetrics().lineSpacing() + 2 * space::field);
    grid->addWidget(label_of(u"&Comments"_s, *m_comments), comments_row, 0, Qt::AlignRight | Qt::AlignTop);
    grid->addWidget(m_comments, comments_row, 1, 1, 3);
    grid->setRowStretch(comments_row, 1);
    return grid;
}

GroupDetails GroupDetailsDialog::typed() const
{
    GroupDetails details = m_stored;
    for (std::size_t i = 0; i < form.size(); ++i)
        details.*form[i].member = m_lines[i]->text();
    details.comments = m_comments->toPlainText();
    return details;
}

void GroupDetailsDialog::accept()
{
    try {
        if (people::save_group_details(m_office, typed()))
            QDialog::accept();
    } catch (const core::DatabaseError& error) {
        m_office.dialogue.show({u"Unable to save the details of this group"_s, error.text()});
    }
}

void GroupDetailsDialog::reject()
{
    if (typed() == m_stored)
        return QDialog::reject();
    const core::Message question{.text = u"Do you wish to save the changes made to the details of this group?"_s,
                                 .icon = core::Icon::question};
    const auto wanted = m_office.dialogue.confirm_or_cancel(question);
    if (!wanted)
        return;
    if (*wanted)
        accept();
    else
        QDialog::reject();
}

} // namespace kindrel::desktop
