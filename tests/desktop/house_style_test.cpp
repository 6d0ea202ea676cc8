#include "desktop/areas.h"
#include "desktop/people/family_card.h"
#include "desktop/people/step_bar.h"
#include "desktop/shell/note_bar.h"
#include "desktop/shell/page.h"
#include "desktop/shell/palette.h"
#include "desktop/weekly_fixture.h"
#include "people/family_store.h"
#include "support/families.h"

#include <QAction>
#include <QCheckBox>
#include <QComboBox>
#include <QLineEdit>
#include <QListWidget>
#include <QMap>
#include <QSet>
#include <QShortcut>
#include <QStyle>
#include <QTabBar>

#include <algorithm>
#include <cmath>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

using HouseStyleTest = WeeklyScreenTest;

qreal luminance(QColor colour)
{
    const auto linear = [](float part) {
        return part <= 0.04045F ? qreal(part) / 12.92 : std::pow((qreal(part) + 0.055) / 1.055, 2.4);
    };
    return 0.2126 * linear(colour.redF()) + 0.7152 * linear(colour.greenF()) + 0.0722 * linear(colour.blueF());
}

qreal contrast(QColor one, QColor other)
{
    const auto [dark, light] = std::minmax({luminance(one), luminance(other)});
    return (light + 0.05) / (dark + 0.05);
}

/// The best contrast against the window along a line down the middle of the `width` left-most pixels.
qreal strongest_edge(QWidget& widget, int width)
{
    const QImage picture = widget.grab().toImage();
    const QColor ground = widget.palette().color(QPalette::Window);
    qreal best = 1;
    for (int y = 0; y < picture.height(); ++y)
        best = std::max(best, contrast(picture.pixelColor(width / 2, y), ground));
    return best;
}

/// Of buttons, tabs and the captions of fields.
QStringList captions_in_sight(const QWidget& window)
{
    QStringList captions;
    for (const auto* widget : window.findChildren<QWidget*>()) {
        if (!widget->isVisible())
            continue;
        if (const auto* button = qobject_cast<const QAbstractButton*>(widget))
            captions += button->text();
        else if (const auto* label = qobject_cast<const QLabel*>(widget); label && label->buddy())
            captions += label->text();
        else if (const auto* tabs = qobject_cast<const QTabBar*>(widget))
            for (int tab = 0; tab < tabs->count(); ++tab)
                captions += tabs->tabText(tab);
    }
    return captions;
}

/// Alt and a letter that need no caption, each with whose they are.
std::vector<std::pair<QKeySequence, QString>> bare_letters_in_sight(const QWidget& window)
{
    std::vector<std::pair<QKeySequence, QString>> letters;
    const auto add = [&](const QKeySequence& keys, const QObject* of, const QString& words) {
        const auto* widget = qobject_cast<const QWidget*>(of);
        const bool is_letter = keys.count() == 1 && keys[0].keyboardModifiers() == Qt::AltModifier &&
                               keys[0].key() >= Qt::Key_A && keys[0].key() <= Qt::Key_Z;
        if (is_letter && widget && widget->isVisible())
            letters.emplace_back(keys, words);
    };
    for (const auto* shortcut : window.findChildren<QShortcut*>())
        add(shortcut->key(), shortcut->parent(),
            u"a key of %1"_s.arg(QLatin1StringView(shortcut->parent()->metaObject()->className())));
    for (const auto* action : window.findChildren<QAction*>())
        add(action->shortcut(), action->parent(), action->text());
    return letters;
}

/// The letters that are taken more than once, each with what takes them.
QStringList doubled_letters(const QWidget& window)
{
    QMap<QString, QStringList> by_letter;
    for (const QString& caption : captions_in_sight(window))
        if (const auto keys = QKeySequence::mnemonic(caption); !keys.isEmpty())
            by_letter[keys.toString()] += caption;
    for (const auto& [keys, words] : bare_letters_in_sight(window))
        by_letter[keys.toString()] += words;
    QStringList doubled;
    for (const auto& [letter, captions] : by_letter.asKeyValueRange())
        if (captions.size() > 1)
            doubled += letter + u": "_s + captions.join(u", "_s);
    return doubled;
}

/// Something that shows one of several parts of a page.
struct Turner
{
    QObject* what;
    int parts;
    std::function<void(int)> turn;
};

