#include "desktop/core/security_page.h"

#include "desktop/core/access_areas.h"
#include "desktop/core/password_entry.h"
#include "desktop/core/password_list.h"
#include "desktop/core/user_details.h"
#include "desktop/shell/chip.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/note_bar.h"
#include "desktop/shell/side_panel.h"

#include <QAction>
#include <QCheckBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QScrollArea>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int side_width = 272;

const core::Message confirm_dropping{
    .text = u"Do you wish to drop everything that was altered here since it was last saved?"_s,
    .icon = core::Icon::question};

QLabel* make_explanation(const QString& text)
{
    auto* words = new QLabel(text);
    words->setWordWrap(true);
    dress(*words, TextSize::secondary);
    return words;
}

} // namespace

SecurityPage* SecurityPage::open(Desk& desk)
{
    auto entry = core::enter(desk.office, core::AreaId::security);
    if (!entry)
        return nullptr;
    auto setup = core::SecuritySetup::open(desk.office);
    return setup ? new SecurityPage(desk, std::move(*entry), std::move(*setup)) : nullptr;
}

SecurityPage::SecurityPage(Desk& desk, core::AreaEntry entry, core::SecuritySetup setup)
    : Page(u"Security Setup"_s), m_desk(desk), m_entry(std::move(entry)), m_setup(std::move(setup)),
      m_switch(new QCheckBox(u"&Security is switched on"_s)), m_list(new PasswordList), m_password(new PasswordEntry),
      m_details(new UserDetails)
{
    setObjectName(u"security"_s);
    auto* content = new QWidget;
    auto* row = new QHBoxLayout(content);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(space::group);
    row->addWidget(make_side());
    row->addWidget(m_details, 1);
    set_content(content);
    auto* drop = add_action(u"Drop Changes"_s, u"edit-undo"_s, u"Brings back what was last saved"_s);
    connect(drop, &QAction::triggered, this, &SecurityPage::drop_changes);
    connect_parts();
    show_all(0);
}

void SecurityPage::connect_parts()
{
    connect(m_switch, &QCheckBox::toggled, this, [this](bool on) {
        m_setup.switch_on(on);
        show_state();
    });
    connect(m_list, &PasswordList::itemSelectionChanged, this, &SecurityPage::show_chosen);
    connect(m_list, &PasswordList::removal_wanted, this, &SecurityPage::remove_password);
    connect(m_password, &PasswordEntry::add_wanted, this, &SecurityPage::add_password);
    connect(m_password, &PasswordEntry::change_wanted, this, &SecurityPage::change_password);
    connect(m_details, &UserDetails::people_edited, this, &SecurityPage::set_people);
    connect(m_details, &UserDetails::email_edited, this, &SecurityPage::set_email);
    connect(&m_details->areas(), &AccessAreas::ticked, this, &SecurityPage::set_area);
}

QWidget* SecurityPage::make_side()
{
    m_switch->setObjectName(u"switch"_s);
    auto* remove = new QPushButton(icon(u"list-remove"_s), u"&Remove"_s);
    remove->setObjectName(u"remove"_s);
    remove->setToolTip(u"Removes the chosen password (Delete)"_s);
    connect(remove, &QPushButton::clicked, this, &SecurityPage::remove_password);

    auto* column = new QVBoxLayout;
    column->setContentsMargins(space::group, 0, 0, space::margin);
    column->setSpacing(space::field);
    column->addWidget(m_switch);
    column->addWidget(make_explanation(u"Whoever enters the program is asked for a password."_s));
    column->addWidget(m_list, 1);
    column->addWidget(remove, 0, Qt::AlignLeft);
    column->addSpacing(space::field);
    column->addWidget(m_password);
    return make_side_panel(column, side_width);
}

void SecurityPage::entered()
{
    if (m_setup.users().empty())
        m_switch->setFocus(Qt::OtherFocusReason);
    else
        find();
}

void SecurityPage::find()
{
    m_list->setFocus(Qt::OtherFocusReason);
}

bool SecurityPage::leave()
{
    if (m_setup.leave()) {
        show_state();
        return true;
    }
    lead_to_fault();
    return false;
}

void SecurityPage::lead_to_fault()
{
    const auto& users = m_setup.users();
    const auto opens_security = [](const core::User& user) {
        return user.areas.may(core::Area::security);
    };
    if (users.empty()) {
        m_password->start();
    } else if (const auto place = m_setup.faulty()) {
        m_list->choose(*place);
        m_details->focus_area(core::Area{});
    } else if (std::ranges::none_of(users, opens_security)) {
        m_details->focus_area(core::Area::security);
    }
}

/// Everything anew, with this password chosen, or the last when there are not so many.
void SecurityPage::show_all(int place)
{
    m_switch->setChecked(m_setup.switched_on());
    m_list->show_users(m_setup);
    m_list->choose(std::min(place, m_list->rowCount() - 1));
    show_chosen();
    show_state();
}

void SecurityPage::show_chosen()
{
    const int place = m_list->chosen();
    const auto& users = m_setup.users();
    if (place < 0 || place >= static_cast<int>(users.size()))
        m_details->show_user(u"No password chosen"_s, {});
    else
        m_details->show_user(m_setup.title(place), users[static_cast<std::size_t>(place)]);
}

void SecurityPage::show_state()
{
    const auto count = m_setup.users().size();
    chip().set(m_setup.altered() ? u"Altered"_s : QString(), State::altered);
    Q_EMIT state_changed();
    set_status(count == 1 ? u"1 password"_s : u"%1 passwords"_s.arg(count));
}

void SecurityPage::add_password()
{
    const auto place = m_setup.add(m_password->take());
    if (!place) {
        m_password->start();
        return;
    }
    show_all(*place);
    note().say(u"The password is added. Now say whom it belongs to and what it opens."_s);
    m_details->focus_people();
}

void SecurityPage::change_password()
{
    if (m_setup.change_password(m_list->chosen(), m_password->take())) {
        note().say(u"The password of %1 is changed."_s.arg(m_setup.title(m_list->chosen())));
        show_state();
    }
    m_password->start();
}

void SecurityPage::remove_password()
{
    const int place = m_list->chosen();
    if (m_setup.remove(place))
        show_all(place);
}

void SecurityPage::set_people(const QStringList& people)
{
    const int place = m_list->chosen();
    if (!m_setup.set_people(place, people)) {
        show_chosen();
        return;
    }
    m_list->show_users(m_setup);
    m_details->set_title(m_setup.title(place));
    show_state();
}

void SecurityPage::set_email(const QString& name, const QString& address)
{
    if (!m_setup.set_email(m_list->chosen(), name, address))
        show_chosen();
    show_state();
}

void SecurityPage::set_area(core::Area area, bool granted)
{
    if (!m_setup.set_area(m_list->chosen(), area, granted))
        show_chosen();
    m_list->show_users(m_setup);
    show_state();
}

void SecurityPage::drop_changes()
{
    if (!m_setup.altered() || !m_desk.office.dialogue.confirm(confirm_dropping, core::Answer::no))
        return;
    if (auto stored = core::SecuritySetup::open(m_desk.office))
        m_setup = std::move(*stored);
    show_all(0);
}

} // namespace kindrel::desktop
