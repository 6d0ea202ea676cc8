#include "desktop/people/step_bar.h"

#include "desktop/shell/look.h"

#include <QHBoxLayout>
#include <QPushButton>

#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

struct StepRow
{
    const char* name;
    const char* text;
    const char* tip;
};

constexpr std::array<StepRow, StepBar::step_count> step_rows{{
    {"filter", "&Filter", "Choose the people"},
    {"sort", "&Sort", "Put them in order, and search by date and family type"},
    {"hidden", "&Hidden", "What reports leave out beyond what is unlisted"},
    {"range", "Ra&nge", "Take a part of the list"},
    {"title", "T&itle", "What heads a report"},
    {"format", "F&ormat", "Paper and text size of a report"},
    {"suppress", "Su&ppress", "Leave out people without an address, a phone number and so on"},
    {"process", "Proc&ess", "Make a report, or give the people something or take it from them"},
}};

} // namespace

StepBar::StepBar(QWidget* parent) : QWidget(parent)
{
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(space::field / 2);
    for (int step = 0; step < step_count; ++step) {
        const auto& definition = step_rows[std::size_t(step)];
        auto* button = new QPushButton(QString::fromLatin1(definition.text));
        button->setObjectName(QString::fromLatin1(definition.name));
        button->setToolTip(QString::fromLatin1(definition.tip));
        button->setCheckable(true);
        connect(button, &QPushButton::clicked, this, [this, step] {
            open(m_open); // The button itself chooses nothing.
            Q_EMIT wanted(Step(step));
        });
        m_buttons.push_back(button);
        row->addWidget(button, 1);
    }
    open(filter);
}

void StepBar::open(Step step)
{
    m_open = step;
    for (int place = 0; place < step_count; ++place)
        m_buttons[std::size_t(place)]->setChecked(place == step);
}

void StepBar::mark(Step step, bool set)
{
    const QString text = QString::fromLatin1(step_rows[std::size_t(step)].text);
    m_buttons[std::size_t(step)]->setText(set ? text + u" \u2713"_s : text);
}

} // namespace kindrel::desktop
