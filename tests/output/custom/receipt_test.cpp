#include "output/custom/custom_fixture.h"

#include "output/custom/receipts.h"

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

const auto thanks = uR"(receipt
title "Thanks"
each giver
  line [Titles_&_Primary_&_Spouse_Name_&_Surname]
  line [full_name]
  line [mailing_address lines]
  line "P.I.N. " [personal_pin]
  line [project] ", " [from] " to " [to]
  line [gifts] " gifts, " [total]
  line [gift_list lines]
  line [today] ", " [church_name]
end
  line [person_count] " receipts"
)"_s;

class ReceiptTest : public CustomTest
{
protected:
    [[nodiscard]] output::ReceiptGiver giver(std::size_t place, const QString& total) const
    {
        return {list.members[place],
                {u"Building Fund"_s, u"01/07/2023"_s, u"30/06/2024"_s, total, 2, {u"01/08/2023 $5.00"_s, u"x"_s}}};
    }
    [[nodiscard]] bool run(const output::CustomReport& receipt, const std::vector<output::ReceiptGiver>& givers)
    {
        return output::run_receipts(office, receipt, givers, options, progress, spool);
    }

    pages::PageSpool spool;
};

} // namespace

TEST_F(ReceiptTest, EachGiverGetsAPageWithTheirDetailsAndWhatTheyGave)
{
    auto one = family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s});
    one.people[0].Title = u"Mrs"_s;
    one.people[1].Title = u"Mr"_s;
    one.people[1].personal_pin = u"77"_s;
    one.address.post_street = u"PO Box 1"_s;
    add({one, family(u"Zuse"_s, {u"Konrad"_s})});

    ASSERT_TRUE(run(lay(u"thanks.rct"_s, thanks), {giver(2, u"$10.00"_s), giver(1, u"$25.50"_s)}));

    const auto pages = read_back(spool);
    ASSERT_EQ(pages.size(), 2u);
    const QStringList gave{u"01/08/2023 $5.00"_s, u"x"_s, u"15/05/2024, St Aidan's"_s};
    EXPECT_EQ(told(pages[0]), told(QStringList{u"Konrad Zuse"_s, u"Konrad Zuse"_s,
                                               u"Building Fund, 01/07/2023 to 30/06/2024"_s, u"2 gifts, $10.00"_s} +
                                   gave));
    EXPECT_EQ(told(pages[1]),
              told(QStringList{u"Mrs & Mr Ann & Ben Naismith"_s, u"Mr Ben Naismith"_s, u"PO Box 1"_s, u"P.I.N. 77"_s,
                               u"Building Fund, 01/07/2023 to 30/06/2024"_s, u"2 gifts, $25.50"_s} +
                   gave + QStringList{u"2 receipts"_s}));
}

TEST_F(ReceiptTest, SeveralReceiptsShareAPageWhereTheLayoutSaysSo)
{
    add({family(u"Abel"_s, {u"Ann"_s}), family(u"Zuse"_s, {u"Konrad"_s})});

    ASSERT_TRUE(run(lay(u"small.rct"_s, u"many to a page\neach giver\nline [Name] \" \" [total]\nrule"_s),
                    {giver(0, u"$1.00"_s), giver(1, u"$2.00"_s)}));

    EXPECT_EQ(told(read_back(spool).front()), "Ann $1.00\nKonrad $2.00");
}

TEST_F(ReceiptTest, WhatTheGiverKeepsHiddenStaysOffTheReceipt)
{
    auto one = full_family(true);
    add({one});
    office.rights.set(core::Area::full_financial, false);
    office.rights.set(core::Area::pin_financial_only, false);

    ASSERT_TRUE(run(lay(u"thanks.rct"_s, thanks), {giver(0, u"$1.00"_s)}));

    const auto text = read_back(spool).front().join(u'\n');
    EXPECT_TRUE(text.contains(u"Zoë Żółć-O’Brien"_s)) << text.toStdString();
    for (const auto& word : {u"ZoëTitle"_s, u"addressrestreet"_s, u"addresspoststreet"_s, u"suburb"_s, u"P.I.N."_s})
        EXPECT_FALSE(text.contains(word)) << word.toStdString();
}

TEST_F(ReceiptTest, NobodyAndAReportThatIsNoReceiptAreRefused)
{
    add({family(u"Abel"_s, {u"Ann"_s})});
    dialogue.expect_box(u"No people found for creating a report"_s);
    EXPECT_FALSE(run(lay(u"thanks.rct"_s, thanks), {}));
    dialogue.expect_box(u"\"list.rct\" is a report and no receipt."_s);
    EXPECT_FALSE(run(lay(u"list.rct"_s, u"report per person\neach person\nline [Name]"_s), {giver(0, u"$1.00"_s)}));
    EXPECT_FALSE(spool.finished());
}

TEST_F(ReceiptTest, ReceiptsAreAddressedToTheLivingAndAGiverWhoHasDiedKeepsTheirName)
{
    auto couple = family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s, u"Cid"_s});
    couple.people[0].Decease = couple.people[2].Decease = true;
    add({couple});

    ASSERT_TRUE(run(lay(u"thanks.rct"_s, u"many to a page\neach giver\nline [Primary_&_Spouse_Name] \" for \" [Name] "
                                         "{ \" and \" [Children_Names] }"_s),
                    {giver(0, u"$1.00"_s), giver(1, u"$2.00"_s)}));

    EXPECT_EQ(told(read_back(spool).front()), "Ben for Ann\nBen for Ben");
}

TEST_F(ReceiptTest, TheEndCountsFamiliesAndPeopleAndNotReceipts)
{
    add({family(u"Abel"_s, {u"Ann"_s, u"Ben"_s}), family(u"Zuse"_s, {u"Konrad"_s})});

    ASSERT_TRUE(run(lay(u"small.rct"_s, u"many to a page\neach giver\nline [number]\nend\n"
                                        "line [family_count] \" families, \" [person_count] \" people\""_s),
                    {giver(0, u"$1.00"_s), giver(1, u"$2.00"_s), giver(2, u"$3.00"_s), giver(2, u"$4.00"_s)}));

    EXPECT_EQ(told(read_back(spool).front()), "1\n2\n3\n4\n2 families, 3 people");
}

TEST_F(ReceiptTest, AGiverWhoIsNoLongerInTheRegisterGetsNone)
{
    add({family(u"Abel"_s, {u"Ann"_s})});
    auto gone = giver(0, u"$2.00"_s);
    gone.giver = {999, 999};

    ASSERT_TRUE(run(lay(u"thanks.rct"_s, u"each giver\nline [Name] \" \" [total]"_s), {gone, giver(0, u"$1.00"_s)}));

    EXPECT_EQ(told(read_back(spool).front()), "Ann $1.00");
}

} // namespace kindrel::test
