#include "desktop/shell/add_line.h"

#include "desktop/shell/look.h"

#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

AddLine::AddLine(const QStringList& captions, QWidget* parent) : QWidget(parent), m_row(new QHBoxLayout(this))
{
    m_row->setContentsMargins(0, 0, 0, 0);
    m_row->setSpacing(space::field);
    for (const QString& caption : captions) {
        const std::size_t place = m_fields.size();
        auto* field = new QLineEdit;
        field->setObjectName(u"new_%1"_s.arg(place));
        auto* label = new QLabel(place == 0 ? u"New %1"_s.arg(caption.toLower()) : caption);
        label->setBuddy(field);
        field->setAccessibleName(label->text());
        connect(field, &QLineEdit::textChanged, this, &AddLine::edited);
        connect(field, &QLineEdit::returnPressed, this, [this, place] { go_on_from(place); });
        m_row->addWidget(label);
        m_row->addWidget(field, place == 0 ? 3 : 1);
        m_fields.push_back(field);
    }
    setFocusProxy(m_fields.front());
}

void AddLine::add_button(QWidget* button)
{
    m_row->addWidget(button);
}

QStringList AddLine::texts() const
{
    QStringList texts;
    for (const QLineEdit* field : m_fields)
        texts += field->text();
    return texts;
}

bool AddLine::is_empty() const
{
    return texts().join(QString()).trimmed().isEmpty();
}

void AddLine::set_texts(const QStringList& texts)
{
    for (std::size_t place = 0; place < m_fields.size(); ++place)
        m_fields[place]->setText(texts.value(int(place)));
}

bool AddLine::lacks(std::size_t field) const
{
    return m_fields[field]->text().trimmed().isEmpty();
}

void AddLine::go_on_from(std::size_t field)
{
    if (!lacks(field) && field + 1 < m_fields.size() && lacks(field + 1))
        m_fields[field + 1]->setFocus();
    else
        Q_EMIT entered();
}

void AddLine::keyPressEvent(QKeyEvent* event)
{
    if (event->key() != Qt::Key_Return && event->key() != Qt::Key_Enter)
        QWidget::keyPressEvent(event);
}

void AddLine::focus_field(int place)
{
    QLineEdit* field = m_fields.at(std::size_t(place));
    field->setFocus();
    field->selectAll();
}

void AddLine::focus_lacking_field()
{
    std::size_t lacking = 0;
    while (lacking < m_fields.size() && !lacks(lacking))
        ++lacking;
    focus_field(lacking < m_fields.size() ? int(lacking) : 0);
}

} // namespace kindrel::desktop
