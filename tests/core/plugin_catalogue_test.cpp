#include "core/plugin_catalogue.h"

#include "core/install.h"
#include "support/data_folder.h"

#include <QDir>
#include <QFile>

#include <gtest/gtest.h>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

class PluginCatalogueTest : public testing::Test
{
protected:
    DataFolder data;
    QString reports = data.root() + u"plugin reports/"_s;
    QString letters = data.root() + u"plugin letters/"_s;
};

TEST_F(PluginCatalogueTest, FilesAreListedByTheirTitles)
{
    for (const char* name : {"pastoral.RPT", "inner.sub", "other.rpy", "notes.txt"})
        DataFolder::write(reports + QLatin1String(name), "layout");
    DataFolder::write(letters + u"welcome.ltr"_s, "letter");
    DataFolder::write(reports + u"report_title.plg"_s, "Pastoral.rpt=Besuche äöü\r\ngone.rpt=No file\nnonsense\n=x\n");

    const PluginCatalogue plugins = load_plugins(data.paths(Mode::training, training_church));

    EXPECT_EQ(plugins.reports,
              (std::vector<Plugin>{
                  {u"pastoral.RPT"_s, u"Besuche äöü"_s}, {u"inner.sub"_s, u"inner"_s}, {u"other.rpy"_s, u"other"_s}}));
    EXPECT_EQ(plugins.letters, (std::vector<Plugin>{{u"welcome.ltr"_s, u"welcome"_s}}));
}

TEST_F(PluginCatalogueTest, ANewPluginsTitlesJoinTheCatalogueOnceAndKeepToTheirFolder)
{
    for (const char* name : {"a.ltr", "b.ltr"})
        DataFolder::write(letters + QLatin1String(name), "letter");
    DataFolder::write(letters + u"letter_title.plg"_s, "a.ltr=First\n");
    DataFolder::write(letters + u"NEW_PLUGIN.PLG"_s,
                      "B.ltr=Second\n../a.ltr=Out\nC:a.ltr=Out\n..\\a.ltr=Out\na.rpt=A report\n");

    const PluginCatalogue plugins = load_plugins(data.paths());

    EXPECT_EQ(plugins.letters, (std::vector<Plugin>{{u"a.ltr"_s, u"First"_s}, {u"b.ltr"_s, u"Second"_s}}));
    EXPECT_EQ(DataFolder::read(letters + u"letter_title.plg"_s), "a.ltr=First\nB.ltr=Second\n");
    EXPECT_FALSE(QFile::exists(letters + u"NEW_PLUGIN.PLG"_s));
}

TEST_F(PluginCatalogueTest, InstallingAgainAddsWhatIsMissingAndChangesNothing)
{
    DataFolder::write(data.program() + u"Training/KR10_records.kdl"_s, "sample");
    DataFolder::write(data.program() + u"Training/Portrait/7.jpg"_s, "picture");
    DataFolder::write(data.root() + u"Training/portrait/7.JPG"_s, "my own");
    QDir(data.root() + u"Training/Portrait"_s).removeRecursively();
    QDir(data.root() + u"church7"_s).removeRecursively();

    install(data.program(), data.drive());

    EXPECT_EQ(DataFolder::read(data.root() + u"Training/KR10_records.kdl"_s), "sample");
    EXPECT_EQ(DataFolder::read(data.root() + u"Training/portrait/7.JPG"_s), "my own");
    EXPECT_FALSE(QFile::exists(data.root() + u"Training/Portrait"_s));
    EXPECT_TRUE(QFile::exists(data.root() + u"church7/Backup5"_s));
    EXPECT_TRUE(QFile::exists(data.root() + u"Local_settings"_s));
    EXPECT_TRUE(QFile::exists(data.root() + u"booked out"_s));
}

} // namespace kindrel::test
