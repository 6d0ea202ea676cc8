#include "apps/pictures.h"
#include "core/startup.h"
#include "core/system_workstation.h"
#include "desktop/running.h"
#include "desktop/shell/application.h"
#include "desktop/shell/dialogue.h"
#include "desktop/shell/printing.h"
#include "desktop/shell/progress.h"

#include <QCommandLineParser>
#include <QPixmap>
#include <QScreen>

using namespace kindrel;
using namespace Qt::StringLiterals;

namespace {

struct Options
{
    QString data_drive;
    QString pictures;
    int church = 0;
};

Options read_options(const QCoreApplication& application)
{
    const QCommandLineOption data_drive(u"data-drive"_s, u"Folder that holds Kindrel_10_Data."_s, u"folder"_s);
    const QCommandLineOption church(u"church"_s, u"Church 1 to 7; 8 is the training church, 9 booked-out data."_s,
                                    u"number"_s);
    const QCommandLineOption pictures(u"pictures"_s, u"Writes pictures of the screens into a folder and ends."_s,
                                      u"folder"_s);
    QCommandLineParser parser;
    parser.setApplicationDescription(u"The register of a church office."_s);
    parser.addHelpOption();
    parser.addVersionOption();
    parser.addOptions({data_drive, church, pictures});
    parser.process(application);
    bool is_church = true;
    const int number = parser.isSet(church) ? parser.value(church).toInt(&is_church) : 0;
    if (!is_church || number < 0 || number > core::booked_out_church || !parser.positionalArguments().isEmpty())
        parser.showHelp(2);
    return {parser.value(data_drive), parser.value(pictures), number};
}

/// A screen that nobody sits at is no display.
QSize display_size(const Options& options)
{
    const QScreen* screen = QGuiApplication::primaryScreen();
    return screen && options.pictures.isEmpty() ? screen->size() * screen->devicePixelRatio() : QSize();
}

int run(desktop::Application& application, const Options& options)
{
    desktop::Look look(application);
    look.apply(desktop::Appearance::desktop, 100);
    desktop::QtDialogue boxes;
    apps::UnattendedDialogue unattended;
    core::Dialogue& dialogue = options.pictures.isEmpty() ? static_cast<core::Dialogue&>(boxes) : unattended;
    application.set_dialogue(dialogue);
    desktop::QtProgress progress(dialogue);
    desktop::QtPrinting printing(dialogue, progress);
    core::SystemWorkstation workstation(display_size(options), QPixmap::defaultDepth());
    core::SystemClock clock;
    desktop::Running running(
        {.workstation = workstation,
         .dialogue = dialogue,
         .clock = clock,
         .progress = progress,
         .printing = printing,
         .look = look,
         .data_drive = options.data_drive,
         .opened =
             [&boxes](const core::Office& office) { boxes.set_audio_folder(office.paths.folder(core::Folder::audio)); },
         .ended =
             [] {
                 QCoreApplication::exit(); // Everything was asked, so that no window is to be asked again.
             }});
    if (!running.start(options.church))
        return 1;
    return options.pictures.isEmpty() ? QApplication::exec() : apps::take_pictures(running, look, options.pictures);
}

/// Before any window: help and a wrong option need no display.
Options options_of(int& count, char** words)
{
    const QCoreApplication application(count, words);
    return read_options(application);
}

} // namespace

int main(int count, char** words)
{
    QCoreApplication::setApplicationName(u"kindrel"_s);
    QCoreApplication::setApplicationVersion(QStringLiteral(KINDREL_VERSION));
    const Options options = options_of(count, words);
    if (!options.pictures.isEmpty())
        qputenv("QT_QPA_PLATFORM", "offscreen");
    desktop::Application application(count, words);
    QGuiApplication::setApplicationDisplayName(core::product.toString());
    QGuiApplication::setQuitOnLastWindowClosed(false);
    return run(application, options);
}