std::vector<Turner> turners_of(const QWidget& page)
{
    std::vector<Turner> found;
    for (auto* tabs : page.findChildren<QTabBar*>())
        found.push_back({tabs, tabs->count(), [tabs](int tab) {
                             tabs->setCurrentIndex(tab);
                         }});
    for (auto* kinds : page.findChildren<QListWidget*>(u"kinds"_s))
        found.push_back({kinds, kinds->count(), [kinds](int row) {
                             kinds->setCurrentRow(row);
                         }});
    for (const QString& name : {u"kind"_s, u"date_span"_s})
        for (auto* box : page.findChildren<QComboBox*>(name))
            found.push_back({box, box->count(), [box](int row) {
                                 box->setCurrentIndex(row);
                             }});
    for (auto* bar : page.findChildren<desktop::StepBar*>())
        found.push_back({bar, desktop::StepBar::step_count, [bar](int step) {
                             Q_EMIT bar->wanted(desktop::StepBar::Step(step));
                         }});
    std::erase_if(found, [](const Turner& turner) { return !static_cast<QWidget*>(turner.what)->isVisible(); });
    return found;
}

/// Shows every part of the page, and chooses the first row of every list on it.
void turn_all(QWidget& page, QSet<QObject*> turned, const std::function<void()>& check)
{
    for (auto* list : page.findChildren<QAbstractItemView*>())
        if (list->isVisible() && list->model() && list->model()->rowCount() > 0 && !list->currentIndex().isValid())
            list->setCurrentIndex(list->model()->index(0, 0));
    settle();
    check();
    for (const auto& [what, parts, turn] : turners_of(page)) {
        if (turned.contains(what))
            continue;
        turned.insert(what);
        for (int part = 0; part < parts; ++part) {
            turn(part);
            settle();
            turn_all(page, turned, check);
        }
    }
}

/// The letters that are taken more than once anywhere on the page of the window.
std::string doubled_anywhere(const QWidget& window, QWidget& page)
{
    QSet<QString> doubled;
    turn_all(page, {}, [&] {
        for (const QString& letter : doubled_letters(window))
            doubled.insert(letter);
    });
    return QStringList(doubled.values()).join(u"; "_s).toStdString();
}

} // namespace

TEST_F(HouseStyleTest, NoTwoCaptionsInSightTakeTheSameLetter)
{
    start();
    const auto naismith = people::save_family(session(), full_family(false), place.clock.today()).family.Surname_ID;
    for (const auto& area : desktop::all_areas()) {
        const QString key = QString::fromLatin1(area.key);
        running->open_area(key);
        settle();
        auto& page = *window().page();
        if (key == u"tagging")
            page.note().offer(u"Done."_s, u"&Undo"_s, [] {});
        else if (key == u"weekly")
            press(window(), Qt::Key_Return); // Opens the newest date.
        EXPECT_EQ(doubled_anywhere(window(), page), std::string()) << area.key;
    }
    running->open_family(naismith, {}, {}); // What was in the editor before is a new family.
    settle();
    EXPECT_EQ(doubled_anywhere(window(), *window().page()), std::string());
    desktop::open_family_card(desk(), {naismith}, 0);
    auto& card = *desk().windows.all<desktop::FamilyCard>().front();
    EXPECT_EQ(doubled_anywhere(card, card), std::string());
}

TEST_F(HouseStyleTest, WhatIsTickedOrFilledInHasAnEdgeThatCanBeSeen)
{
    for (const auto appearance : {desktop::Appearance::light, desktop::Appearance::dark}) {
        look.apply(appearance, 100);
        QCheckBox box;
        QLineEdit field;
        EXPECT_GE(strongest_edge(box, box.style()->pixelMetric(QStyle::PM_IndicatorWidth)), 3) << int(appearance);
        EXPECT_GE(strongest_edge(field, field.sizeHint().width()), 3) << int(appearance);
    }
}

TEST_F(HouseStyleTest, ATickCanBeToldFromAnEmptyBoxAndFromNeither)
{
    for (const auto appearance : {desktop::Appearance::light, desktop::Appearance::dark}) {
        look.apply(appearance, 100);
        QCheckBox box;
        box.setTristate(true);
        std::vector<QImage> pictures;
        for (const auto state : {Qt::Unchecked, Qt::PartiallyChecked, Qt::Checked}) {
            box.setCheckState(state);
            pictures.push_back(box.grab().toImage());
        }
        EXPECT_TRUE(pictures[0] != pictures[1] && pictures[1] != pictures[2] && pictures[0] != pictures[2]);
    }
}

} // namespace kindrel::test
