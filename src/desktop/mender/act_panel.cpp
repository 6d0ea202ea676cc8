#include "desktop/mender/act_panel.h"

#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/side_panel.h"

#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int panel_width = 248;

struct OfferedAct
{
    MenderAct act;
    const char16_t *name, *text, *icon, *explanation;
};
constexpr std::array offered{
    OfferedAct{MenderAct::mend, u"mend", u"&Mend", u"settings-configure",
               u"Puts right what can be put right. A copy of the database is laid down first."},
    OfferedAct{MenderAct::unlock, u"unlock", u"Remove &locks and markers", u"object-unlocked",
               u"Lets people in again after a program or workstation failed. Nobody may be at work in the church."},
    OfferedAct{MenderAct::recover, u"recover", u"Rec&over what can be read…", u"document-import",
               u"Writes what can be read of a damaged church file into a new one. The damaged file stays as it is."},
    OfferedAct{
        MenderAct::put_in_place, u"put_in_place", u"&Put recovered file in place", u"go-next",
        u"Gives it to the church and mends that. The file that was there is moved into the church's folder 'mended'."},
    OfferedAct{MenderAct::set_aside, u"set_aside", u"Set damaged file &aside", u"edit-undo",
               u"Moves it into the church's folder 'mended', so that Kindrel starts and a backup can be put back."},
};

QLabel* make_explanation(const QString& text)
{
    auto* words = new QLabel(text);
    words->setTextFormat(Qt::PlainText);
    words->setWordWrap(true);
    dress(*words, TextSize::secondary);
    return words;
}

} // namespace

ActPanel::ActPanel()
{
    auto* column = new QVBoxLayout;
    column->setContentsMargins(0, 0, space::field, 0);
    column->setSpacing(space::field / 2);
    for (const auto& act : offered) {
        auto* button = new QPushButton(icon(QString::fromUtf16(act.icon)), QString::fromUtf16(act.text));
        button->setObjectName(QString::fromUtf16(act.name));
        button->setAccessibleDescription(QString::fromUtf16(act.explanation));
        button->setAutoDefault(true); // Enter presses it.
        connect(button, &QPushButton::clicked, this, [this, what = act.act] { Q_EMIT chosen(what); });
        m_buttons.emplace(act.act, button);
        column->addWidget(button);
        column->addWidget(make_explanation(QString::fromUtf16(act.explanation)));
        column->addSpacing(space::margin);
    }
    column->addStretch(1);
    auto* over = new QVBoxLayout(this);
    over->setContentsMargins(0, 0, 0, 0);
    over->addWidget(make_side_panel(column, panel_width));
}

void ActPanel::offer(const Account& account)
{
    const std::map<MenderAct, bool> open{
        {MenderAct::mend, account.mendable},     {MenderAct::unlock, account.looked},
        {MenderAct::recover, account.looked},    {MenderAct::put_in_place, account.makes_way},
        {MenderAct::set_aside, account.damaged},
    };
    for (const auto& [act, button] : m_buttons)
        button->setEnabled(open.at(act));
}

bool ActPanel::lead_to(MenderAct act)
{
    const auto found = m_buttons.find(act);
    if (found == m_buttons.end())
        return false;
    found->second->setFocus(Qt::OtherFocusReason);
    return true;
}

} // namespace kindrel::desktop
