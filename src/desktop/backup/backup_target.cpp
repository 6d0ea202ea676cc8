#include "desktop/backup/backup_target.h"

#include "core/backup_files.h"
#include "desktop/backup/backup_words.h"
#include "desktop/core/setup_form.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QBoxLayout>
#include <QCheckBox>
#include <QDir>
#include <QFileInfo>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int inset = 20; // Under a tick's words.
const QString elsewhere_key = u"backup_elsewhere"_s;

QDir own_folder(const core::Office& office)
{
    const int next = stored_backup_settings(office).number("next_folder");
    return core::own_backup_folder(office.paths, next >= 1 && next <= core::own_backup_folders ? next : 1);
}

QString holds_words(const core::KnownBackup* lying_there, core::DayOrder order)
{
    if (!lying_there)
        return u"One of five that take turns. No backup lies in it yet."_s;
    return u"One of five that take turns. The backup of %1 that lies in it goes once the new one is compared."_s.arg(
        moment_words(lying_there->made, order));
}

} // namespace

core::SideRecord stored_backup_settings(const core::Office& office)
{
    try {
        return core::read_side_file(office.paths, core::side_files::backup).value_or(office.side.backup);
    } catch (const core::FileError&) {
        return office.side.backup; // The backup itself tells of a damaged file.
    }
}

BackupTarget::BackupTarget(Desk& desk)
    : m_desk(desk), m_own(new QLabel), m_elsewhere(new QCheckBox(u"&Another folder instead"_s)),
      m_holds(make_explanation({})), m_path(new QLineEdit), m_space(make_explanation({}))
{
    m_own->setObjectName(u"own_folder"_s);
    m_elsewhere->setObjectName(u"another_folder"_s);
    m_space->setObjectName(u"space"_s);
    m_space->setContentsMargins(inset, 0, 0, 0);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field / 2);
    column->addWidget(make_heading(u"Where to"_s));
    column->addWidget(m_own);
    column->addWidget(m_holds);
    column->addWidget(m_elsewhere);
    column->addLayout(make_path());
    column->addWidget(m_space);
    const auto settings = stored_backup_settings(desk.office);
    m_path->setText(settings.text("path"));
    connect(m_elsewhere, &QCheckBox::toggled, this, &BackupTarget::choose);
    m_elsewhere->setChecked(desk.remembered.value(elsewhere_key, false).toBool());
}

QBoxLayout* BackupTarget::make_path()
{
    m_path->setObjectName(u"path"_s);
    m_path->setAccessibleName(u"Folder for the backup"_s);
    connect(m_path, &QLineEdit::textEdited, this, [this] {
        m_elsewhere->setChecked(true);
        show_space();
    });
    auto* browse_button = new QPushButton(icon(u"document-open-folder"_s), u"B&rowse…"_s);
    browse_button->setObjectName(u"browse"_s);
    connect(browse_button, &QPushButton::clicked, this, &BackupTarget::browse);
    auto* row = new QHBoxLayout;
    row->setContentsMargins(inset, 0, 0, 0);
    row->setSpacing(space::field);
    row->addWidget(m_path, 1);
    row->addWidget(browse_button);
    return row;
}

void BackupTarget::show_own_folder(const std::vector<core::KnownBackup>& backups)
{
    const QDir folder = own_folder(m_desk.office);
    const auto lies_there = [&folder](const core::KnownBackup& backup) {
        return backup.present && QFileInfo(backup.file).dir() == folder;
    };
    const auto found = std::ranges::find_if(backups, lies_there);
    m_own->setText(u"The church's own folder '%1'"_s.arg(folder.dirName()));
    m_holds->setText(holds_words(found == backups.end() ? nullptr : &*found, m_desk.office.day_order()));
    show_space();
}

QString BackupTarget::folder() const
{
    return !m_elsewhere->isChecked() ? QString() : QDir::cleanPath(QDir(m_path->text().trimmed()).absolutePath());
}

bool BackupTarget::named()
{
    if (!m_elsewhere->isChecked() || !m_path->text().trimmed().isEmpty())
        return true;
    m_desk.office.dialogue.show({u"Please choose a folder for the backup."_s});
    m_path->setFocus(Qt::OtherFocusReason);
    return false;
}

void BackupTarget::start()
{
    m_elsewhere->setFocus(Qt::OtherFocusReason);
}

void BackupTarget::choose(bool elsewhere)
{
    m_desk.remembered.keep(elsewhere_key, elsewhere);
    m_own->setEnabled(!elsewhere);
    m_holds->setEnabled(!elsewhere);
    show_space();
}

void BackupTarget::browse()
{
    const auto folder = m_desk.office.dialogue.choose_file({.title = u"Folder for the backup"_s,
                                                            .filter = {},
                                                            .suggested = m_path->text(),
                                                            .kind = core::FileQuestion::Kind::folder});
    if (!folder)
        return;
    m_path->setText(*folder);
    m_elsewhere->setChecked(true);
    show_space();
}

void BackupTarget::show_space()
{
    const QString chosen = folder().isEmpty() ? m_desk.office.paths.folder(core::Folder::church) : folder();
    if (m_elsewhere->isChecked() && (m_path->text().trimmed().isEmpty() || !QFileInfo(chosen).isDir()))
        m_space->setText(m_path->text().trimmed().isEmpty() ? u"No folder is chosen yet."_s
                                                            : u"This folder is not there."_s);
    else
        m_space->setText(u"%1 are free there."_s.arg(size_words(m_desk.office.workstation.free_bytes(chosen))));
}

} // namespace kindrel::desktop
