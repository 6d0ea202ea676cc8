#include "desktop/core/network_page.h"

#include "desktop/core/lock_list.h"
#include "desktop/output/list_report.h"
#include "desktop/shell/chip.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/note_bar.h"
#include "desktop/shell/value_form.h"

#include <QAction>
#include <QBoxLayout>
#include <QCheckBox>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>

#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr std::array column_shares{46, 32, 22};

const QString save_question = u"The network setting has been altered. Do you wish to save it?"_s;

QLabel* make_explanation(const QString& text)
{
    auto* words = new QLabel(text);
    words->setTextFormat(Qt::PlainText);
    words->setWordWrap(true);
    dress(*words, TextSize::secondary);
    return words;
}

QPushButton* make_button(const QString& text, const QString& icon_name, const QString& name)
{
    auto* button = new QPushButton(icon(icon_name), text);
    button->setObjectName(name);
    return button;
}

} // namespace

NetworkPage* NetworkPage::open(Desk& desk)
{
    auto entry = core::enter(desk.office, core::AreaId::network_setup);
    if (!entry)
        return nullptr;
    auto setup = core::NetworkSetup::open(desk.office);
    return setup ? new NetworkPage(desk, std::move(*entry), std::move(*setup)) : nullptr;
}

NetworkPage::NetworkPage(Desk& desk, core::AreaEntry entry, core::NetworkSetup setup)
    : Page(u"Network Setup"_s), m_desk(desk), m_entry(std::move(entry)), m_setup(std::move(setup)),
      m_switch(new QCheckBox(u"&Work with the data files on the network"_s)), m_path(new QLineEdit),
      m_locks(new LockList)
{
    setObjectName(u"setup_Networking"_s);
    auto* content = new QWidget;
    auto* column = new QVBoxLayout(content);
    column->setContentsMargins(space::group, 0, space::group, space::margin);
    column->setSpacing(2 * space::group);
    column->addLayout(make_place());
    column->addLayout(make_locks(), 1);
    set_content(content);
    auto* keep = add_action(u"Save"_s, u"document-save"_s, u"Saves the network setting (Ctrl+S)"_s);
    connect(keep, &QAction::triggered, this, &NetworkPage::save);
    follow(desk.remembered, *m_locks->horizontalHeader(), column_shares);
    show_place();
    show_locks();
    show_state();
}

QBoxLayout* NetworkPage::make_place()
{
    m_switch->setObjectName(u"switch"_s);
    connect(m_switch, &QCheckBox::toggled, this, [this](bool on) {
        m_setup.switch_on(on);
        show_state();
    });
    auto* column = new QVBoxLayout;
    column->setSpacing(space::field);
    column->addWidget(make_heading(u"This workstation"_s));
    column->addWidget(m_switch);
    column->addLayout(make_path());
    column->addWidget(make_explanation(
        u"The folder that holds the folder 'Global' and the churches. Everybody who works here needs to read and write "
        "in it. A change takes effect the next time %1 is started on this computer."_s.arg(core::product)));
    return column;
}

QBoxLayout* NetworkPage::make_path()
{
    m_path->setObjectName(u"path"_s);
    m_path->setAccessibleName(u"Folder on the network"_s);
    connect(m_path, &QLineEdit::textEdited, this, [this](const QString& path) {
        m_setup.set_path(path);
        show_state();
    });
    auto* caption = new QLabel(u"Fol&der on the network"_s);
    caption->setBuddy(m_path);
    auto* browse_button = make_button(u"&Browse…"_s, u"document-open-folder"_s, u"browse"_s);
    connect(browse_button, &QPushButton::clicked, this, &NetworkPage::browse);
    auto* test_button = make_button(u"&Test"_s, u"network-connect"_s, u"test"_s);
    test_button->setToolTip(u"Looks for the data files and writes a test file beside them"_s);
    connect(test_button, &QPushButton::clicked, this, &NetworkPage::test);
    auto* row = new QHBoxLayout;
    row->setSpacing(space::field);
    row->addWidget(caption);
    row->addWidget(m_path, 1);
    row->addWidget(browse_button);
    row->addWidget(test_button);
    return row;
}

QBoxLayout* NetworkPage::make_locks()
{
    auto* unlock_button = make_button(u"&Unlock"_s, u"object-unlocked"_s, u"unlock"_s);
    connect(unlock_button, &QPushButton::clicked, this, &NetworkPage::unlock);
    auto* refresh_button = make_button(u"&Refresh"_s, u"view-refresh"_s, u"refresh"_s);
    connect(refresh_button, &QPushButton::clicked, this, &NetworkPage::refresh);
    auto* buttons = new QHBoxLayout;
    buttons->setSpacing(space::field);
    buttons->addWidget(unlock_button);
    buttons->addWidget(refresh_button);
    buttons->addStretch(1);
    auto* column = new QVBoxLayout;
    column->setSpacing(space::field);
    column->addWidget(make_heading(u"What is locked in this church"_s));
    column->addWidget(make_explanation(
        u"Unlock only what a workstation left behind when it failed. Whoever is still working there would no longer be "
        "kept apart from others."_s));
    column->addWidget(m_locks, 1);
    column->addLayout(buttons);
    return column;
}

void NetworkPage::entered()
{
    refresh();
    m_switch->setFocus(Qt::OtherFocusReason);
}

void NetworkPage::find()
{
    m_locks->setFocus(Qt::OtherFocusReason);
}

void NetworkPage::print()
{
    print_list(m_desk, u"What is locked"_s, *m_locks->model());
}

bool NetworkPage::leave()
{
    return save_or_drop(m_desk.office.dialogue, save_question, [this] {
        if (auto stored = core::NetworkSetup::open(m_desk.office))
            m_setup = std::move(*stored);
        show_place();
        show_state();
    });
}

void NetworkPage::show_place()
{
    m_path->setText(m_setup.path());
    m_switch->setChecked(m_setup.switched_on());
}

void NetworkPage::show_locks()
{
    m_locks->show_locks(m_setup.locks(), m_desk.office.day_order());
    const auto count = m_setup.locks().size();
    set_status(count == 1 ? u"1 lock"_s : u"%1 locks"_s.arg(count));
}

void NetworkPage::show_state()
{
    chip().set(m_setup.altered() ? u"Altered"_s : QString(), State::altered);
    Q_EMIT state_changed();
}

void NetworkPage::browse()
{
    const auto folder =
        m_desk.office.dialogue.choose_file({.title = u"Folder on the network with the %1 files"_s.arg(core::product),
                                            .filter = {},
                                            .suggested = m_setup.path(),
                                            .kind = core::FileQuestion::Kind::folder});
    if (!folder)
        return;
    m_setup.set_path(*folder);
    show_place();
    show_state();
}

void NetworkPage::test()
{
    note().clear();
    if (m_setup.test())
        note().say(u"The data files are there, and this workstation can write beside them."_s);
    else
        m_path->setFocus(Qt::OtherFocusReason);
}

bool NetworkPage::save()
{
    if (!m_setup.save()) {
        m_path->setFocus(Qt::OtherFocusReason);
        return false;
    }
    note().say(core::NetworkSetup::saved_note());
    show_state();
    return true;
}

void NetworkPage::refresh()
{
    m_setup.refresh();
    show_locks();
}

void NetworkPage::unlock()
{
    const auto place = m_locks->chosen();
    const QString what = place ? m_setup.locks()[static_cast<std::size_t>(*place)].what : QString();
    if (!m_setup.unlock(place)) {
        find();
        return;
    }
    show_locks();
    note().say(u"%1 is unlocked."_s.arg(what));
}

} // namespace kindrel::desktop
