#include "apps/pictures.h"

#include "core/files.h"
#include "desktop/output/preview_window.h"
#include "desktop/people/family_card.h"
#include "desktop/people/group_details_dialog.h"
#include "desktop/people/quick_add_dialogs.h"
#include "desktop/people/speed_find.h"
#include "desktop/shell/main_window.h"
#include "desktop/shell/page.h"
#include "people/address_book.h"

#include <QApplication>
#include <QDialog>
#include <QLineEdit>
#include <QListWidget>
#include <QPushButton>
#include <QTabWidget>
#include <QTableWidget>
#include <QTextStream>
#include <QTimer>

namespace kindrel::apps {

using namespace Qt::StringLiterals;
using desktop::Appearance;

namespace {

constexpr QSize smallest_screen{1024, 690};
constexpr QSize narrow_window{800, 560};
constexpr QSize least_window{720, 480};
constexpr int longest_pause = 500; ///< Milliseconds.

/// Counts and drawings wait for a pause in typing; a picture does not.
void end_pauses(QWidget& window)
{
    for (auto* timer : window.findChildren<QTimer*>())
        if (timer->isActive() && timer->isSingleShot() && timer->interval() <= longest_pause)
            timer->start(0);
    QApplication::processEvents();
}

/// Writes under "name-light.png" and "name-dark.png".
class Camera
{
public:
    Camera(desktop::Look& look, QString folder) : m_look(look), m_folder(std::move(folder)) {}

    void take(QWidget& window, const QString& name)
    {
        for (const auto appearance : {Appearance::light, Appearance::dark}) {
            m_look.apply(appearance, 100);
            QApplication::processEvents();
            end_pauses(window);
            const QString shade = appearance == Appearance::light ? u"light"_s : u"dark"_s;
            m_failed |= !window.grab().save(u"%1%2-%3.png"_s.arg(m_folder, name, shade));
        }
    }
    [[nodiscard]] bool failed() const { return m_failed; }

private:
    desktop::Look& m_look;
    QString m_folder;
    bool m_failed = false;
};

void take_cards(desktop::Desk& desk, Camera& camera)
{
    const auto book = people::read_address_book(*desk.office.session, people::FamilyList::all, false);
    if (book.empty())
        return;
    desktop::open_family_card(desk, {book.front().Surname_ID}, 0);
    for (auto* card : desk.windows.all<desktop::FamilyCard>()) {
        auto* tabs = card->findChild<QTabWidget*>();
        for (int tab = 0; tab < tabs->count(); ++tab) {
            tabs->setCurrentIndex(tab);
            camera.take(*card, u"family-card-%1"_s.arg(tab + 1));
        }
    }
}

void take_editor(desktop::Running& running, Camera& camera)
{
    const auto book = people::read_address_book(*running.desk()->office.session, people::FamilyList::all, false);
    if (book.empty())
        return;
    running.open_family(book.front().Surname_ID, {}, {});
    QApplication::processEvents();
    auto* tabs = running.window()->findChild<QTabWidget*>(u"editor_tabs"_s);
    for (int tab = 0; tabs && tab < tabs->count(); ++tab) {
        tabs->setCurrentIndex(tab);
        camera.take(*running.window(), u"editor-%1"_s.arg(tab + 1));
    }
}

void open_area(desktop::Running& running, const QString& key)
{
    running.open_area(key);
    QApplication::processEvents();
}

void take_reports(desktop::Running& running, Camera& camera)
{
    open_area(running, u"reports"_s);
    camera.take(*running.window(), u"reports"_s);
    if (auto* preview = running.window()->findChild<QPushButton*>(u"preview"_s))
        preview->click();
    QApplication::processEvents();
    QApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete); // A report of nobody closes its window.
    for (auto* window : running.desk()->windows.all<desktop::PreviewWindow>())
        camera.take(*window, u"preview"_s);
}

void take_areas(desktop::Running& running, Camera& camera, const QStringList& keys)
{
    for (const auto& key : keys) {
        open_area(running, key);
        camera.take(*running.window(), key);
    }
}

void take_tabs(QWidget& window, const QString& name, Camera& camera)
{
    auto* tabs = window.findChild<QTabWidget*>(name);
    for (int tab = 0; tabs && tab < tabs->count(); ++tab) {
        tabs->setCurrentIndex(tab);
        camera.take(window, u"%1-%2"_s.arg(name).arg(tab + 1));
    }
}

void type_into(QWidget& page, const QString& field, const QString& text)
{
    if (auto* line = page.findChild<QLineEdit*>(field))
        line->setText(text);
}

void take_backups(desktop::Running& running, Camera& camera)
{
    auto& window = *running.window();
    open_area(running, u"backup"_s);
    camera.take(window, u"backup"_s);
    type_into(*window.page(), u"password"_s, u"correct horse"_s);
    type_into(*window.page(), u"password_again"_s, u"correct house"_s);
    if (auto* last = window.page()->findChild<QLineEdit*>(u"password_again"_s))
        Q_EMIT last->returnPressed();
    camera.take(window, u"backup-password"_s);
    open_area(running, u"restore"_s);
    auto* known = window.page()->findChild<QTableWidget*>(u"backups"_s);
    for (int row = 0; known && row < known->rowCount(); ++row) {
        known->selectRow(row);
        camera.take(window, u"restore-%1"_s.arg(row + 1));
    }
}

void take_registers(desktop::Running& running, Camera& camera)
{
    auto& window = *running.window();
    open_area(running, u"weekly"_s);
    if (auto* dates = window.page()->findChild<QListWidget*>(u"dates"_s); dates && dates->count() > 0) {
        Q_EMIT dates->itemActivated(dates->item(0));
        QApplication::processEvents();
    }
    take_tabs(window, u"weekly_tabs"_s, camera);
    if (auto* notes = window.findChild<QPushButton*>(u"notes"_s))
        notes->click();
    if (auto* dialog = window.findChild<QDialog*>(u"Roll_notes"_s)) {
        camera.take(*dialog, u"notes"_s);
        dialog->reject();
    }
    open_area(running, u"setup_projects"_s);
    take_tabs(window, u"registers"_s, camera);
}

void take_speed_find(desktop::Running& running, Camera& camera)
{
    running.find_family();
    QApplication::processEvents();
    auto* window = running.window()->findChild<desktop::SpeedFindWindow*>();
    if (!window)
        return;
    if (auto* words = window->findChild<QLineEdit*>(u"words"_s))
        words->setText(u"a"_s);
    camera.take(*window, u"speed_find"_s);
    window->hide();
}

void take_dialog(QDialog& dialog, Camera& camera)
{
    dialog.show();
    camera.take(dialog, dialog.objectName());
}

void take_dialogs(core::Office& office, Camera& camera)
{
    using people::SetupKind;
    for (const auto kind : {SetupKind::occupations, SetupKind::suburbs}) {
        desktop::QuickAddDialog dialog(office, kind, {});
        take_dialog(dialog, camera);
    }
    const auto groups = people::read_setup_items(*office.session, SetupKind::groups);
    if (groups.empty())
        return;
    desktop::GroupDetailsDialog dialog(office, groups.front().key, groups.front().text);
    take_dialog(dialog, camera);
}

} // namespace

