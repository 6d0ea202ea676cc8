#include "desktop/people/person_flags.h"

#include "desktop/shell/look.h"

#include <QCheckBox>
#include <QGridLayout>

#include <array>

namespace kindrel::desktop {

using people::Person;

namespace {

struct Flag
{
    const char* name;
    const char* label;
    bool Person::*flag;
};

constexpr std::array flags{
    Flag{"Active", "Active", &Person::Active},       Flag{"Privacy", "Privacy Request", &Person::Privacy},
    Flag{"Prospect", "Prospect", &Person::Prospect}, Flag{"archive", "Archive", &Person::archive},
    Flag{"contact", "Contact", &Person::contact},    Flag{"Decease", "Deceased", &Person::Decease}};
constexpr Flag business_flag{"Bussiness_hidden", "Hide everything about work", &Person::Bussiness_hidden};

/// A switch that follows the form.
QCheckBox* make_switch(EditorBench& bench, EditorForm& form, const Flag& flag)
{
    auto* box = new QCheckBox(QString::fromLatin1(flag.label));
    box->setObjectName(QString::fromLatin1(flag.name));
    const auto link = field_link(bench, flag.name, flag.flag);
    QObject::connect(box, &QCheckBox::clicked, &form, link.change);
    form.on_show([box, value = link.value] { box->setChecked(value()); });
    return box;
}

} // namespace

QWidget* make_person_flags(EditorBench& bench, EditorForm& form)
{
    auto* box = new QWidget;
    auto* grid = new QGridLayout(box);
    grid->setContentsMargins(0, space::field, 0, 0);
    grid->setVerticalSpacing(space::field / 2);
    for (int place = 0; place < int(flags.size()); ++place)
        grid->addWidget(make_switch(bench, form, flags[std::size_t(place)]), place / 2, place % 2);
    return box;
}

QCheckBox* make_business_switch(EditorBench& bench, EditorForm& form)
{
    return make_switch(bench, form, business_flag);
}

} // namespace kindrel::desktop
