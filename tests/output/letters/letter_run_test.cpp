#include "output/letters/letter_run.h"

#include "core/files.h"
#include "output/output_fixture.h"
#include "output/report_choices.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

const pages::TextStyle usual = output::letter_style();
const core::Message uneven{u"You have incorrectly used the removal filter, an uneven amount are on this letter, as a "
                           "removal filter must have one before an object and after an object, so an even amount must "
                           "exist on the letter."_s,
                           u"Please fix this up before continuing."_s};
const QString in_use = u"Unable to do anything with this letter as another user is using it."_s;
const QString one_user =
    u"To protect the integrity of your data, Kindrel only allows each custom letter to be used by one user at a time. "
    "If no user is on the system then you will need to enter the 'Network Setup' area to unlock the Custom Letter."_s;

/// A paragraph for each line; a line that begins with "/", marker or not, begins a page.
output::LetterText letter_of(const QString& text)
{
    output::LetterText letter;
    for (const auto& line : text.split(u'\n'))
        letter.paragraphs.push_back({{{line, usual}}, {.new_page = QString(line).remove(u"[R]"_s).startsWith(u'/')}});
    return letter;
}

class LetterRunTest : public ReportTest
{
protected:
    LetterRunTest() { core::make_folder(office.paths.folder(core::Folder::letter)); }

    QString lay(const QString& text, const QString& name = u"Welcome.ltr"_s)
    {
        const auto file = office.paths.folder(core::Folder::letter) + name;
        output::save_letter(file, letter_of(text));
        return file;
    }
    [[nodiscard]] bool run_letter(const QString& text, pages::PageSpool& spool)
    {
        return output::run_letter(lay(text), {office, list, options}, progress, spool);
    }
    /// The texts of each page.
    [[nodiscard]] std::vector<QStringList> copies(const QString& text)
    {
        pages::PageSpool spool;
        EXPECT_TRUE(run_letter(text, spool));
        std::vector<QStringList> all;
        for (int number = 1; number <= spool.page_count(); ++number)
            all.push_back(pages::texts_of(spool.page(number), spool.page_count()));
        return all;
    }
    [[nodiscard]] output::ReportChoice choice(const QString& leaf)
    {
        const auto choices = output::report_choices(office);
        const auto found = std::ranges::find(choices, leaf, &output::ReportChoice::leaf);
        EXPECT_NE(found, choices.end()) << leaf.toStdString();
        return *found;
    }
};

TEST_F(LetterRunTest, MakesACopyForEachFamilyInTheOrderOfTheList)
{
    auto adams = family(u"Adams"_s, {u"Ann"_s, u"Bill"_s, u"Cath"_s});
    adams.people[0].Title = u"Dr"_s;
    add({adams, family(u"Zorn"_s, {u"Dora"_s})});
    std::ranges::reverse(list.members);

    EXPECT_EQ(copies(u"Dear [Primary_&_Spouse_Name],\nwelcome.\n[R][Children_Names][R]\n[Primary_Title] [Surname]"_s),
              (std::vector<QStringList>{{u"Dear Dora,"_s, u"welcome."_s, u" Zorn"_s},
                                        {u"Dear Ann & Bill,"_s, u"welcome."_s, u"Cath"_s, u"Dr Adams"_s}}));
    EXPECT_EQ(progress.ends, 1);
}

TEST_F(LetterRunTest, WritesToTheWholeFamilyWhoeverOfItIsOnTheList)
{
    add({family(u"Adams"_s, {u"Ann"_s, u"Bill"_s, u"Cath"_s})});
    list.members = {list.members.back()};

    EXPECT_EQ(copies(u"[Primary_&_Spouse_Name] [Children_Names]"_s),
              (std::vector<QStringList>{{u"Ann & Bill Cath"_s}}));
}

TEST_F(LetterRunTest, PrintsNothingThatASwitchHides)
{
    const auto hidden = full_family(true);
    add({hidden});
    QString all;
    for (const auto& field : output::letter_fields())
        all += QStringView(field.text).toString() + u'\n';

    const auto copy = copies(all).front().join(u'\n');

    EXPECT_TRUE(copy.contains(u"Zoë Żółć-O’Brien"_s)) << copy.toStdString();
    EXPECT_TRUE(copy.contains(u"15/05/24"_s));
    for (const auto& word : hidden_words(hidden))
        EXPECT_FALSE(copy.contains(word)) << word.toStdString();
}

