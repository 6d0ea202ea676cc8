#include "desktop/mender/mender_program.h"

#include "core/startup_steps.h"
#include "core/system_workstation.h"
#include "desktop/mender/mender_window.h"
#include "desktop/shell/application.h"
#include "desktop/shell/dialogue.h"
#include "desktop/shell/look.h"
#include "desktop/shell/windows.h"

#include <QTemporaryDir>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr QSize first_size{960, 640};

/// The look that the workstation's program has.
void apply_look(Look& look, const core::StartRequest& request)
{
    const auto paths = core::startup_steps::first_paths(request, core::SystemWorkstation());
    const Remembered remembered(paths.folder(core::Folder::local_settings), 1);
    look.apply(Appearance(remembered.common_value(u"appearance"_s, int(Appearance::desktop)).toInt()),
               remembered.common_value(u"text_percent"_s, 100).toInt());
}

} // namespace

int run_mender(int& count, char** words, const core::StartRequest& request)
{
    Application application(count, words);
    QGuiApplication::setApplicationDisplayName(u"%1 Mender"_s.arg(core::product));
    Look look(application);
    apply_look(look, request);
    QtDialogue dialogue;
    application.set_dialogue(dialogue);
    core::SystemClock clock;
    // The data folder may be what is broken: nothing is remembered there.
    const QTemporaryDir folder;
    Remembered remembered(core::as_folder(folder.path()), 1);
    Windows windows(remembered);
    MenderWindow window({.workstation = [] { return std::make_unique<core::SystemWorkstation>(); },
                         .dialogue = dialogue,
                         .clock = clock,
                         .windows = windows,
                         .request = request});
    QObject::connect(&window, &MenderWindow::closed, &application, &QCoreApplication::quit);
    window.resize(first_size);
    window.show();
    return QApplication::exec();
}

} // namespace kindrel::desktop
