#include "sample/training.h"

#include "core/files.h"
#include "core/session.h"

#include <QCommandLineParser>
#include <QTextStream>

using namespace Qt::StringLiterals;

namespace {

/// The folder that is named; does not return without one.
QString read_folder(const QCoreApplication& program)
{
    QCommandLineParser parser;
    parser.setApplicationDescription(
        u"Lays the master database and the training church into a folder in which neither stands yet."_s);
    parser.addHelpOption();
    parser.addPositionalArgument(u"folder"_s, u"The folder, which is made when it is not there."_s);
    parser.process(program);
    const auto folders = parser.positionalArguments();
    if (folders.size() != 1)
        parser.showHelp(2);
    return folders.front();
}

void make_data(const QString& folder)
{
    const auto place = kindrel::core::as_folder(folder);
    kindrel::core::make_folder(place + u"master"_s);
    kindrel::sample::make_master(place + u"master/KR10_records.kdl"_s);
    kindrel::sample::lay_training_church(place + u"Training"_s);
}

} // namespace

int main(int argc, char** argv)
{
    const QCoreApplication program(argc, argv);
    const auto folder = read_folder(program);
    try {
        make_data(folder);
    } catch (const std::exception& failure) {
        QTextStream(stderr) << "kindrel-make-data: " << failure.what() << '\n';
        return 1;
    }
    return 0;
}
