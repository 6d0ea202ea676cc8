#include "desktop/desktop_fixture.h"
#include "desktop/people/step_bar.h"
#include "desktop/shell/note_bar.h"
#include "desktop/shell/page.h"
#include "desktop/shell/palette.h"
#include "support/families.h"

#include <QCheckBox>
#include <QComboBox>
#include <QLineEdit>
#include <QListWidget>
#include <QMap>
#include <QSet>
#include <QStyle>
#include <QTabBar>

#include <algorithm>
#include <cmath>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

using HouseStyleTest = DesktopTest;

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

/// What can be reached by Alt and a letter now: of buttons, tabs and the captions of fields.
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

/// The letters that more than one caption takes, each with these captions.
QStringList doubled_letters(const QWidget& window)
{
    QMap<QString, QStringList> by_letter;
    for (const QString& caption : captions_in_sight(window))
        if (const auto keys = QKeySequence::mnemonic(caption); !keys.isEmpty())
            by_letter[keys.toString()] += caption;
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

} // namespace

TEST_F(HouseStyleTest, NoTwoCaptionsInSightTakeTheSameLetter)
{
    begin({family(u"Naismith"_s, {u"Ann"_s, u"Ben"_s})});
    for (const QString& key : {u"main_menu"_s, u"search"_s, u"filters"_s, u"tagging"_s, u"reports"_s, u"fusions"_s}) {
        running->open_area(key);
        settle();
        auto& page = *window().page();
        if (key == u"tagging")
            page.note().offer(u"Done."_s, u"&Undo"_s, [] {});
        QSet<QString> doubled;
        turn_all(page, {}, [&] {
            for (const QString& letter : doubled_letters(window()))
                doubled.insert(letter);
        });
        EXPECT_TRUE(doubled.isEmpty()) << key.toStdString() << ": "
                                       << QStringList(doubled.values()).join(u"; "_s).toStdString();
    }
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
