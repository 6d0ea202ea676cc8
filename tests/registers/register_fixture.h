#pragma once

#include "people/editor_fixture.h"
#include "registers/weekly_register.h"

namespace kindrel::test {

/// Two weekly projects: 1, "Sunday", with the categories 1 "Morning", 2 "Evening" and 3 "Offering"; 2, "Youth", with
/// category 4 "Youth". Another workstation can come in.
class RegisterTest : public EngineTest
{
protected:
    void SetUp() override
    {
        EngineTest::SetUp();
        if (!church)
            return;
        using core::to_value;
        const auto text = [](const char16_t* words) {
            return to_value(QString::fromUtf16(words));
        };
        const auto number = [](int value) {
            return to_value(value);
        };
        session().insert(
            QStringLiteral("tbl_weekly_project"),
            {QStringLiteral("weekly_project_id"), QStringLiteral("weekly_project"), QStringLiteral("position")},
            std::array{std::vector{number(1), text(u"Sunday"), number(1)},
                       std::vector{number(2), text(u"Youth"), number(2)}});
        session().insert(QStringLiteral("tbl_weekly_group"),
                         {QStringLiteral("group_id"), QStringLiteral("group"), QStringLiteral("position"),
                          QStringLiteral("group_type"), QStringLiteral("weekly_project_id")},
                         std::array{std::vector{number(1), text(u"Morning"), number(1), number(1), number(1)},
                                    std::vector{number(2), text(u"Evening"), number(2), number(1), number(1)},
                                    std::vector{number(3), text(u"Offering"), number(1), number(2), number(1)},
                                    std::vector{number(4), text(u"Youth"), number(1), number(1), number(2)}});
        (void)session().allocate(core::Entity::weekly_project, 2);
        (void)session().allocate(core::Entity::weekly_group, 4);
        desk.emplace(*church);
        other.emplace(*church);
        other->workstation.machine = QStringLiteral("office-2");
        weekly.emplace(desk->office);
    }
    [[nodiscard]] core::Office& office() { return desk->office; }
    [[nodiscard]] ScriptedDialogue& dialogue() { return desk->dialogue; }
    [[nodiscard]] qint64 count(const QString& of)
    {
        return number_of(session(), QStringLiteral("SELECT COUNT(*) FROM ") + of + u';');
    }
    [[nodiscard]] qint64 locks() { return count(QStringLiteral("[tbl_weekly_locked]")); }

    /// Opens the register on "Sunday", adds the dates and leaves the last of them open.
    void start_with(std::initializer_list<core::Date> dates)
    {
        ASSERT_TRUE(weekly->enter());
        for (const auto& date : dates)
            ASSERT_TRUE(weekly->add(date));
    }
    /// The first rows' figures.
    void type(registers::WeeklyRegister& on, std::initializer_list<const char16_t*> figures)
    {
        for (int row = 0; const auto* figure : figures)
            ASSERT_TRUE(on.enter_figure(row++, QString::fromUtf16(figure)));
    }
    /// "1:120 3:$45.50": what is stored for a date, by category.
    [[nodiscard]] QString stored(const core::Date& date)
    {
        auto rows = session().select(
            QStringLiteral("SELECT [group_id],[amount],[group_type] FROM [Qry_weekly_output_anlaysis] WHERE "
                           "[weekly_date]=? ORDER BY [group_id];"),
            date);
        QStringList figures;
        for (const core::Row& row : rows)
            figures += row.text(core::Column{0}) + u':' +
                       registers::shown_figure(row.amount(core::Column{1}),
                                               static_cast<registers::FigureKind>(row.integer(core::Column{2})));
        return figures.join(u' ');
    }

    static constexpr core::Date first{2024, 4, 28}, second{2024, 5, 5}, third{2024, 5, 12};
    std::optional<SetupOffice> desk, other;
    std::optional<registers::WeeklyRegister> weekly;
};

} // namespace kindrel::test
