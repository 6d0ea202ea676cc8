#include "core/global_variables.h"

#include "workplace.h"

#include <QDir>
#include <QFile>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using namespace core;

namespace {

bool is_picture(const QByteArray& content)
{
    return content.startsWith("picture");
}

} // namespace

class GlobalVariablesTest : public EngineTest
{
protected:
    void SetUp() override
    {
        EngineTest::SetUp();
        if (!church)
            return;
        place.emplace(*church);
        for (const auto folder : {Folder::local_settings, Folder::global})
            QDir().mkpath(paths().folder(folder));
    }
    [[nodiscard]] const Paths& paths() const { return place->office.paths; }
    [[nodiscard]] GlobalVariables open()
    {
        auto variables = GlobalVariables::open(place->office);
        EXPECT_TRUE(variables);
        return std::move(*variables);
    }
    [[nodiscard]] SideRecord file(const SideFile& file) { return *read_side_file(paths(), file); }
    [[nodiscard]] QByteArray image(const QString& name)
    {
        return DataFolder::read(paths().folder(Folder::images) + name);
    }
    QString make_file(const QString& name, const QByteArray& content)
    {
        DataFolder::write(chosen.path() + u'/' + name, content);
        return chosen.path() + u'/' + name;
    }

    std::optional<Workplace> place;
    QTemporaryDir chosen;
};
KINDREL_ON_BOTH_ENGINES(GlobalVariablesTest);

TEST_P(GlobalVariablesTest, OptionsAreStoredOneByOneAndUsedByTheOffice)
{
    auto variables = open();
    EXPECT_EQ(variables.starts_between_compactions(), 30);
    write_setting(session(), u"title_filters"_s, true); // Another workstation's.
    write_setting(session(), u"vision"_s, u"theirs"_s);
    variables.settings().American_date = true;
    variables.settings().use_preferred_names = true;
    variables.settings().pin_auto_number_start = 4001;
    variables.settings().title_date = false;
    variables.settings().title_logo = true;
    variables.settings().vision = u"not of this area"_s;
    variables.set_starts_between_compactions(0);

    ASSERT_TRUE(variables.save());

    EXPECT_FALSE(variables.altered());
    const auto now = read_settings(session());
    EXPECT_TRUE(now.American_date && now.use_preferred_names && now.title_logo && now.title_filters);
    EXPECT_FALSE(now.title_date);
    EXPECT_EQ(now.pin_auto_number_start, 4001);
    EXPECT_EQ(now.vision, u"theirs"_s);
    EXPECT_EQ(place->office.day_order(), DayOrder::day_first) << "dates typed before are read as they were typed";
    EXPECT_TRUE(variables.waits_for_next_start());
    EXPECT_TRUE(open().settings().American_date);
    EXPECT_TRUE(place->office.settings.use_preferred_names);
    EXPECT_TRUE(place->office.settings.title_filters);
    EXPECT_EQ(place->office.side.common.number("starts_between_compactions"), 0);
    EXPECT_EQ(file(side_files::common).number("starts_between_compactions"), 0);
}

