#pragma once

#include "desktop/desktop_fixture.h"
#include "desktop/output/preview_window.h"
#include "desktop/shell/chip.h"
#include "desktop/shell/page.h"
#include "desktop/shell/rail.h"

#include <QLineEdit>
#include <QListWidget>

namespace kindrel::test {

/// The weekly project "Sunday" with its categories, keys from 1, and the dates 28 April (1) and 5 May 2024 (2).
class WeeklyScreenTest : public DesktopTest
{
protected:
    void start(int attendance = 2, int money = 1)
    {
        begin();
        place.in_database(QStringLiteral("INSERT INTO [tbl_weekly_project] ([weekly_project_id],[weekly_project],"
                                         "[position]) VALUES (1,'Sunday',1);"));
        set_categories(attendance, money);
        for (const auto* row : {"1,'2024-04-28',1", "2,'2024-05-05',1"})
            place.in_database(QStringLiteral("INSERT INTO [tbl_weekly_date] ([weekly_date_id],[weekly_date],"
                                             "[weekly_project_id]) VALUES (%1);")
                                  .arg(QLatin1String(row)));
        place.in_database(QStringLiteral("INSERT INTO [tbl_weekly_amount] ([date_id],[group_id],[amount]) "
                                         "VALUES (2,1,1200000);"));
        (void)session().allocate(core::Entity::weekly_project, 1);
        (void)session().allocate(core::Entity::weekly_group, attendance + money);
        (void)session().allocate(core::Entity::weekly_date, 2);
    }
    /// In place of those that there are.
    void set_categories(int attendance, int money)
    {
        place.in_database(QStringLiteral("DELETE FROM [tbl_weekly_group];"));
        for (int key = 1; key <= attendance + money; ++key)
            place.in_database(QStringLiteral("INSERT INTO [tbl_weekly_group] ([group_id],[group],[position],"
                                             "[group_type],[weekly_project_id]) VALUES (%1,'Category %1',%1,%2,1);")
                                  .arg(key)
                                  .arg(key <= attendance ? 1 : 2));
    }
    [[nodiscard]] core::Session& session() { return *desk().office.session; }
    void open_page()
    {
        act(Qt::Key_7, Qt::ControlModifier);
        ASSERT_EQ(window().page()->objectName(), QStringLiteral("weekly"));
    }
    /// Opens the newest date; the cursor is then in its first figure.
    void open_newest()
    {
        open_page();
        act(Qt::Key_Return);
    }
    void act(Qt::Key key, Qt::KeyboardModifiers modifiers = Qt::NoModifier)
    {
        ++acts;
        press(window(), key, modifiers);
    }
    /// Into whatever has the cursor: the first letter may open a cell that takes the others.
    void write(const QString& text)
    {
        ++acts;
        for (const QChar letter : text)
            type(window(), letter);
    }
    void enter(const QString& text)
    {
        write(text);
        act(Qt::Key_Return);
    }
    void save() { act(Qt::Key_S, Qt::ControlModifier); }
    void close() { act(Qt::Key_W, Qt::ControlModifier); }
    [[nodiscard]] QString in_focus() { return window().focusWidget()->objectName(); }
    [[nodiscard]] QWidget& page() { return *window().page(); }
    [[nodiscard]] desktop::RailMarks marks()
    {
        return child<desktop::RailButton>(window(), QStringLiteral("weekly")).marks();
    }
    [[nodiscard]] std::vector<desktop::PreviewWindow*> previews()
    {
        settle();
        return desk().windows.all<desktop::PreviewWindow>();
    }
    /// "1:120 3:45.5": what is stored for a date, by category.
    [[nodiscard]] QString stored(const QString& date)
    {
        auto rows = session().select(QStringLiteral("SELECT [group_id],[amount] FROM [Qry_weekly_output_anlaysis] "
                                                    "WHERE [weekly_date]=? ORDER BY [group_id];"),
                                     date);
        QStringList figures;
        for (const core::Row& row : rows)
            figures += QStringLiteral("%1:%2")
                           .arg(row.integer(core::Column{0}))
                           .arg(double(row.amount(core::Column{1}).ten_thousandths) / 10000);
        return figures.join(u' ');
    }
    [[nodiscard]] QStringList dates()
    {
        QStringList texts;
        const auto& list = child<QListWidget>(page(), QStringLiteral("dates"));
        for (int row = 0; row < list.count(); ++row)
            texts += list.item(row)->text();
        return texts;
    }

    int acts = 0; ///< Keys pressed and texts typed.
};

} // namespace kindrel::test
