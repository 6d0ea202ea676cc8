#include "desktop/people/layout_steps.h"

#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QCheckBox>
#include <QComboBox>
#include <QGridLayout>
#include <QLabel>
#include <QLineEdit>

#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using output::HeadParts;

namespace {

constexpr int longest_title = 80;
const QString paper_key = u"tagging/paper"_s;
const QString text_key = u"tagging/text_percent"_s;
const QString address_key = u"tagging/letter_address"_s;

struct PartRow
{
    bool HeadParts::*on;
    const char* name;
    const char* text;
};

constexpr std::array part_rows{
    PartRow{&HeadParts::date, "title_date", "The &date"},
    PartRow{&HeadParts::filters, "title_filters", "The fi&lters in use"},
    PartRow{&HeadParts::church, "title_church", "The church's na&me"},
    PartRow{&HeadParts::logo, "title_logo", "The lo&go"},
};

struct DetailRow
{
    people::Detail detail;
    const char* name;
    const char* text;
};

constexpr std::array detail_rows{
    DetailRow{people::Detail::addresses, "withhold_addresses", "&Addresses"},
    DetailRow{people::Detail::phones, "withhold_phones", "Phone and fa&x numbers"},
    DetailRow{people::Detail::emails, "withhold_emails", "E-mai&l addresses"},
    DetailRow{people::Detail::birth_dates, "withhold_birth_dates", "&Birth dates"},
    DetailRow{people::Detail::work, "withhold_work", "&Work and occupation"},
};

struct TextRow
{
    int percent;
    const char* text;
};

constexpr std::array text_rows{TextRow{85, "Small"}, TextRow{100, "As the report has it"}, TextRow{120, "Large"},
                               TextRow{140, "Very large"}};

struct AddressRow
{
    output::LetterAddress address;
    const char* text;
};

constexpr std::array address_rows{
    AddressRow{output::LetterAddress::mailing, "Postal, or residential where there is no other"},
    AddressRow{output::LetterAddress::residential, "Residential"},
    AddressRow{output::LetterAddress::postal, "Postal"},
};

} // namespace

HiddenPanel::HiddenPanel(TaggingSheet& sheet) : StepPanel(sheet, u"Hidden"_s)
{
    auto* column = make_step_column(*this, u"Leave out of reports"_s);
    for (const auto& row : detail_rows) {
        auto* detail = new QCheckBox(QString::fromLatin1(row.text));
        detail->setObjectName(QString::fromLatin1(row.name));
        connect(detail, &QCheckBox::toggled, this, [this, place = static_cast<std::size_t>(row.detail)](bool on) {
            this->sheet().options.withheld.set(place, on);
            Q_EMIT changed();
        });
        column->addWidget(detail);
        m_details.push_back(detail);
    }
    add_step_words(*column, u"What is marked as unlisted is left out of every report anyway."_s);
    column->addStretch(1);
}

void HiddenPanel::focus_first()
{
    m_details.front()->setFocus(Qt::OtherFocusReason);
}

TitlePanel::TitlePanel(Desk& desk, TaggingSheet& sheet)
    : StepPanel(sheet, u"Title"_s), m_desk(desk), m_title(new QLineEdit)
{
    m_title->setObjectName(u"report_title"_s);
    m_title->setAccessibleName(u"Title of the report"_s);
    m_title->setPlaceholderText(u"The report's own title"_s);
    m_title->setMaxLength(longest_title);
    connect(m_title, &QLineEdit::textChanged, this, &TitlePanel::take);
    auto* column = make_step_column(*this, u"Title"_s);
    column->addWidget(m_title);
    column->addWidget(make_heading(u"In the head of every page"_s));
    const auto church = HeadParts::of(desk.office.settings);
    for (const auto& row : part_rows) {
        auto* part = new QCheckBox(QString::fromLatin1(row.text));
        part->setObjectName(QString::fromLatin1(row.name));
        part->setChecked(church.*row.on);
        connect(part, &QCheckBox::toggled, this, &TitlePanel::take);
        column->addWidget(part);
        m_parts.push_back(part);
    }
    column->addStretch(1);
}

void TitlePanel::focus_first()
{
    m_title->setFocus(Qt::OtherFocusReason);
}

bool TitlePanel::is_set() const
{
    return !sheet().options.title.isEmpty() || sheet().options.head;
}

void TitlePanel::take()
{
    auto& options = sheet().options;
    options.title = m_title->text().trimmed();
    HeadParts parts;
    for (std::size_t row = 0; row < part_rows.size(); ++row)
        parts.*part_rows[row].on = m_parts[row]->isChecked();
    options.head = parts == HeadParts::of(m_desk.office.settings) ? std::nullopt : std::optional(parts);
    Q_EMIT changed();
}

FormatPanel::FormatPanel(Desk& desk, TaggingSheet& sheet)
    : StepPanel(sheet, u"Format"_s), m_desk(desk), m_paper(new QComboBox), m_text(new QComboBox),
      m_address(new QComboBox)
{
    m_paper->setObjectName(u"paper"_s);
    m_paper->addItems({u"A4"_s, u"Letter"_s});
    m_paper->setCurrentIndex(desk.remembered.value(paper_key, 0).toInt() == 1 ? 1 : 0);
    m_text->setObjectName(u"text_size"_s);
    for (const auto& row : text_rows)
        m_text->addItem(QString::fromLatin1(row.text), row.percent);
    m_text->setCurrentIndex(std::max(0, m_text->findData(desk.remembered.value(text_key, 100).toInt())));
    m_address->setObjectName(u"letter_address"_s);
    for (const auto& row : address_rows)
        m_address->addItem(QString::fromLatin1(row.text), int(row.address));
    m_address->setCurrentIndex(std::max(
        0, m_address->findData(desk.remembered.value(address_key, int(output::LetterAddress::mailing)).toInt())));
    auto* column = make_step_column(*this, u"Format"_s);
    auto* rows = new QGridLayout;
    rows->setSpacing(space::field);
    rows->setColumnStretch(1, 1);
    column->addLayout(rows);
    add_step_row(*rows, u"P&aper"_s, m_paper);
    add_step_row(*rows, u"Te&xt"_s, m_text);
    add_step_row(*rows, u"A&ddress in letters"_s, m_address);
    column->addStretch(1);
    take();
    for (QComboBox* choice : {m_paper, m_text, m_address})
        connect(choice, &QComboBox::currentIndexChanged, this, &FormatPanel::take);
}

void FormatPanel::focus_first()
{
    m_paper->setFocus(Qt::OtherFocusReason);
}

bool FormatPanel::is_set() const
{
    const auto& options = sheet().options;
    return options.paper != pages::Paper::a4 || options.text_percent != 100 ||
           options.address != output::LetterAddress::mailing;
}

void FormatPanel::take()
{
    auto& options = sheet().options;
    options.paper = pages::Paper(m_paper->currentIndex());
    options.text_percent = m_text->currentData().toInt();
    options.address = output::LetterAddress(m_address->currentData().toInt());
    m_desk.remembered.keep(paper_key, m_paper->currentIndex());
    m_desk.remembered.keep(text_key, options.text_percent);
    m_desk.remembered.keep(address_key, int(options.address));
    Q_EMIT changed();
}

} // namespace kindrel::desktop
