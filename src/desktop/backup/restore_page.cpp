#include "desktop/backup/restore_page.h"

#include "desktop/backup/backup_list.h"
#include "desktop/backup/backup_words.h"
#include "desktop/backup/comparison_table.h"
#include "desktop/core/setup_form.h"
#include "desktop/output/list_report.h"
#include "desktop/shell/chip.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/note_bar.h"
#include "desktop/shell/value_form.h"

#include <QBoxLayout>
#include <QCheckBox>
#include <QDir>
#include <QFileInfo>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>

#include <algorithm>
#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr std::array list_shares{17, 10, 29, 44};
constexpr std::array comparison_shares{24, 22, 22, 32};
constexpr int password_width = 240;

const QString nothing_chosen = u"No backup is chosen"_s;
const QString choose_one = u"Choose one of the list above, or browse for a file."_s;
const QString unreadable = u"This backup cannot be restored"_s;

} // namespace

RestorePage* RestorePage::open(Desk& desk)
{
    auto entry = core::enter(desk.office, core::AreaId::restore);
    return entry ? new RestorePage(desk, std::move(*entry)) : nullptr;
}

RestorePage::RestorePage(Desk& desk, core::AreaEntry entry)
    : Page(u"Restore Data"_s), m_desk(desk), m_entry(std::move(entry)), m_known(new BackupList), m_file(new QLineEdit),
      m_password_row(make_password()), m_verdict(new Chip), m_comparison(new ComparisonTable),
      m_shared(new QCheckBox(u"&Settings, pictures, letters and documents as well, which all churches share"_s)),
      m_present(desk.office)
{
    setObjectName(u"Restore"_s);
    auto* content = new QWidget;
    auto* column = new QVBoxLayout(content);
    column->setContentsMargins(space::group, 0, space::group, space::margin);
    column->setSpacing(space::group);
    column->addLayout(make_choice(), 2);
    column->addLayout(make_contents(), 3);
    set_content(content);
    m_known->horizontalHeader()->setObjectName(u"restorable"_s);
    follow(desk.remembered, *m_known->horizontalHeader(), list_shares);
    m_comparison->say(nothing_chosen, choose_one);
}

QBoxLayout* RestorePage::make_choice()
{
    connect(m_known, &QTableWidget::itemSelectionChanged, this, &RestorePage::choose_row);
    connect(m_known, &QTableWidget::activated, this, [this] { lead_to(*this, u"restore"_s); });
    auto* column = new QVBoxLayout;
    column->setSpacing(space::field);
    column->addWidget(make_heading(u"Which backup"_s));
    column->addWidget(m_known, 1);
    column->addLayout(make_file());
    column->addWidget(m_password_row);
    return column;
}

QBoxLayout* RestorePage::make_file()
{
    m_file->setObjectName(u"file"_s);
    m_file->setAccessibleName(u"File of the backup"_s);
    connect(m_file, &QLineEdit::editingFinished, this, [this] {
        if (m_file->isModified())
            look_inside();
    });
    auto* caption = new QLabel(u"&File"_s);
    caption->setBuddy(m_file);
    auto* browse_button = new QPushButton(icon(u"document-open-folder"_s), u"&Browse…"_s);
    browse_button->setObjectName(u"browse"_s);
    connect(browse_button, &QPushButton::clicked, this, &RestorePage::browse);
    auto* row = new QHBoxLayout;
    row->setSpacing(space::field);
    row->addWidget(caption);
    row->addWidget(m_file, 1);
    row->addWidget(browse_button);
    return row;
}

QWidget* RestorePage::make_password()
{
    m_password = new QLineEdit;
    m_password->setObjectName(u"password"_s);
    m_password->setEchoMode(QLineEdit::Password);
    m_password->setAccessibleName(u"Password of the backup"_s);
    keep_width(*m_password, password_width);
    connect(m_password, &QLineEdit::returnPressed, this, &RestorePage::look_inside);
    auto* caption = new QLabel(u"&Password of the backup"_s);
    caption->setBuddy(m_password);
    auto* open_button = new QPushButton(u"&Open"_s);
    open_button->setObjectName(u"open"_s);
    connect(open_button, &QPushButton::clicked, this, &RestorePage::look_inside);
    auto* widget = new QWidget;
    auto* row = new QHBoxLayout(widget);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(space::field);
    row->addWidget(caption);
    row->addWidget(m_password);
    row->addWidget(open_button);
    row->addStretch(1);
    widget->hide();
    return widget;
}

