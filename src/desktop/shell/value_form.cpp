#include "desktop/shell/value_form.h"

#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"

#include <QGridLayout>
#include <QLabel>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int greatest_width = 520; // The mark stays near its value.
constexpr int caption_width = 96;
constexpr int longest_without_tip = 20;
constexpr int least_value_width = 80; // A long word must not push the window wider.

QWidget* make_hidden_mark()
{
    auto* mark = new QWidget;
    auto* row = new QHBoxLayout(mark);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(space::field / 2);
    auto* eye = new QLabel;
    eye->setPixmap(icon(u"view-hidden"_s).pixmap(16, 16));
    auto* word = new QLabel(hidden_mark());
    dress(*word, TextSize::secondary);
    row->addWidget(eye);
    row->addWidget(word);
    mark->setToolTip(u"Kept in the family file, left out of every list and report"_s);
    mark->hide();
    return mark;
}

} // namespace

QString hidden_mark()
{
    return u"hidden"_s;
}

QLabel* make_heading(const QString& text)
{
    auto* heading = new QLabel(text);
    dress(*heading, TextSize::group);
    return heading;
}

QLabel* make_value()
{
    auto* value = new QLabel;
    value->setTextFormat(Qt::PlainText);
    value->setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
    value->setWordWrap(true);
    return value;
}

ValueForm::ValueForm(const QString& title, const QStringList& captions, QWidget* parent)
    : QWidget(parent), m_grid(new QGridLayout(this))
{
    setMaximumWidth(greatest_width);
    m_grid->setContentsMargins(0, 0, 0, 0);
    m_grid->setHorizontalSpacing(space::margin);
    m_grid->setVerticalSpacing(space::field / 2);
    m_grid->setColumnMinimumWidth(0, caption_width);
    m_grid->setColumnStretch(1, 1);
    if (!title.isEmpty())
        m_grid->addWidget(make_heading(title), 0, 0, 1, 3);
    for (const auto& caption : captions)
        add_row(caption);
    m_grid->setRowStretch(m_grid->rowCount(), 1);
}

void ValueForm::add_row(const QString& caption)
{
    const int line = int(m_rows.size()) + 1;
    auto* words = new QLabel(caption);
    dress(*words, TextSize::secondary);
    auto* value = make_value();
    value->setAccessibleName(caption);
    value->setMinimumSize(least_value_width, value->fontMetrics().height());
    words->setBuddy(value);
    auto* hidden = make_hidden_mark();
    m_grid->addWidget(words, line, 0, Qt::AlignTop);
    m_grid->addWidget(value, line, 1, Qt::AlignTop);
    m_grid->addWidget(hidden, line, 2, Qt::AlignTop);
    m_rows.push_back({words, value, hidden});
}

void ValueForm::set(int row, const QString& value, bool hidden)
{
    const Row& place = m_rows.at(std::size_t(row));
    const bool wanted = !value.isEmpty() || !place.caption->text().isEmpty();
    place.caption->setVisible(wanted);
    place.value->setVisible(wanted);
    place.value->setText(value);
    place.value->setToolTip(value.size() > longest_without_tip ? value : QString());
    place.value->setFocusPolicy(value.isEmpty() ? Qt::NoFocus : Qt::StrongFocus);
    place.hidden->setVisible(hidden);
}

} // namespace kindrel::desktop
