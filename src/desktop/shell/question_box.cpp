#include "desktop/shell/question_box.h"

#include "desktop/shell/look.h"

#include <QDialogButtonBox>
#include <QLabel>
#include <QRegularExpression>
#include <QVBoxLayout>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int least_width = 420;

QLabel* plain_label(const QString& text)
{
    auto* label = new QLabel(text);
    label->setTextFormat(Qt::PlainText);
    label->setWordWrap(true);
    return label;
}

} // namespace

QString icon_name(core::Icon icon)
{
    switch (icon) {
    case core::Icon::information:
        return u"dialog-information"_s;
    case core::Icon::question:
        return u"dialog-question"_s;
    case core::Icon::caution:
        break;
    }
    return u"dialog-warning"_s;
}

QString suffix_of(const QString& filter)
{
    static const QRegularExpression pattern(u"\\*\\.(\\w+)"_s);
    return pattern.match(filter).captured(1);
}

QuestionBox::QuestionBox(const core::Message& message, QWidget* answer, QWidget* parent, const Stopwatch& now)
    : QDialog(parent)
{
    setWindowTitle(message.caption);
    setMinimumWidth(least_width);
    auto* question = plain_label(message.text);
    question->setBuddy(answer);
    answer->setAccessibleName(message.text);
    auto* buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
    connect(buttons, &QDialogButtonBox::accepted, this, &QDialog::accept);
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);

    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(space::group, space::group, space::group, space::margin);
    column->setSpacing(space::margin);
    column->addWidget(question);
    if (!message.more.isEmpty())
        column->addWidget(plain_label(message.more));
    column->addWidget(answer, 1);
    column->addWidget(buttons);
    answer->setFocus();
    new InputGuard(*this, now);
}

} // namespace kindrel::desktop