QBoxLayout* RestorePage::make_contents()
{
    m_verdict->setObjectName(u"verdict"_s);
    auto* heading = new QHBoxLayout;
    heading->setSpacing(space::margin);
    heading->addWidget(make_heading(u"What it holds, and what it would replace"_s));
    heading->addWidget(m_verdict);
    heading->addStretch(1);
    m_shared->setObjectName(u"with_shared_files"_s);
    m_shared->setChecked(true);
    auto* restore_button = new QPushButton(icon(u"document-revert"_s), u"&Restore…"_s);
    restore_button->setObjectName(u"restore"_s);
    connect(restore_button, &QPushButton::clicked, this, &RestorePage::restore);
    auto* foot = new QHBoxLayout;
    foot->setSpacing(space::group);
    foot->addWidget(m_shared, 1);
    foot->addWidget(restore_button);
    auto* column = new QVBoxLayout;
    column->setSpacing(space::field);
    column->addLayout(heading);
    column->addWidget(m_comparison, 1);
    column->addLayout(foot);
    m_comparison->horizontalHeader()->setObjectName(u"comparison"_s);
    follow(m_desk.remembered, *m_comparison->horizontalHeader(), comparison_shares);
    return column;
}

void RestorePage::entered()
{
    m_present.forget();
    show_known();
    find();
}

void RestorePage::find()
{
    m_known->start();
}

void RestorePage::print()
{
    print_list(m_desk, u"What a backup holds"_s, *m_comparison->model());
}

core::RestoreRequest RestorePage::request() const
{
    return {.file = QFileInfo(m_file->text()).absoluteFilePath(),
            .password = m_password->text(),
            .with_shared_files = m_shared->isChecked()};
}

void RestorePage::say_unchanged()
{
    note().say(u"Nothing was changed."_s);
    show_known();
}

void RestorePage::show_known()
{
    auto backups = core::backups_of(m_desk.office);
    set_status(counted(qint64(backups.size()), u"backup"_s, u"backups"_s));
    m_known->show_backups(std::move(backups), m_desk.office.day_order());
}

void RestorePage::choose_row()
{
    const auto* backup = m_known->chosen();
    if (!backup)
        return;
    m_file->setText(QDir::toNativeSeparators(backup->file));
    look_inside();
}

void RestorePage::browse()
{
    const auto file = m_desk.office.dialogue.choose_file(
        {.title = u"Backup to restore"_s, .filter = u"Backups (*.zip)"_s, .suggested = m_file->text()});
    if (!file)
        return;
    m_known->clearSelection();
    m_file->setText(*file);
    look_inside();
}

void RestorePage::look_inside()
{
    m_file->setModified(false);
    note().clear();
    try {
        const auto contents = core::read_backup(request().file, m_password->text());
        auto lines = compare(m_present.now(), contents, m_desk.office.day_order());
        const bool loss = std::ranges::any_of(lines, &ComparedLine::loss);
        m_verdict->set(loss ? u"Marked lines would be lost"_s : QString(), State::error);
        m_comparison->show_lines(std::move(lines));
        m_password_row->setVisible(contents.encrypted);
    } catch (const core::BackupError& error) {
        const bool password_helps =
            error.fault() == core::BackupFault::password_needed || error.fault() == core::BackupFault::wrong_password;
        show_fault(error.text(), password_helps);
    }
}

void RestorePage::show_fault(const QString& words, bool password_helps)
{
    m_verdict->set(password_helps ? QString() : unreadable, State::error);
    m_comparison->say(words, password_helps ? u"Type the password and press Enter."_s : choose_one);
    m_password_row->setVisible(password_helps);
    if (password_helps && !m_known->hasFocus()) {
        m_password->setFocus(Qt::OtherFocusReason);
        m_password->selectAll();
    }
}

void RestorePage::restore()
{
    if (m_file->text().trimmed().isEmpty()) {
        m_desk.office.dialogue.show({u"Please choose a backup to restore."_s});
        find();
        return;
    }
    note().clear();
    Q_EMIT restore_wanted();
}

} // namespace kindrel::desktop
