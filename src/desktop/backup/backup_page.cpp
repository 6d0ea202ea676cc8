#include "desktop/backup/backup_page.h"

#include "desktop/backup/backup_list.h"
#include "desktop/backup/backup_password.h"
#include "desktop/backup/backup_target.h"
#include "desktop/backup/backup_words.h"
#include "desktop/core/setup_form.h"
#include "desktop/output/list_report.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/note_bar.h"
#include "desktop/shell/value_form.h"

#include <QBoxLayout>
#include <QCheckBox>
#include <QDir>
#include <QHeaderView>
#include <QHideEvent>
#include <QLabel>
#include <QPushButton>
#include <QScrollArea>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using core::BackupChoice;

namespace {

constexpr std::array column_shares{37, 17, 29, 17};
const QString exit_note = u"%1 ends once this backup is made."_s.arg(core::product);

/// What may stay behind; `key` is its name in the settings of backups.
struct Choice
{
    const char* key;
    const char16_t* words;
    bool BackupChoice::*choice;
};
constexpr std::array choices{
    Choice{"with_pictures", u"&Photographs and pictures", &BackupChoice::with_pictures},
    Choice{"with_documents", u"&Notebook pages, sounds, roster history and Wardline documents",
           &BackupChoice::with_documents},
    Choice{"with_letters", u"&Letters, custom layouts and plug-ins", &BackupChoice::with_letters},
};

QString last_words(const core::KnownBackup* last, core::DayOrder order)
{
    return last ? moment_words(last->made, order) : u"No verified backup yet"_s;
}

QString last_place_words(const core::KnownBackup* last)
{
    return last ? u"%1 in '%2'"_s.arg(size_words(last->size), QDir::toNativeSeparators(last->file)) : QString();
}

} // namespace

BackupPage* BackupPage::open(Desk& desk)
{
    auto entry = core::enter(desk.office, core::AreaId::backup);
    return entry ? new BackupPage(desk, std::move(*entry)) : nullptr;
}

BackupPage::BackupPage(Desk& desk, core::AreaEntry entry)
    : Page(u"Backup Data"_s), m_desk(desk), m_entry(std::move(entry)), m_target(new BackupTarget(desk)),
      m_password(new BackupPassword), m_last(make_value()), m_last_place(make_explanation({})), m_known(new BackupList)
{
    setObjectName(u"Backup"_s);
    auto* row = new QHBoxLayout;
    row->setSpacing(2 * space::group);
    row->addLayout(make_form(), 6);
    row->addLayout(make_known(), 5);
    set_content(make_scrolling(row));
    m_known->horizontalHeader()->setObjectName(u"backups"_s);
    follow(desk.remembered, *m_known->horizontalHeader(), column_shares);
    show_known();
}

QBoxLayout* BackupPage::make_form()
{
    auto* run_button = new QPushButton(icon(u"backup"_s), u"&Back up now"_s);
    run_button->setObjectName(u"back_up"_s);
    connect(run_button, &QPushButton::clicked, this, &BackupPage::run);
    connect(m_password, &BackupPassword::finished, this, &BackupPage::run);
    auto* column = new QVBoxLayout;
    column->setSpacing(space::group);
    column->addWidget(m_target);
    add_choices(*column);
    column->addWidget(m_password);
    column->addWidget(run_button, 0, Qt::AlignLeft);
    column->addStretch(1);
    return column;
}

void BackupPage::add_choices(QBoxLayout& column)
{
    auto* ticks = new QVBoxLayout;
    ticks->setSpacing(space::field / 2);
    ticks->addWidget(make_heading(u"What goes along"_s));
    ticks->addWidget(make_explanation(u"The records and the settings always do."_s));
    const auto settings = stored_backup_settings(m_desk.office);
    for (std::size_t place = 0; place < choices.size(); ++place) {
        m_choices[place] = new QCheckBox(QString::fromUtf16(choices[place].words));
        m_choices[place]->setObjectName(QString::fromLatin1(choices[place].key));
        m_choices[place]->setChecked(settings.flag(choices[place].key));
        ticks->addWidget(m_choices[place]);
    }
    column.addLayout(ticks);
}

QBoxLayout* BackupPage::make_known()
{
    m_last->setObjectName(u"last_backup"_s);
    keep_text_size(*m_last, TextSize::title);
    auto* column = new QVBoxLayout;
    column->setSpacing(space::field / 2);
    column->addWidget(make_heading(u"Last verified backup"_s));
    column->addWidget(m_last);
    column->addWidget(m_last_place);
    column->addSpacing(space::margin);
    column->addWidget(make_heading(u"Known backups"_s));
    column->addWidget(m_known, 1);
    return column;
}

void BackupPage::entered()
{
    show_known();
    m_target->start();
}

void BackupPage::find()
{
    m_known->start();
}

void BackupPage::print()
{
    print_list(m_desk, u"Known backups"_s, *m_known->model());
}

void BackupPage::exit_afterwards()
{
    m_exit_afterwards = true;
    note().say(exit_note);
    lead_to(*this, u"back_up"_s);
}

void BackupPage::hideEvent(QHideEvent* event)
{
    Page::hideEvent(event);
    if (event->spontaneous() || !std::exchange(m_exit_afterwards, false))
        return;
    note().clear();
}

core::BackupChoice BackupPage::choice() const
{
    BackupChoice chosen;
    for (std::size_t place = 0; place < choices.size(); ++place)
        chosen.*choices[place].choice = m_choices[place]->isChecked();
    return chosen;
}

void BackupPage::show_known()
{
    const core::DayOrder order = m_desk.office.day_order();
    auto backups = core::backups_of(m_desk.office);
    const auto* last = last_verified(backups);
    m_last->setText(last_words(last, order));
    m_last_place->setText(last_place_words(last));
    m_target->show_own_folder(backups);
    set_status(counted(qint64(backups.size()), u"backup"_s, u"backups"_s));
    m_known->show_backups(std::move(backups), order);
}

void BackupPage::run()
{
    if (!m_target->named() || !m_password->agreed())
        return;
    note().say(u"The backup is being made…"_s);
    layout()->activate();
    repaint(); // The box with the progress comes later.
    const core::BackupRequest request{
        .folder = m_target->folder(), .password = m_password->password(), .choice = choice()};
    const auto report = core::make_backup(m_desk.office, request, m_desk.progress);
    note().clear();
    if (m_exit_afterwards)
        note().say(exit_note);
    show_known();
    if (report)
        tell(*report);
}

void BackupPage::tell(const core::BackupReport& report)
{
    m_password->clear();
    const core::Message made = made_message(report);
    if (!m_exit_afterwards) {
        note().say(made.text + u' ' + made.more);
        return;
    }
    m_desk.office.dialogue.show(made); // The page goes, and its note with it.
    Q_EMIT exit_wanted();
}

} // namespace kindrel::desktop