TEST_F(LetterRunTest, KeepsLongLettersAndTheirPagesApart)
{
    add({family(u"Adams"_s, {u"Ann"_s}), family(u"Zorn"_s, {u"Dora"_s})});
    const auto filling = QStringList(120, u"line"_s).join(u'\n');
    const auto pages = copies(u"/[Surname]\n"_s + filling + u"\n/[Primary_Name]"_s);

    ASSERT_EQ(pages.size(), 8);
    for (const auto& [page, surname, name] : {std::tuple{0, u"/Adams"_s, u"/Ann"_s}, {4, u"/Zorn"_s, u"/Dora"_s}}) {
        EXPECT_EQ(pages[std::size_t(page)].front(), surname);
        EXPECT_EQ(pages[std::size_t(page) + 3], QStringList(name));
    }
}

TEST_F(LetterRunTest, StandsWithinTheMarginsOfEitherPaper)
{
    add({family(u"Adams"_s, {u"Ann"_s})});
    for (const auto paper : {pages::Paper::a4, pages::Paper::letter}) {
        options.paper = paper;
        pages::PageSpool spool;
        ASSERT_TRUE(run_letter(QStringList(300, u"word"_s).join(u' '), spool));
        const auto page = spool.page(1);
        EXPECT_EQ(page.size, pages::PageSetup{.paper = paper}.size());
        qreal right = 0;
        for (const auto& item : page.items) {
            const auto& text = std::get<pages::TextItem>(item);
            EXPECT_GE(text.at.x(), 72);
            right = std::max(right, text.at.x() + text.width);
        }
        EXPECT_LE(right, page.size.width() - 72);
        EXPECT_GT(right, page.size.width() - 120);
    }
}

TEST_F(LetterRunTest, PrintsPicturesOnceForAllCopiesInTheSizeThatTheyHave)
{
    add({family(u"Adams"_s, {u"Ann"_s}), family(u"Zorn"_s, {u"Dora"_s})});
    QImage image(40, 20, QImage::Format_RGB32);
    image.fill(0xff336699);
    const auto png = pages::Picture::from_image(image).encoded();
    auto letter = letter_of(u"above\nbelow"_s);
    letter.paragraphs[0].runs.push_back({{}, usual, {png, {80, 40}}});
    letter.paragraphs[0].shape.align = pages::Align::right;
    const auto file = lay({});
    output::save_letter(file, letter);

    pages::PageSpool spool;
    ASSERT_TRUE(output::run_letter(file, {office, list}, progress, spool));

    for (const int number : {1, 2}) {
        const auto page = spool.page(number);
        const auto* picture = std::get_if<pages::PictureItem>(&page.items[1]);
        ASSERT_TRUE(picture);
        EXPECT_EQ(picture->where.size(), QSizeF(80, 40));
        EXPECT_NEAR(picture->where.right(), page.size.width() - 72, 0.01);
        EXPECT_EQ(picture->picture.encoded(), png);
    }
}

TEST_F(LetterRunTest, KeepsAPageThatAnEmptiedParagraphWasToBegin)
{
    add({family(u"Adams"_s, {u"Ann"_s}), family(u"Zorn"_s, {u"Dora"_s, u"Emil"_s})});
    const auto with_spouse = std::vector<QStringList>{{u"a"_s}, {u"/Emil"_s, u"b"_s}};

    for (const auto& next : {u"b"_s, u"[R]b[R]"_s}) // Laid out once for all copies, or for each.
        EXPECT_EQ(copies(u"a\n[R]/[Spouse_Name][R]\n"_s + next),
                  (std::vector<QStringList>{{u"a"_s}, {u"b"_s}, with_spouse[0], with_spouse[1]}));
    EXPECT_EQ(copies(u"a\n[R]/[Spouse_Name][R]"_s), (std::vector<QStringList>{{u"a"_s}, {u"a"_s}, {u"/Emil"_s}}));
}

TEST_F(LetterRunTest, IsRefusedBeforeTheFirstPage)
{
    const auto refused = [&](const QString& text, const core::Message& told) {
        dialogue.expect_box(told.text, told.more);
        pages::PageSpool spool;
        EXPECT_FALSE(run_letter(text, spool));
        EXPECT_EQ(spool.page_count(), 0);
        EXPECT_FALSE(spool.finished());
        dialogue.verify();
    };
    refused(u"Dear all"_s, {u"No people found for creating a report"_s});
    add({family(u"Adams"_s, {u"Ann"_s})});
    refused(u"[R][Surname]"_s, uneven);
    refused(u"a[R] [R]"_s, {u"A removal filter exists on this letter that does not have an object between it"_s});
    office.rights = {};
    refused(u"Dear all"_s, {u"Your password does not give access to \"Report Outputs\""_s});
    EXPECT_EQ(progress.taken, 0);
}

