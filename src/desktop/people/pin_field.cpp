#include "desktop/people/pin_field.h"

#include "desktop/shell/look.h"
#include "people/pins.h"

#include <QHBoxLayout>
#include <QPushButton>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int pin_width = 96;
constexpr int button_width = 72;

} // namespace

PinField::PinField(EditorBench& bench)
    : m_bench(bench), m_link(field_link(bench, "personal_pin", &people::Person::personal_pin)), m_pin(new TypedLine),
      m_buttons(new QWidget)
{
    m_pin->setObjectName(u"personal_pin"_s);
    keep_width(*m_pin, pin_width);
    connect(m_pin, &QLineEdit::textEdited, this,
            [change = m_link.change](const QString& typed) { change(people::tidy_pin(typed)); });
    auto* row = new QHBoxLayout(m_buttons);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(space::field);
    const auto add = [&](const QString& name, const QString& text, const QString& tip, auto act) {
        auto* button = new QPushButton(text);
        button->setObjectName(name);
        button->setToolTip(tip);
        keep_width(*button, button_width);
        connect(button, &QPushButton::clicked, this, act);
        row->addWidget(button);
    };
    add(u"new_pin"_s, u"New"_s, u"Take the next number that nobody has"_s, [this] { take_new(); });
    add(u"check_pin"_s, u"Check"_s, u"See whether anybody else has this number"_s,
        [this] { people::check_pin(m_bench.desk.office, m_bench.editor.file(), m_bench.person()); });
    row->addStretch(1);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->addWidget(m_pin);
    setFocusProxy(m_pin);
}

void PinField::show_file()
{
    m_pin->show_text(m_link.value());
    m_pin->setAccessibleName(accessibleName());
    setVisible(m_bench.editor.file().access.pin);
    m_buttons->setVisible(m_bench.editor.file().access.pin);
}

void PinField::take_new()
{
    if (m_bench.editor.set_new_pin(m_bench.person()))
        m_bench.show_again();
}

} // namespace kindrel::desktop
