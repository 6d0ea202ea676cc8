#include "desktop/people/filter_item_details.h"

#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QComboBox>
#include <QCompleter>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QVBoxLayout>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::FilterItem;
using people::Marks;
using people::MinistryChoice;

namespace {

/// Rows of the choice of a value before those that people carry.
enum ValueRow { any_value, no_value };

const QStringList& ministry_words()
{
    static const QStringList words{u"Active or potential"_s, u"Active only"_s, u"Potential only"_s, u"Not active"_s,
                                   u"Not potential"_s};
    return words;
}

const QStringList& mark_words()
{
    static const QStringList words{u"Marked or not"_s, u"Marked only"_s, u"Unmarked only"_s};
    return words;
}

} // namespace

FilterItemDetails::FilterItemDetails(const people::FilterKindRow& kind, QWidget* parent)
    : QWidget(parent), m_title(make_heading({})), m_fields(new QWidget)
{
    auto* fields = new QVBoxLayout(m_fields);
    fields->setContentsMargins(0, 0, 0, 0);
    fields->setSpacing(space::field / 2);
    if (kind.has_states())
        m_ministry = add_choice(*fields, u"ministry_state"_s, u"S&tate in the ministry"_s, ministry_words());
    if (kind.has_marks())
        m_marks = add_choice(*fields, u"marks"_s, u"&Mark"_s, mark_words());
    if (kind.has_value())
        add_value(*fields);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field);
    column->addWidget(m_title);
    column->addWidget(m_fields);
    column->addStretch(1);
    show_nothing();
}

QComboBox* FilterItemDetails::add_choice(QVBoxLayout& column, const QString& name, const QString& caption,
                                         const QStringList& words)
{
    auto* box = new QComboBox;
    box->setObjectName(name);
    box->addItems(words);
    box->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    connect(box, &QComboBox::activated, this, &FilterItemDetails::chosen);
    auto* label = new QLabel(caption);
    label->setBuddy(box);
    box->setAccessibleName(QString(caption).remove(u'&'));
    column.addWidget(label);
    column.addWidget(box);
    return box;
}

void FilterItemDetails::add_value(QVBoxLayout& column)
{
    m_value = add_choice(column, u"value"_s, u"&Value"_s, {});
    m_value->setEditable(true);
    m_value->setInsertPolicy(QComboBox::NoInsert);
    m_value->completer()->setCaseSensitivity(Qt::CaseSensitive);
    connect(m_value->lineEdit(), &QLineEdit::textEdited, this, &FilterItemDetails::chosen);
    auto* another = new QPushButton(u"Or another value"_s);
    another->setObjectName(u"another_value"_s);
    another->setToolTip(u"People with either value are meant"_s);
    connect(another, &QPushButton::clicked, this, &FilterItemDetails::another_wanted);
    column.addWidget(another, 0, Qt::AlignLeft);
}

void FilterItemDetails::ask_for_value()
{
    m_value->clearEditText();
    m_value->setFocus(Qt::OtherFocusReason);
}

void FilterItemDetails::show_nothing()
{
    m_title->setText(u"No item is chosen"_s);
    m_fields->hide();
}

void FilterItemDetails::show_item(const FilterItem& item, const QStringList& values)
{
    m_title->setText(item.text);
    m_fields->show();
    if (m_ministry)
        m_ministry->setCurrentIndex(int(item.ministry));
    if (m_marks)
        m_marks->setCurrentIndex(int(item.marks));
    if (!m_value)
        return;
    m_value->clear();
    m_value->addItems(QStringList{u"Any value"_s, u"Without a value"_s} + values);
    m_value->setCurrentIndex(any_value);
    if (item.value && item.value->isEmpty())
        m_value->setCurrentIndex(no_value);
    else if (item.value)
        m_value->setEditText(*item.value);
}

std::optional<QString> FilterItemDetails::value() const
{
    const QString typed = m_value->currentText();
    if (typed.isEmpty() || typed == m_value->itemText(any_value))
        return std::nullopt;
    return typed == m_value->itemText(no_value) ? QString(u""_s) : typed;
}

void FilterItemDetails::read_into(FilterItem& item) const
{
    if (m_ministry)
        item.ministry = MinistryChoice(m_ministry->currentIndex());
    if (m_marks)
        item.marks = Marks(m_marks->currentIndex());
    if (m_value)
        item.value = value();
}

QString detail_words(const std::vector<FilterItem>& criteria)
{
    const FilterItem& item = criteria.front();
    QStringList words{QString()}, values;
    if (item.ministry != MinistryChoice::any)
        words += ministry_words()[int(item.ministry)].toLower();
    if (item.marks != Marks::any)
        words += mark_words()[int(item.marks)].toLower();
    for (const FilterItem& each : criteria)
        if (each.value)
            values += each.value->isEmpty() ? u"without a value"_s : u"= "_s + *each.value;
    if (!values.isEmpty())
        words += values.join(u" or "_s);
    return words.join(u", "_s);
}

} // namespace kindrel::desktop