TEST_F(LetterRunTest, TellsWhatIsWrongWithADamagedFile)
{
    add({family(u"Adams"_s, {u"Ann"_s})});
    const auto file = lay(u"Dear all"_s);
    core::write_file(file, "{\\rtf1 Dear all");
    dialogue.expect_box(u"The letter \"Welcome.ltr\" cannot be used."_s, u"It is damaged: its end is missing."_s);

    pages::PageSpool spool;
    EXPECT_FALSE(output::run_letter(file, {office, list}, progress, spool));
}

TEST_F(LetterRunTest, StopsWhereItIsCancelledAndAsksAsReportsDo)
{
    add({family(u"Adams"_s, {u"Ann"_s}), family(u"Zorn"_s, {u"Dora"_s})});
    progress.cancel_at = 1;

    pages::PageSpool spool;
    EXPECT_FALSE(run_letter(u"Dear all"_s, spool));
    EXPECT_FALSE(spool.finished());
    EXPECT_EQ(progress.question, u"Are you sure that you wish to cancel this report?"_s);
}

TEST_F(LetterRunTest, EveryLetterOfTheTreeRunsWithTheAddressThatIsChosenAndSaysWhenItIsPrinted)
{
    auto boxed = family(u"Adams"_s, {u"Ann"_s});
    boxed.address.post_street = u"Box 5"_s;
    boxed.address.res_street = u"3 Mill Lane"_s;
    auto at_home = family(u"Zorn"_s, {u"Dora"_s});
    at_home.address.res_street = u"1 High Street"_s;
    add({boxed, at_home});
    const auto letter = letter_of(u"[____Street_Address____]"_s);
    lay(u"[____Street_Address____]"_s);
    core::make_folder(office.paths.folder(core::Folder::plugin_letters));
    output::save_letter(office.paths.file(core::Folder::plugin_letters, u"easter.ltr"_s), letter);
    office.plugins.letters = {{u"easter.ltr"_s, u"Easter Greeting"_s}};

    for (const auto& leaf : {u"Welcome"_s, u"Easter Greeting (Plugin Letters)"_s}) {
        const auto chosen = choice(leaf);
        EXPECT_EQ(chosen.family, u"Custom Letters"_s);
        EXPECT_EQ(chosen.printed, u"Letter Printing is now completed"_s);
        for (const auto& [address, first, second] :
             {std::tuple{output::RunOptions{}.address, u"Box 5"_s, u"1 High Street"_s},
              {output::LetterAddress::residential, u"3 Mill Lane"_s, u"1 High Street"_s},
              {output::LetterAddress::postal, u"Box 5"_s, u""_s}}) {
            pages::PageSpool spool;
            ASSERT_TRUE(chosen.run({office, list, {.address = address}}, progress, spool));
            ASSERT_EQ(spool.page_count(), 2);
            EXPECT_EQ(pages::texts_of(spool.page(1), 2).join(u'|'), first);
            EXPECT_EQ(pages::texts_of(spool.page(2), 2).join(u'|'), second);
        }
    }
}

TEST_F(LetterRunTest, TheLettersThatComeWithTheProgramRunAndAreWrittenByIt)
{
    auto full = full_family(false);
    full.people[1].Decease = false;
    add({full, family(u"Adams"_s, {u"Ann"_s})});
    for (const auto& name : {u"welcome.ltr"_s, u"holiday_club.ltr"_s}) {
        const auto file = QStringLiteral(KINDREL_SAMPLES "/") + name;
        pages::PageSpool spool;
        ASSERT_TRUE(output::run_letter(file, {office, list}, progress, spool));
        ASSERT_EQ(spool.page_count(), 2) << name.toStdString();
        for (const int number : {1, 2})
            EXPECT_FALSE(pages::texts_of(spool.page(number), 2).join(u' ').contains(u'[')) << name.toStdString();
        EXPECT_EQ(output::letter_bytes(output::load_letter(file).letter), core::read_file(file));
    }
}

