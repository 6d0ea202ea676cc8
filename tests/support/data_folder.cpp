#include "support/data_folder.h"

#include "core/install.h"
#include "core/schema.h"
#include "core/side_files.h"
#include "core/sqlite_session.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>

#include <gtest/gtest.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

namespace {

/// Made once for the whole test program: the schema is large.
const QByteArray& master_content()
{
    static const QByteArray content = [] {
        const QTemporaryDir folder;
        const QString file = folder.filePath(u"master.kdl"_s);
        create_schema(*create_sqlite(file));
        return DataFolder::read(file);
    }();
    return content;
}

} // namespace

DataFolder::DataFolder()
{
    make_church(program() + u"master/"_s);
    install(program(), drive());
}

QString DataFolder::make_network()
{
    const QString network = m_folder.path() + u"/network/"_s;
    const Paths paths(program(), drive(), network, Mode::network, 1);
    QDir().mkpath(paths.folder(Folder::global));
    write_side_file(paths, SideRecord(side_files::common));
    return network;
}

Paths DataFolder::paths(Mode mode, int church) const
{
    return {program(), drive(), root(), mode, church};
}

void DataFolder::write(const QString& file, const QByteArray& content)
{
    QDir().mkpath(QFileInfo(file).path());
    QFile target(file);
    if (!target.open(QIODevice::WriteOnly) || target.write(content) != content.size())
        ADD_FAILURE() << "Unable to write " << file.toStdString();
}

QByteArray DataFolder::read(const QString& file)
{
    QFile source(file);
    if (!source.open(QIODevice::ReadOnly))
        ADD_FAILURE() << "Unable to read " << file.toStdString();
    return source.readAll();
}

void DataFolder::make_church(const QString& folder)
{
    write(folder + u"KR10_records.kdl"_s, master_content());
}

TestStart::TestStart()
{
    workstation.program = data.program();
    workstation.drive = data.drive();
}

std::unique_ptr<Office> TestStart::start(const StartRequest& request)
{
    return start_up(request, workstation, dialogue, clock, progress);
}

void TestStart::in_database(const QString& statement, int church)
{
    const QString file = data.paths(Mode::normal, church).database();
    if (!QFileInfo::exists(file))
        DataFolder::make_church(data.paths(Mode::normal, church).folder(Folder::church));
    open_sqlite(file)->execute(statement);
}

QString TestStart::join_network()
{
    const QString network = data.make_network();
    SideRecord record(side_files::network);
    record.set_flag("network", true);
    record.set_text("path", network);
    write_side_file(data.paths(), record);
    return network;
}

} // namespace kindrel::test
