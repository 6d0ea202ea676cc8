#include "desktop/shell/view_menu.h"

#include <QActionGroup>
#include <QMenu>

#include <array>
#include <functional>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

struct Choice
{
    const char* text;
    int value;
};

constexpr std::array appearances{Choice{"&Light", int(Appearance::light)}, Choice{"&Dark", int(Appearance::dark)},
                                 Choice{"As the d&esktop", int(Appearance::desktop)}};
constexpr std::array percents{Choice{"Text 100 %", 100}, Choice{"Text 115 %", 115}, Choice{"Text 130 %", 130}};

/// One group of a menu of which exactly one is ticked.
void add_choices(QMenu& menu, std::span<const Choice> choices, int chosen, const std::function<void(int)>& choose)
{
    auto* group = new QActionGroup(&menu);
    for (const Choice& choice : choices) {
        QAction* action = menu.addAction(QString::fromLatin1(choice.text));
        action->setCheckable(true);
        action->setChecked(choice.value == chosen);
        group->addAction(action);
        QObject::connect(action, &QAction::triggered, &menu, [choose, value = choice.value] { choose(value); });
    }
}

} // namespace

QMenu* make_view_menu(Look& look, Remembered& remembered, QWidget* parent)
{
    const auto set = [&look, &remembered](Appearance appearance, int percent) {
        look.apply(appearance, percent);
        remembered.keep_common(u"appearance"_s, int(appearance));
        remembered.keep_common(u"text_percent"_s, percent);
    };
    auto* menu = new QMenu(parent);
    menu->setAttribute(Qt::WA_DeleteOnClose);
    add_choices(*menu, appearances, int(look.appearance()),
                [&look, set](int value) { set(Appearance(value), look.percent()); });
    menu->addSeparator();
    add_choices(*menu, percents, look.percent(), [&look, set](int value) { set(look.appearance(), value); });
    return menu;
}

} // namespace kindrel::desktop
