#include "desktop/mender_window_fixture.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;
using core::Answer;

TEST_F(MenderWindowTest, ADamagedFileIsRecoveredIntoANewOneAndLeftAsItIs)
{
    QByteArray content = DataFolder::read(database());
    content.chop(content.size() / 20);
    DataFolder::write(database(), content);
    open_and_check();
    ASSERT_EQ(focus(), u"recover"_s) << told().toStdString();
    const QString fresh = in_church(u"fresh.kdl"_s);
    place.dialogue.expect_file(u"A new church file for what can be read"_s, fresh);
    place.dialogue.expect_confirm(u"Write what can be read of '%1' into '%2'?"_s.arg(database(), fresh), Answer::yes);
    press(*window, Qt::Key_Return);
    EXPECT_TRUE(outcome().startsWith(u"Recovered"_s)) << told().toStdString();
    EXPECT_TRUE(lines().contains(u"The new church file is '%1'; '%2' was left as it is."_s.arg(fresh, database())));
    EXPECT_TRUE(lines().contains(u"•  families: 2 rows"_s)) << told().toStdString();
    EXPECT_EQ(count(fresh, u"tbl_surname"_s), 2);
    EXPECT_EQ(DataFolder::read(database()), content);
    EXPECT_EQ(focus(), u"put_in_place"_s);

    place.dialogue.expect_file(u"A new church file for what can be read"_s, fresh);
    place.dialogue.expect_confirm(u"Write what can be read of '%1' into '%2'?"_s.arg(database(), fresh), Answer::yes);
    press(*window, Qt::Key_F5);
    click(u"recover"_s);
    EXPECT_EQ(outcome(), u"Failed"_s);
    EXPECT_TRUE(lines().contains(u"'%1' exists already; name a new file."_s.arg(fresh))) << told().toStdString();
}

TEST_F(MenderWindowTest, ARecoveredFileIsPutInPlaceAndTheChurchIsMended)
{
    damage();
    QByteArray content = DataFolder::read(database());
    content.chop(content.size() / 20);
    DataFolder::write(database(), content);
    open_and_check();
    const QString fresh = place.data.drive() + u"fresh.kdl"_s;
    place.dialogue.expect_file(u"A new church file for what can be read"_s, fresh);
    place.dialogue.expect_confirm(u"Write what can be read of '%1' into '%2'?"_s.arg(database(), fresh), Answer::yes);
    click(u"recover"_s);
    ASSERT_EQ(focus(), u"put_in_place"_s) << told().toStdString();
    place.dialogue.expect_confirm(u"Put '%1' in the place of the church file of church 1, which is kept in the folder "
                                  "'mended', and mend the church? Nobody may be inside."_s.arg(fresh),
                                  Answer::yes, Answer::no);
    press(*window, Qt::Key_Return);
    const QString aside = in_church(u"mended/KR10_records set aside 2024-05-15 103000.kdl"_s);
    EXPECT_TRUE(lines().contains(u"The recovered records stand in '%1' now."_s.arg(database())))
        << told().toStdString();
    EXPECT_TRUE(lines().contains(u"The church's former file lies in '%1' now."_s.arg(aside))) << told().toStdString();
    EXPECT_EQ(DataFolder::read(aside), content);
    EXPECT_EQ(count(database(), u"tbl_address"_s), 2) << told().toStdString();
    EXPECT_FALSE(QFile::exists(fresh) || offers(u"put_in_place"_s));
}

TEST_F(MenderWindowTest, AFileIsPutInPlaceOnlyWhereTheChurchsOwnCanMakeWay)
{
    const QString fresh = place.data.drive() + u"fresh.kdl"_s;
    open_and_check();
    EXPECT_FALSE(offers(u"put_in_place"_s));
    place.dialogue.expect_file(u"A new church file for what can be read"_s, fresh);
    place.dialogue.expect_confirm(u"Write what can be read of '%1' into '%2'?"_s.arg(database(), fresh), Answer::yes);
    click(u"recover"_s);
    EXPECT_EQ(outcome(), u"Recovered"_s) << told().toStdString();
    EXPECT_FALSE(offers(u"put_in_place"_s));
    EXPECT_EQ(focus(), u"check"_s);
    for (const auto& table : {u"tbl_surname"_s, u"tbl_people"_s, u"tbl_address"_s, u"tbl_personal_details"_s})
        place.in_database(u"DELETE FROM [%1];"_s.arg(table));
    press(*window, Qt::Key_F5);
    EXPECT_EQ(outcome(), u"Sound"_s) << told().toStdString();
    EXPECT_TRUE(offers(u"put_in_place"_s));
}

TEST_F(MenderWindowTest, ADamagedFileIsSetAsideSoThatABackupCanBeRestored)
{
    open_and_check();
    EXPECT_FALSE(offers(u"set_aside"_s)); // A sound one stays.
    const QByteArray content(4096, 'x');
    DataFolder::write(database(), content);
    press(*window, Qt::Key_F5);
    place.dialogue.expect_confirm(aside_question, Answer::no, Answer::no);
    click(u"set_aside"_s);
    EXPECT_EQ(DataFolder::read(database()), content);

    place.dialogue.expect_confirm(aside_question, Answer::yes, Answer::no);
    click(u"set_aside"_s);
    EXPECT_EQ(outcome(), u"Set aside"_s) << told().toStdString();
    EXPECT_FALSE(QFile::exists(database()));
    const QString aside = in_church(u"mended/KR10_records set aside 2024-05-15 103000.kdl"_s);
    EXPECT_TRUE(lines().contains(u"The damaged church file lies in '%1' now."_s.arg(aside))) << told().toStdString();
    EXPECT_EQ(DataFolder::read(aside), content);
}

TEST_F(MenderWindowTest, AChurchWithoutRecordsIsToldAndADamagedFileElsewhereCanBeRecovered)
{
    const QString saved = place.data.drive() + u"saved.kdl"_s;
    ASSERT_TRUE(QFile::rename(database(), saved));
    open_and_check();
    EXPECT_EQ(lines().first(), u"There are no records of Church 1 here."_s);
    EXPECT_FALSE(offers(u"mend"_s));
    place.dialogue.expect_file(u"The damaged church file"_s, saved);
    place.dialogue.expect_file(u"A new church file for what can be read"_s, database());
    place.dialogue.expect_confirm(u"Write what can be read of '%1' into '%2'?"_s.arg(saved, database()), Answer::yes);
    click(u"recover"_s);
    EXPECT_EQ(outcome(), u"Recovered"_s) << told().toStdString();
    EXPECT_FALSE(offers(u"put_in_place"_s)) << "It stands there already.";
    press(*window, Qt::Key_F5);
    EXPECT_EQ(outcome(), u"Sound"_s) << told().toStdString();
}

} // namespace kindrel::test
