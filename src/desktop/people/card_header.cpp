#include "desktop/people/card_header.h"

#include "desktop/people/card_text.h"
#include "desktop/people/status_words.h"
#include "desktop/shell/chip.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"
#include "people/names.h"

#include <QHBoxLayout>
#include <QLabel>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

CardHeader::CardHeader(QWidget* parent)
    : QWidget(parent), m_surname(make_value()), m_status(new Chip), m_booked_out(new Chip), m_dates(make_value()),
      m_note(make_value())
{
    dress(*m_surname, TextSize::title);
    m_surname->setWordWrap(false);
    dress(*m_dates, TextSize::secondary);
    m_dates->setWordWrap(false);
    dress(*m_note, TextSize::secondary);

    auto* line = new QHBoxLayout;
    line->setSpacing(space::margin);
    line->addWidget(m_surname);
    line->addWidget(m_status);
    line->addWidget(m_booked_out);
    line->addStretch(1);
    line->addWidget(m_dates);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(space::group, space::margin, space::group, space::margin);
    column->setSpacing(space::field / 2);
    column->addLayout(line);
    column->addWidget(m_note);
}

void CardHeader::show_family(const people::Family& family, core::DayOrder order)
{
    m_surname->setText(family.surname);
    m_status->set(status_word(family.Condition), state_of(family.Condition));
    m_booked_out->set(family.booked_out ? u"\u2192 Booked out"_s : QString(), State::booked_out);
    m_dates->setText(file_dates(family, order));
    m_note->setText(people::booked_out_note(family, order).trimmed());
    m_note->setVisible(family.booked_out);
}

} // namespace kindrel::desktop
