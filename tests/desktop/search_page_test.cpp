#include "desktop/desktop_fixture.h"
#include "desktop/output/preview_window.h"
#include "desktop/people/editor_page.h"
#include "desktop/people/family_card.h"
#include "desktop/shell/note_bar.h"
#include "desktop/shell/page.h"
#include "people/filter.h"
#include "support/families.h"

#include <QCheckBox>
#include <QComboBox>
#include <QLineEdit>
#include <QListWidget>
#include <QPushButton>
#include <QTabWidget>
#include <QTableView>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using people::FileStatus;

namespace {

constexpr auto none_found = u"Unable to find any families matching the search criteria entered";

people::FamilyFile smith()
{
    auto file = family(u"Smith"_s, {u"Zora"_s});
    file.people[0].preferred_name = u"Nan"_s;
    file.people[0].Title = u"Dr"_s;
    file.people[0].Title_hidden = true;
    file.family_groups.resize(1);
    file.family_groups[0].item = 2;
    return file;
}

people::FamilyFile naismith()
{
    auto file = family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s});
    file.people[0].Title = u"Ms"_s;
    return file;
}

class SearchPageTest : public DesktopTest
{
protected:
    void open_search()
    {
        auto archived = family(u"Old"_s, {u"Olga"_s});
        archived.family.Condition = FileStatus::archive;
        begin({smith(), naismith(), family(u"Adder"_s, {u"Una"_s}), archived});
        running->open_area(u"search"_s);
        settle();
    }
    void open_data_search()
    {
        open_search();
        press(window(), Qt::Key_PageDown, Qt::ControlModifier);
    }
    [[nodiscard]] QWidget& page() { return *static_cast<QWidget*>(window().page()); }
    [[nodiscard]] QTableView& list() { return child<QTableView>(page(), u"families"_s); }
    [[nodiscard]] QTableView& entries() { return child<QTableView>(page(), u"entries"_s); }
    [[nodiscard]] QString button() { return child<QPushButton>(page(), u"search"_s).text(); }
    [[nodiscard]] QString label(const QString& name) { return child<QLabel>(page(), name).text(); }
    [[nodiscard]] QString chosen() { return list().currentIndex().siblingAtColumn(0).data().toString(); }
    [[nodiscard]] static QStringList shown(const QTableView& view, int column = 0)
    {
        QStringList texts;
        for (int row = 0; row < view.model()->rowCount(); ++row)
            texts += view.model()->index(row, column).data().toString();
        return texts;
    }
    /// Whom Tagging lists afterwards.
    QStringList send_to_tagging(const QString& part)
    {
        running->open_area(u"search"_s);
        settle();
        choose_part(part);
        child<QPushButton>(page(), u"to_tagging"_s).click();
        settle();
        return tagged();
    }
    [[nodiscard]] QStringList tagged() { return shown(child<QTableView>(page(), u"working_people"_s)); }
    void choose_part(const QString& name)
    {
        auto& parts = child<QListWidget>(page(), u"parts"_s);
        parts.setCurrentItem(parts.findItems(name, Qt::MatchExactly).at(0));
        press(window(), Qt::Key_Return);
    }
};

} // namespace