void UnattendedDialogue::show(const core::Message& message)
{
    QTextStream(stderr) << message.text << '\n' << (message.more.isEmpty() ? QString() : message.more + u'\n');
}

bool UnattendedDialogue::confirm(const core::Message& message, core::Answer safe)
{
    show(message);
    return safe == core::Answer::yes;
}

std::optional<bool> UnattendedDialogue::confirm_or_cancel(const core::Message& message)
{
    show(message);
    return std::nullopt;
}

std::optional<QString> UnattendedDialogue::ask_text(const core::Message& message, bool)
{
    show(message);
    return std::nullopt;
}

std::optional<int> UnattendedDialogue::choose(const core::Message& message, const QStringList&)
{
    show(message);
    return std::nullopt;
}

int take_pictures(desktop::Running& running, desktop::Look& look, const QString& folder)
{
    core::make_folder(folder);
    Camera camera(look, core::as_folder(folder));
    running.window()->resize(smallest_screen);
    camera.take(*running.window(), u"main-menu"_s);
    take_cards(*running.desk(), camera);
    take_editor(running, camera);
    take_reports(running, camera);
    take_areas(running, camera,
               {u"search"_s, u"filters"_s, u"tagging"_s, u"setup"_s, u"fusions"_s, u"security"_s, u"network"_s,
                u"vision"_s, u"global_data"_s});
    open_area(running, u"labels"_s);
    take_tabs(*running.window(), u"label_tabs"_s, camera);
    take_registers(running, camera);
    take_backups(running, camera);
    take_speed_find(running, camera);
    take_dialogs(running.desk()->office, camera);
    open_area(running, u"main_menu"_s);
    running.window()->resize(narrow_window);
    camera.take(*running.window(), u"main-menu-narrow"_s);
    running.window()->resize(least_window);
    camera.take(*running.window(), u"main-menu-least"_s);
    return camera.failed() ? 1 : 0;
}

} // namespace kindrel::apps