TEST_P(GlobalVariablesTest, ANumberThatCannotBeUsedIsRefusedAndNothingIsWritten)
{
    struct Case
    {
        int pin, starts;
        QString field, refusal;
    };
    const QString pin = u"The next P.I.N. Number must be from 1 to 999999999."_s;
    const QString starts =
        u"The number of starts between compactions must be from 0 to 999, where 0 means never by itself."_s;
    const Case cases[]{{0, 30, u"pin_auto_number_start"_s, pin},
                       {1'000'000'000, 30, u"pin_auto_number_start"_s, pin},
                       {7, -1, u"starts_between_compactions"_s, starts},
                       {7, 1000, u"starts_between_compactions"_s, starts}};
    for (const auto& given : cases) {
        auto variables = open();
        variables.settings().American_date = true;
        variables.settings().pin_auto_number_start = given.pin;
        variables.set_starts_between_compactions(given.starts);
        place->dialogue.expect_box(given.refusal);
        EXPECT_FALSE(variables.save());
        EXPECT_EQ(variables.faulty(), given.field);
        EXPECT_FALSE(read_settings(session()).American_date);
        EXPECT_FALSE(read_side_file(paths(), side_files::common));
    }
}

TEST_P(GlobalVariablesTest, AChosenLogoIsCopiedAndNamedForAllOrForThisWorkstation)
{
    auto variables = open();
    ASSERT_TRUE(variables.choose_logo(LogoOf::all_churches, make_file(u"church.png"_s, "picture 1"), is_picture));
    const QString own = make_file(u"own.png"_s, "picture 2");
    ASSERT_TRUE(variables.choose_logo(LogoOf::workstation, own, is_picture));
    EXPECT_EQ(variables.logo_in_use(), own);
    EXPECT_FALSE(QFile::exists(paths().folder(Folder::images) + u"church.png"_s));
    QFile::remove(own); // A memory stick is pulled out.

    ASSERT_TRUE(variables.save());

    EXPECT_FALSE(variables.altered());
    EXPECT_EQ(file(side_files::common).text("logo"), u"church.png"_s);
    EXPECT_EQ(file(side_files::workstation_logo).text("logo"), u"own.png"_s);
    EXPECT_EQ(image(u"church.png"_s), "picture 1");
    EXPECT_EQ(image(u"own.png"_s), "picture 2");
    EXPECT_EQ(place->office.logo, paths().folder(Folder::images) + u"own.png"_s);

    variables.remove_logo(LogoOf::workstation);
    ASSERT_TRUE(variables.save());
    EXPECT_EQ(file(side_files::workstation_logo).text("logo"), QString());
    EXPECT_EQ(place->office.logo, paths().folder(Folder::images) + u"church.png"_s);

    variables.remove_logo(LogoOf::all_churches);
    ASSERT_TRUE(variables.save());
    EXPECT_EQ(place->office.logo, QString());
    EXPECT_EQ(open().logo_name(LogoOf::all_churches), QString());
}

TEST_P(GlobalVariablesTest, ALogoGetsANameThatTheFilesCanHoldAndThatIsFree)
{
    DataFolder::write(paths().file(Folder::images, u"Taken.PNG"_s), "picture of others");
    DataFolder::write(paths().file(Folder::images, u"same.png"_s), "picture");
    struct Case
    {
        QString file, name;
    };
    const Case cases[]{
        {u"the new logo of Saint Mark.jpeg"_s, u"the new logo of.jpeg"_s},
        {u"église.png"_s, u"église.png"_s},
        {u"教会 logo.png"_s, u"__ logo.png"_s},
        {u"taken.png"_s, u"taken 2.png"_s},
        {u"same.png"_s, u"same.png"_s},
        {u".png"_s, u"logo.png"_s},
    };
    for (const auto& given : cases) {
        SCOPED_TRACE(given.file.toStdString());
        auto variables = open();
        ASSERT_TRUE(variables.choose_logo(LogoOf::all_churches, make_file(given.file, "picture"), is_picture));
        ASSERT_TRUE(variables.save());
        EXPECT_EQ(variables.logo_name(LogoOf::all_churches), given.name);
        EXPECT_EQ(file(side_files::common).text("logo"), given.name);
        EXPECT_EQ(image(given.name), "picture");
    }
    EXPECT_EQ(image(u"Taken.PNG"_s), "picture of others");
}

TEST_P(GlobalVariablesTest, AFileThatIsNoPictureIsRefusedAndTheLogoStays)
{
    auto variables = open();
    for (const auto& file : {make_file(u"letter.jpg"_s, "Dear all"), chosen.path() + u"/gone.jpg"_s}) {
        place->dialogue.expect_box(u"'%1' is not a picture that can be read."_s.arg(QFileInfo(file).fileName()));
        EXPECT_FALSE(variables.choose_logo(LogoOf::all_churches, file, is_picture));
    }
    EXPECT_FALSE(variables.altered());
    EXPECT_EQ(variables.logo_name(LogoOf::all_churches), u"logo.jpg"_s);
    EXPECT_TRUE(variables.logo_missing(LogoOf::all_churches));
    EXPECT_FALSE(variables.logo_missing(LogoOf::workstation)) << "it has none of its own";
}

TEST_P(GlobalVariablesTest, WhatOthersWroteIntoTheCommonOptionsMeanwhileStays)
{
    auto variables = open();
    SideRecord theirs(side_files::common);
    theirs.set_text("logo", u"theirs.png"_s);
    write_side_file(paths(), theirs);
    variables.set_starts_between_compactions(12);

    ASSERT_TRUE(variables.save());

    EXPECT_EQ(file(side_files::common).text("logo"), u"theirs.png"_s);
    EXPECT_EQ(file(side_files::common).number("starts_between_compactions"), 12);
    EXPECT_EQ(variables.logo_name(LogoOf::all_churches), u"theirs.png"_s);
    EXPECT_FALSE(variables.altered());
}

TEST_P(GlobalVariablesTest, WhenAFileCannotBeWrittenTheDatabaseKeepsItsOptions)
{
    auto variables = open();
    variables.settings().American_date = true;
    variables.set_starts_between_compactions(5);
    const QString global = paths().folder(Folder::global);
    QDir(global).removeRecursively();
    place->dialogue.expect_box(u"Unable to write '%1Common.Dat': No such file or directory"_s.arg(global));

    EXPECT_FALSE(variables.save());

    EXPECT_TRUE(variables.altered());
    EXPECT_FALSE(read_settings(session()).American_date);
    EXPECT_FALSE(place->office.settings.American_date);
}

TEST_P(GlobalVariablesTest, AFailureLeavesFilesDatabaseAndOfficeAsTheyWere)
{
    struct Case
    {
        const char* what;
        std::function<void()> fail, mend;
        QString told; ///< Empty where the database fails.
    };
    const QString local = paths().folder(Folder::local_settings);
    const Case cases[]{
        {"the second file", [&] { QDir(local).removeRecursively(); }, [&] { QDir().mkpath(local); },
         u"Unable to write '%1logo.dat': No such file or directory"_s.arg(local)},
        {"the database",
         [&] { session().execute(u"ALTER TABLE [tbl_startup] RENAME TO [tbl_away];"_s); },
         [&] { session().execute(u"ALTER TABLE [tbl_away] RENAME TO [tbl_startup];"_s); },
         {}},
    };
    SideRecord common(side_files::common);
    common.set_text("logo", u"before.png"_s);
    write_side_file(paths(), common);
    place->office.side.common = common;
    for (const auto& [what, fail, mend, told] : cases) {
        SCOPED_TRACE(what);
        auto variables = open();
        const QString own = make_file(u"own.png"_s, "picture");
        ASSERT_TRUE(variables.choose_logo(LogoOf::workstation, own, is_picture));
        ASSERT_TRUE(variables.choose_logo(LogoOf::all_churches, make_file(u"all.png"_s, "picture 2"), is_picture));
        variables.settings().title_logo = true;
        fail();

        if (told.isEmpty()) {
            EXPECT_THROW(static_cast<void>(variables.save()), DatabaseError);
        } else {
            place->dialogue.expect_box(told);
            EXPECT_FALSE(variables.save());
        }

        mend();
        EXPECT_EQ(file(side_files::common).bytes(), common.bytes());
        EXPECT_FALSE(read_side_file(paths(), side_files::workstation_logo));
        EXPECT_EQ(QDir(paths().folder(Folder::images)).entryList(QDir::Files), QStringList());
        EXPECT_FALSE(read_settings(session()).title_logo);
        EXPECT_FALSE(place->office.settings.title_logo);
        EXPECT_EQ(place->office.side.common.bytes(), common.bytes());
        EXPECT_EQ(place->office.logo, QString());
        EXPECT_EQ(variables.logo_in_use(), own) << "the choice is not lost";
        EXPECT_TRUE(variables.altered());
    }
}

TEST_P(GlobalVariablesTest, WithoutTheRightTheOptionsStayClosed)
{
    place->grant_only({Area::security});
    place->dialogue.expect_box(
        u"Your password does not give access to \"%1\""_s.arg(area_name(Area::global_data_setup)));
    EXPECT_FALSE(GlobalVariables::open(place->office));
}

} // namespace kindrel::test
