#pragma once

#include "desktop/desktop_fixture.h"
#include "desktop/people/filter_panel.h"
#include "people/filter_words.h"
#include "people/saved_filters.h"
#include "support/families.h"

#include <QAbstractButton>
#include <QComboBox>
#include <QLineEdit>
#include <QListWidget>
#include <QStackedWidget>
#include <QTableView>

#include <algorithm>

namespace kindrel::test {

using namespace Qt::StringLiterals;
using people::FilterItem;

inline const QString active_people = u"Active Families; people who are active, or of no state"_s;

inline people::LinkRow carried(int item, const QString& field = {})
{
    people::LinkRow row;
    row.item = item;
    row.field = field;
    return row;
}

/// Ann is in group 1 and plays piano, Ben is in groups 1 and 2, Cleo in none; Dora of another family is a contact.
inline std::vector<people::FamilyFile> congregation()
{
    auto naismith = family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s, u"Cleo"_s});
    naismith.people[0].groups = {carried(1)};
    naismith.people[0].flexi = {carried(2, u"Piano"_s)};
    naismith.people[1].groups = {carried(1), carried(2)};
    naismith.people[1].birthdate = core::Date{1970, 3, 31};
    naismith.people[2].school_year = -1;
    naismith.residential = people::Suburb{1, people::SuburbType::residential, {}, u"suburb 1"_s, u"3000"_s};
    auto okafor = family(u"Okafor"_s, {u"Dora"_s});
    okafor.people[0].contact = true;
    okafor.people[0].birthdate = core::Date{core::Date::unknown_year, 3, 1};
    return {naismith, okafor};
}

class FilterPanelTest : public DesktopTest
{
protected:
    FilterPanelTest()
    {
        begin(congregation());
        open();
    }

    void open()
    {
        running->open_area(u"filters"_s);
        settle();
    }
    [[nodiscard]] desktop::FilterPanel& panel() { return child<desktop::FilterPanel>(window(), u"filter_panel"_s); }
    /// What is to be read after a pause in typing.
    [[nodiscard]] QString text(const QString& name)
    {
        panel().count_now();
        return child<QLabel>(panel(), name).text();
    }
    /// From the kinds at the left into what the kind offers, by the first letters of its caption.
    void choose_kind(const QString& caption)
    {
        auto& kinds = child<QListWidget>(panel(), u"kinds"_s);
        kinds.setFocus();
        press(window(), Qt::Key_Home);
        while (!kinds.currentItem()->text().startsWith(caption) && kinds.currentRow() + 1 < kinds.count())
            press(window(), Qt::Key_Down);
        press(window(), Qt::Key_Return);
    }
    [[nodiscard]] QString focus() { return window().focusWidget()->objectName(); }
    /// What stands behind an item of the kind in front.
    [[nodiscard]] QString use(int row)
    {
        auto* part = child<QStackedWidget>(panel(), {}).currentWidget();
        const auto* model = child<QTableView>(*part, u"items"_s).model();
        return model->index(row, 1).data().toString();
    }
    void press_button(const QString& name)
    {
        child<QAbstractButton>(window(), name).setFocus();
        press(window(), Qt::Key_Space);
    }
    void save_as(const QString& name)
    {
        press_button(u"save_filter_as"_s);
        type(window(), name);
        press(window(), Qt::Key_Return);
    }
    /// Chooses from a box by its words.
    void choose(const QString& box, const QString& wanted)
    {
        auto& choices = child<QComboBox>(panel(), box);
        choices.setFocus();
        while (choices.currentText() != wanted && choices.currentIndex() + 1 < choices.count())
            press(window(), Qt::Key_Down);
    }
    void type_span(const QString& from, const QString& to)
    {
        child<QLineEdit>(panel(), u"date_from"_s).setFocus();
        type(window(), from);
        child<QLineEdit>(panel(), u"date_to"_s).setFocus();
        type(window(), to);
    }
    [[nodiscard]] QStringList dates()
    {
        QStringList texts;
        for (const auto& criterion : panel().filter().dates)
            texts += people::words_of(criterion, core::DayOrder::day_first);
        return texts;
    }
    /// What the church keeps under the name; nothing when that is not there.
    [[nodiscard]] std::optional<people::Filter> kept(const QString& name)
    {
        const auto all = people::saved_filters(*desk().office.session);
        const auto found = std::ranges::find(all, name, &people::SavedFilter::name);
        return found == all.end() ? std::nullopt : people::load_filter(desk().office, found->filter_id);
    }
    [[nodiscard]] QComboBox& saved() { return child<QComboBox>(panel(), u"saved_filters"_s); }
};

} // namespace kindrel::test