TEST_F(SearchPageTest, EnterGoesFromOneFamilyWithTheTextToTheNextAndTellsTheEnd)
{
    open_search();
    EXPECT_EQ(label(u"count"_s), u"Total Amount of Families Found = 3"_s);
    type(window(), u"SMI"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(chosen(), u"Naismith"_s);
    EXPECT_EQ(button(), u"&Search Next"_s);
    EXPECT_EQ(label(u"found_in"_s), u"Found in the surname of the family"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(chosen(), u"Smith"_s);

    place.dialogue.expect_box(QString::fromUtf16(none_found));
    press(window(), Qt::Key_Return);
    EXPECT_EQ(button(), u"&Search"_s);
    EXPECT_EQ(chosen(), u"Smith"_s);
}

TEST_F(SearchPageTest, AnotherOrderOfTheListKeepsTheFoundFamilyAndLetsTheSearchGoOn)
{
    open_search();
    type(window(), u"smi"_s);
    press(window(), Qt::Key_Return);
    ASSERT_EQ(chosen(), u"Naismith"_s);
    list().sortByColumn(0, Qt::DescendingOrder);
    EXPECT_EQ(shown(list()), (QStringList{u"Smith"_s, u"Naismith"_s, u"Adder"_s}));
    EXPECT_EQ(chosen(), u"Naismith"_s);
    EXPECT_EQ(button(), u"&Search Next"_s);
    child<QLineEdit>(page(), u"search_text"_s).setFocus();
    press(window(), Qt::Key_Return);
    EXPECT_EQ(chosen(), u"Smith"_s);
}

TEST_F(SearchPageTest, AnEmptyListNamesTheChoiceThatEmptiesIt)
{
    open_search();
    child<QComboBox>(page(), u"family_group"_s).setFocus();
    press(window(), Qt::Key_Down);
    EXPECT_TRUE(visible_texts(window()).contains(u"Choose another family group or another list above."_s));
    press(window(), Qt::Key_Up);
    child<QComboBox>(page(), u"family_list"_s).setFocus();
    QTest::keyClicks(window().focusWidget(), u"Prospect"_s);
    settle();
    EXPECT_TRUE(visible_texts(window()).contains(u"Choose another list above."_s));
}

TEST_F(SearchPageTest, APreferredNameIsFoundAmongTheNamesAlone)
{
    open_search();
    type(window(), u"nan"_s);
    place.dialogue.expect_box(QString::fromUtf16(none_found));
    press(window(), Qt::Key_Return);
    press(window(), Qt::Key_Tab);
    ASSERT_TRUE(child<QCheckBox>(page(), u"names_only"_s).hasFocus());
    press(window(), Qt::Key_Space);
    press(window(), Qt::Key_Tab);
    press(window(), Qt::Key_Space);
    EXPECT_EQ(chosen(), u"Smith"_s);
}

TEST_F(SearchPageTest, AnotherTextStartsTheSearchAnew)
{
    open_search();
    type(window(), u"s"_s);
    press(window(), Qt::Key_Return);
    EXPECT_EQ(button(), u"&Search Next"_s);
    type(window(), u"m"_s);
    EXPECT_EQ(button(), u"&Search"_s);
    EXPECT_EQ(label(u"found_in"_s), QString());
}

TEST_F(SearchPageTest, DownAndEnterOpenTheFoundFamilyInTheEditor)
{
    open_search();
    type(window(), u"smi"_s);
    press(window(), Qt::Key_Return);
    press(window(), Qt::Key_Down);
    press(window(), Qt::Key_Return);
    settle();
    ASSERT_TRUE(qobject_cast<desktop::EditorPage*>(window().page()));
    EXPECT_TRUE(window().page()->title().contains(u"Naismith"_s)) << window().page()->title().toStdString();
}

TEST_F(SearchPageTest, SelectorAndFamilyGroupNarrowTheListAndItsCount)
{
    open_search();
    child<QComboBox>(page(), u"family_group"_s).setFocus();
    press(window(), Qt::Key_Down);
    EXPECT_EQ(shown(list()), QStringList()) << "Nobody is in the first group.";
    press(window(), Qt::Key_Down);
    EXPECT_EQ(shown(list()), QStringList{u"Smith"_s});
    EXPECT_EQ(label(u"count"_s), u"Total Amount of Families Found = 1"_s);

    auto& lists = child<QComboBox>(page(), u"family_list"_s);
    lists.setFocus();
    QTest::keyClicks(&lists, u"Archive"_s);
    settle();
    EXPECT_EQ(label(u"count"_s), u"Total Amount of Families Found = 0"_s);
}

TEST_F(SearchPageTest, AnEmptyListAnswersThatNothingCanBeOpenedOrSearched)
{
    begin();
    running->open_area(u"search"_s);
    settle();
    place.dialogue.expect_box(u"Unable to do a search as no families exist"_s);
    type(window(), u"smi"_s);
    press(window(), Qt::Key_Return);
    place.dialogue.expect_box(u"No families exist for opening"_s);
    for (QAction* action : window().page()->actions())
        if (action->text() == u"Open")
            action->trigger();
}

TEST_F(SearchPageTest, EnterOnAPartListsThoseWhoHaveAnEntryInIt)
{
    open_data_search();
    choose_part(u"Title"_s);
    EXPECT_EQ(shown(entries()), (QStringList{u"Naismith"_s, u"Smith"_s}));
    EXPECT_EQ(shown(entries(), 2), (QStringList{u"Ms"_s, u"Dr (hidden)"_s}));
    EXPECT_EQ(label(u"data_count"_s), u"2 people with an entry in Title"_s);
    EXPECT_EQ(window().page()->status(), u"2 people"_s);

    press(window(), Qt::Key_Tab);
    press(window(), Qt::Key_Down);
    press(window(), Qt::Key_Space);
    const auto cards = desk().windows.all<desktop::FamilyCard>();
    ASSERT_EQ(cards.size(), 1U);
    EXPECT_EQ(cards[0]->surname_id(), stored[0].family.Surname_ID);
}

TEST_F(SearchPageTest, HeadingsOrderTheEntriesAndTheirDatesByTheYear)
{
    auto adder = family(u"Adder"_s, {u"Una"_s, u"Bob"_s});
    adder.people[0].birthdate = core::Date{1977, 12, 30};
    adder.people[1].birthdate = core::Date{1999, 1, 2};
    adder.people[1].Decease = true;
    auto nash = family(u"Nash"_s, {u"Carl"_s});
    nash.people[0].birthdate = core::Date{1980, 6, 15};
    begin({adder, nash});
    running->open_area(u"search"_s);
    settle();
    press(window(), Qt::Key_PageDown, Qt::ControlModifier);
    choose_part(u"Birth Date"_s);
    entries().sortByColumn(2, Qt::DescendingOrder);
    EXPECT_EQ(shown(entries(), 1), (QStringList{u"Bob (Deceased)"_s, u"Carl"_s, u"Una"_s}));
    EXPECT_TRUE(entries().model()->index(0, 1).data(Qt::FontRole).value<QFont>().italic());

    entries().selectRow(2);
    entries().sortByColumn(1, Qt::AscendingOrder);
    EXPECT_EQ(entries().currentIndex().row(), 2) << "Una stays chosen.";
    entries().sortByColumn(0, Qt::AscendingOrder);
    EXPECT_EQ(shown(entries(), 1), (QStringList{u"Una"_s, u"Bob (Deceased)"_s, u"Carl"_s})) << "As families have it.";
    EXPECT_EQ(entries().currentIndex().row(), 0);
    entries().setFocus();
    press(window(), Qt::Key_Return);
    settle();
    EXPECT_TRUE(window().page()->title().contains(u"Adder"_s));
}

TEST_F(SearchPageTest, ThePartsStandInTheirOrder)
{
    open_data_search();
    const auto& parts = child<QListWidget>(page(), u"parts"_s);
    for (const auto& [row, name] :
         {std::pair(0, u"Title"_s), std::pair(1, u"Birth Date"_s), std::pair(2, u"Preferred Given Name"_s),
          std::pair(parts.count() - 1, u"Family Portraits"_s)})
        EXPECT_EQ(parts.item(row)->text(), name);
}

TEST_F(SearchPageTest, APartWithoutItsRightIsRefusedAndListsNobody)
{
    open_data_search();
    choose_part(u"Title"_s);
    desk().office.rights.set(core::Area::birth_dates, false);
    place.dialogue.expect_box(u"Your password does not give access to \"Birth Dates Access\""_s);
    choose_part(u"Birth Date"_s);
    EXPECT_EQ(entries().model()->rowCount(), 0);
    EXPECT_EQ(label(u"data_count"_s), QString());
}

TEST_F(SearchPageTest, ThoseWhoAreListedBecomeTheListOfTaggingOrJoinTheOneThatIsThere)
{
    open_data_search();
    EXPECT_EQ(send_to_tagging(u"Preferred Given Name"_s), QStringList{u"Zora"_s});
    EXPECT_EQ(label(u"state"_s), u"1 person: People with an entry in Preferred Given Name, without the deceased"_s);

    EXPECT_EQ(send_to_tagging(u"Title"_s), (QStringList{u"Ann"_s, u"Zora"_s}));
    EXPECT_EQ(window().page()->note().text(), u"1 person added to the list; on it already: 1."_s);
    child<QPushButton>(page(), u"offer"_s).click();
    EXPECT_EQ(tagged(), QStringList{u"Zora"_s});
    EXPECT_EQ(send_to_tagging(u"Preferred Given Name"_s), QStringList{u"Zora"_s});
    EXPECT_EQ(window().page()->note().text(), u"All of them are on the list already."_s);
    child<QPushButton>(page(), u"as_filtered"_s).click();
    EXPECT_EQ(tagged(), (QStringList{u"Una"_s, u"Ann"_s, u"Ben"_s, u"Zora"_s}));
}

TEST_F(SearchPageTest, TheDeceasedAreNotSentToTagging)
{
    open_data_search();
    const auto dies = [&](const QString& name) {
        desk().office.session->execute(u"UPDATE [tbl_people] SET [Decease]=? WHERE [Name]=?;"_s, true, name);
    };
    dies(u"Ann"_s);
    EXPECT_EQ(send_to_tagging(u"Title"_s), QStringList{u"Zora"_s});
    EXPECT_EQ(label(u"state"_s), u"1 person: People with an entry in Title, without the deceased"_s);
    dies(u"Zora"_s);
    place.dialogue.expect_box(u"Nobody who is listed can be put on the list"_s);
    running->open_area(u"search"_s);
    settle();
    choose_part(u"Title"_s);
    child<QPushButton>(page(), u"to_tagging"_s).click();
    settle();
    EXPECT_EQ(window().page()->objectName(), u"Search"_s);
}

TEST_F(SearchPageTest, AListFromDataSearchStaysWhileTheFilterOfTaggingDoesAndGivesWayToAChangedOne)
{
    open_data_search();
    (void)send_to_tagging(u"Title"_s);
    for (const bool changed : {false, true}) {
        child<QPushButton>(page(), u"filter"_s).click();
        if (changed)
            child<QAbstractButton>(page(), u"contact"_s).click();
        child<QPushButton>(page(), u"sort"_s).click();
        EXPECT_EQ(tagged().size(), changed ? 4 : 2);
    }
}

TEST_F(SearchPageTest, UndoDoesNotBringBackAListFromDataSearchThatAChangedFilterReplaced)
{
    open_data_search();
    (void)send_to_tagging(u"Title"_s);
    auto& list = child<QTableView>(page(), u"working_people"_s);
    list.selectRow(0);
    list.setFocus();
    press(window(), Qt::Key_Delete);
    EXPECT_EQ(tagged(), QStringList{u"Zora"_s});
    child<QPushButton>(page(), u"filter"_s).click();
    child<QAbstractButton>(page(), u"contact"_s).click();
    child<QPushButton>(page(), u"sort"_s).click();
    EXPECT_EQ(tagged(), (QStringList{u"Una"_s, u"Ben"_s, u"Zora"_s}));
    press(window(), Qt::Key_Z, Qt::ControlModifier);
    EXPECT_EQ(tagged(), (QStringList{u"Una"_s, u"Ann"_s, u"Ben"_s, u"Zora"_s}));
}

TEST_F(SearchPageTest, NobodyJoinsTheListOfTaggingWhileItsFilterLacksSomething)
{
    open_data_search();
    running->open_area(u"tagging"_s);
    settle();
    auto& status = child<QComboBox>(page(), u"file_status"_s);
    status.setFocus();
    press(window(), Qt::Key_Home);
    place.dialogue.expect_box(people::no_families_chosen.toString());
    (void)send_to_tagging(u"Title"_s);
    EXPECT_TRUE(child<QPushButton>(page(), u"filter"_s).isChecked());

    press(window(), Qt::Key_Down);
    child<QPushButton>(page(), u"sort"_s).click();
    EXPECT_EQ(tagged().size(), 5) << "All families, as the filter says.";
}

TEST_F(SearchPageTest, OnlyWhoMayTagSendsPeopleToTaggingAndOnlyOnceSomebodyIsListed)
{
    open_data_search();
    const auto& button = child<QPushButton>(page(), u"to_tagging"_s);
    EXPECT_FALSE(button.isEnabled());
    choose_part(u"Title"_s);
    EXPECT_TRUE(button.isEnabled());
    desk().office.rights.set(core::Area::tagging, false);
    choose_part(u"Title"_s);
    EXPECT_FALSE(button.isEnabled());
}

TEST_F(SearchPageTest, HiddenEntriesGoNeitherToPaperNorIntoFiles)
{
    open_data_search();
    choose_part(u"Title"_s);
    const QString file = place.data.drive() + u"titles.csv"_s;
    place.dialogue.expect_file(u"Save this list"_s, file);
    for (QAction* action : window().page()->actions())
        if (action->text() == u"Save as CSV")
            action->trigger();
    const QByteArray saved = DataFolder::read(file);
    EXPECT_TRUE(saved.contains("Naismith,Ann,Ms,")) << saved.toStdString();
    EXPECT_TRUE(saved.contains("Smith,Zora,hidden,")) << saved.toStdString();

    press(window(), Qt::Key_P, Qt::ControlModifier);
    const auto previews = desk().windows.all<desktop::PreviewWindow>();
    ASSERT_EQ(previews.size(), 1U);
    const QStringList texts = pages::texts_of(previews[0]->document().page(1), 1);
    EXPECT_TRUE(texts.contains(u"Ms"_s));
    EXPECT_FALSE(texts.join(u' ').contains(u"Dr"_s));
}

} // namespace kindrel::test
