#include "desktop/people/list_steps.h"

#include "desktop/shell/look.h"

#include <QCheckBox>
#include <QGridLayout>
#include <QIntValidator>
#include <QLineEdit>

#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::Needs;

namespace {

constexpr int most_places = 999'999;

struct NeedRow
{
    bool Needs::*on;
    const char* name;
    const char* text;
    std::optional<core::Area> right;
};

constexpr std::array need_rows{
    NeedRow{&Needs::address, "needs_address", "an &address", std::nullopt},
    NeedRow{&Needs::phone, "needs_phone", "a phone numbe&r", std::nullopt},
    NeedRow{&Needs::email, "needs_email", "an e-&mail address", std::nullopt},
    NeedRow{&Needs::birth_date, "needs_birth_date", "a &birth date", core::Area::birth_dates},
};

QLineEdit* make_line(const QString& name, QGridLayout& rows, const QString& caption)
{
    auto* line = new QLineEdit;
    line->setObjectName(name);
    add_step_row(rows, caption, line);
    return line;
}

std::optional<int> number_of(const QLineEdit& line)
{
    return line.text().isEmpty() ? std::nullopt : std::optional(std::max(1, line.text().toInt()));
}

} // namespace

RangePanel::RangePanel(TaggingSheet& sheet) : StepPanel(sheet, u"Range"_s)
{
    auto* column = make_step_column(*this, u"Range"_s);
    auto* rows = new QGridLayout;
    rows->setSpacing(space::field);
    column->addLayout(rows);
    m_first_letter = make_line(u"first_letter"_s, *rows, u"Surna&mes from"_s);
    m_last_letter = make_line(u"last_letter"_s, *rows, u"up &to"_s);
    m_first = make_line(u"first_place"_s, *rows, u"Pl&aces from"_s);
    m_last = make_line(u"last_place"_s, *rows, u"up to p&lace"_s);
    for (QLineEdit* place : {m_first, m_last})
        place->setValidator(new QIntValidator(1, most_places, place));
    for (QLineEdit* line : {m_first_letter, m_last_letter, m_first, m_last})
        connect(line, &QLineEdit::textChanged, this, &RangePanel::take);
    add_step_words(*column,
                   u"Letters or beginnings of surnames, both included: the family's, or in the order Individual the "
                   "person's own. Places are counted among the people whose surnames fit, in the order of the list. "
                   "What is left empty is open."_s);
    column->addStretch(1);
}

void RangePanel::focus_first()
{
    m_first_letter->setFocus(Qt::OtherFocusReason);
}

void RangePanel::take()
{
    sheet().plan.range = {.first_letter = m_first_letter->text().trimmed(),
                          .last_letter = m_last_letter->text().trimmed(),
                          .first = number_of(*m_first),
                          .last = number_of(*m_last)};
    Q_EMIT changed();
}

SuppressPanel::SuppressPanel(Desk& desk, TaggingSheet& sheet) : StepPanel(sheet, u"Suppress"_s)
{
    auto* column = make_step_column(*this, u"Leave out people without"_s);
    for (const auto& row : need_rows) {
        if (row.right && !desk.office.may(*row.right))
            continue;
        auto* need = new QCheckBox(QString::fromLatin1(row.text));
        need->setObjectName(QString::fromLatin1(row.name));
        connect(need, &QCheckBox::toggled, this, [this, on = row.on](bool wanted) {
            this->sheet().plan.needs.*on = wanted;
            Q_EMIT changed();
        });
        column->addWidget(need);
        m_needs.push_back(need);
    }
    add_step_words(*column, u"Of the person or of the family. What is unlisted does not count."_s);
    column->addStretch(1);
}

void SuppressPanel::focus_first()
{
    m_needs.front()->setFocus(Qt::OtherFocusReason);
}

} // namespace kindrel::desktop