TEST_F(LetterRunTest, IsDrawnInTheTreeWithoutABoxWhateverIsWrongWithIt)
{
    add({family(u"Adams"_s, {u"Ann"_s}), family(u"Zorn"_s, {u"Dora"_s})});
    office.mode = core::Mode::network;
    core::Locks locks(office);
    ASSERT_TRUE(locks.take(core::LockKind::custom_letter, u"Welcome"_s));

    lay(u"Dear [Primary_Name]"_s);
    const auto page = output::first_page(choice(u"Welcome"_s), {office, list});
    ASSERT_TRUE(page);
    EXPECT_EQ(pages::texts_of(*page, 1), QStringList(u"Dear Ann"_s));
    for (const auto& text : {u"[R]"_s, u"[R][R]"_s}) {
        lay(text);
        EXPECT_EQ(output::first_page(choice(u"Welcome"_s), {office, list}), std::nullopt);
    }
    core::write_file(lay({}), "no letter");
    EXPECT_EQ(output::first_page(choice(u"Welcome"_s), {office, list}), std::nullopt);
}

/// A church that several workstations share.
class LetterLockTest : public EngineTest
{
protected:
    void SetUp() override
    {
        EngineTest::SetUp();
        if (IsSkipped())
            return;
        const auto folder = church->folder() + u'/';
        office.emplace(core::Office{.paths = core::Paths(folder, folder, folder, core::Mode::network, 1),
                                    .mode = core::Mode::network,
                                    .workstation = workstation,
                                    .dialogue = dialogue,
                                    .clock = clock});
        office->session = church->another();
        office->rights = core::Rights::all();
        const auto stored = people::save_family(session(), family(u"Adams"_s, {u"Ann"_s}), clock.today());
        list.members = {{stored.people.front().person_id, stored.family.Surname_ID}};
        core::make_folder(office->paths.folder(core::Folder::letter));
        output::save_letter(file(), letter_of(u"Dear [Primary_Name]"_s));
    }
    [[nodiscard]] QString file() const { return office->paths.folder(core::Folder::letter) + u"Welcome.ltr"_s; }
    [[nodiscard]] bool run(core::Progress& progress)
    {
        pages::PageSpool spool;
        return output::run_letter(file(), {*office, list}, progress, spool);
    }

    FakeWorkstation workstation;
    ScriptedDialogue dialogue;
    FixedClock clock;
    std::optional<core::Office> office;
    people::WorkingList list;
};

/// Looks at each step whether the letter is locked.
class LockWatch : public core::SilentProgress
{
public:
    explicit LockWatch(core::Locks locks) : m_locks(locks) {}
    [[nodiscard]] bool step(const QString&) override
    {
        locked = m_locks.check(core::LockKind::custom_letter, u"Welcome"_s);
        return true;
    }
    bool locked = false;

private:
    core::Locks m_locks;
};

TEST_P(LetterLockTest, ALetterIsLockedWhileItRunsAndFreeAfterwards)
{
    core::Locks elsewhere(session(), workstation, clock);
    LockWatch progress(elsewhere);

    EXPECT_TRUE(run(progress));

    EXPECT_TRUE(progress.locked);
    EXPECT_EQ(elsewhere.count(core::LockKind::custom_letter), 0);
}

TEST_P(LetterLockTest, ALetterThatSomebodyHasIsRefusedAndStaysTheirs)
{
    FakeWorkstation other;
    other.machine = u"office-2"_s;
    core::Locks elsewhere(session(), other, clock);
    ASSERT_TRUE(elsewhere.take(core::LockKind::custom_letter, u"Welcome"_s));
    dialogue.expect_box(
        in_use,
        one_user + u"\nCustom letter 'Welcome' is held by the workstation 'office-2' since 10:30 on 15/05/2024."_s);

    core::SilentProgress progress;
    EXPECT_FALSE(run(progress));

    EXPECT_EQ(elsewhere.count(core::LockKind::custom_letter), 1);
}

TEST_P(LetterLockTest, ARefusedLetterIsNotLeftLocked)
{
    output::save_letter(file(), letter_of(u"[R]"_s));
    dialogue.expect_box(uneven.text, uneven.more);

    core::SilentProgress progress;
    EXPECT_FALSE(run(progress));

    EXPECT_EQ(core::Locks(*office).count(core::LockKind::custom_letter), 0);
}

KINDREL_ON_BOTH_ENGINES(LetterLockTest);

} // namespace

} // namespace kindrel::test
