#include "sample/training.h"

#include "core/files.h"
#include "core/session.h"

#include <QCoreApplication>
#include <QTextStream>

namespace {

/// Lays the master database and the training church into a folder in which neither stands yet.
void make_data(const QString& folder)
{
    using namespace Qt::StringLiterals;
    const auto place = kindrel::core::as_folder(folder);
    kindrel::core::make_folder(place + u"master"_s);
    kindrel::sample::make_master(place + u"master/KR10_records.kdl"_s);
    kindrel::sample::lay_training_church(place + u"Training"_s);
}

} // namespace

int main(int argc, char** argv)
{
    const QCoreApplication program(argc, argv);
    QTextStream errors(stderr);
    if (program.arguments().size() != 2) {
        errors << "Usage: kindrel-make-data FOLDER\n";
        return 2;
    }
    try {
        make_data(program.arguments().at(1));
    } catch (const std::exception& failure) {
        errors << "kindrel-make-data: " << failure.what() << '\n';
        return 1;
    }
    return 0;
}
