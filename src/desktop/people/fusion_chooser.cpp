#include "desktop/people/fusion_chooser.h"

#include "desktop/people/filter_choice_list.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"
#include "people/filter_search.h"

#include <QCheckBox>
#include <QComboBox>
#include <QGridLayout>
#include <QLabel>
#include <QPushButton>
#include <QShortcut>

#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::FilterItem;
using people::FusionMode;

namespace {

struct ModeButton
{
    FusionMode mode;
    const char* name;
    Qt::Key key; ///< With Alt.
};
constexpr std::array modes{
    ModeButton{FusionMode::or_plus, "orp", Qt::Key_1}, ModeButton{FusionMode::or_minus, "orm", Qt::Key_2},
    ModeButton{FusionMode::and_plus, "andp", Qt::Key_3}, ModeButton{FusionMode::and_minus, "andm", Qt::Key_4}};

/// "OR+ Can be in Group", without the brackets.
QString mode_words(FusionMode mode)
{
    const QString words = people::fusion_mode_words(mode).toString().trimmed();
    return words.mid(1, words.size() - 2);
}

} // namespace

QString short_words(FusionMode mode)
{
    return mode_words(mode).section(u' ', 0, 0);
}

FusionChooser::FusionChooser(core::Office& office, Remembered& remembered,
                             const std::unique_ptr<people::FusionSetup>& setup, EntryOf entry_of)
    : m_office(office), m_setup(setup), m_kinds(new QComboBox),
      m_list(new FilterChoiceList(remembered, u"Items to add"_s, u"In the fusion"_s,
                                  [entry_of = std::move(entry_of)](const FilterItem& item) {
                                      const auto* entry = entry_of(item);
                                      return entry ? ChoiceUse{short_words(entry->mode), State::contact} : ChoiceUse{};
                                  })),
      m_marked(new QCheckBox(u"&Marked rows alone (Tag)"_s)), m_value(new QComboBox),
      m_value_caption(new QLabel(u"Value"_s))
{
    fill_kinds();
    setFocusProxy(m_list);
    m_marked->setObjectName(u"marked"_s);
    m_value->setObjectName(u"value"_s);
    m_value->setAccessibleName(u"Value of the flexi field"_s);
    m_value->setEditable(true);
    m_value->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    m_value_caption->setBuddy(m_value);
    connect(m_list, &FilterChoiceList::chosen_changed, this, &FusionChooser::show_values);
    connect(m_list, &FilterChoiceList::step_wanted, this, [this] { add(FusionMode::or_plus); });
    connect(m_list, &FilterChoiceList::plus_wanted, this, [this] { add(FusionMode::and_plus); });
    connect(m_list, &FilterChoiceList::minus_wanted, this, [this] { add(FusionMode::and_minus); });
    auto* grid = new QGridLayout(this);
    grid->setContentsMargins(0, 0, 0, 0);
    grid->setHorizontalSpacing(space::field / 2);
    grid->setVerticalSpacing(space::field);
    grid->addWidget(make_heading(u"Items to add"_s), 0, 0);
    grid->addWidget(m_kinds, 0, 1);
    grid->addWidget(m_list, 1, 0, 1, 2);
    grid->setRowStretch(1, 1);
    grid->addWidget(m_marked, 2, 0, 1, 2);
    grid->addWidget(m_value_caption, 3, 0);
    grid->addWidget(m_value, 3, 1);
    add_modes(*grid);
}

void FusionChooser::fill_kinds()
{
    m_kinds->setObjectName(u"kind"_s);
    m_kinds->setAccessibleName(u"Kind of the items"_s);
    for (const auto& row : people::filter_kinds())
        m_kinds->addItem(row.caption.toString());
    connect(m_kinds, &QComboBox::currentIndexChanged, this, [this] {
        m_list->forget_typed();
        m_marked->setChecked(false);
        reload();
    });
    const auto turn = [this](int key, int by) {
        auto* shortcut = new QShortcut(Qt::CTRL | Qt::Key(key), this);
        shortcut->setContext(Qt::WidgetWithChildrenShortcut);
        connect(shortcut, &QShortcut::activated, this, [this, by] { turn_kind(by); });
    };
    turn(Qt::Key_PageUp, -1);
    turn(Qt::Key_PageDown, 1);
    m_kinds->setToolTip(u"Ctrl+PgUp and Ctrl+PgDn go to the kind before and after"_s);
}

void FusionChooser::turn_kind(int by)
{
    m_kinds->setCurrentIndex((m_kinds->currentIndex() + by + m_kinds->count()) % m_kinds->count());
}

void FusionChooser::add_modes(QGridLayout& grid)
{
    const int first_row = grid.rowCount();
    for (int place = 0; const auto& row : modes) {
        auto* button = new QPushButton(mode_words(row.mode));
        button->setObjectName(QString::fromLatin1(row.name));
        const QKeySequence keys(Qt::ALT | row.key);
        button->setToolTip(u"Add the chosen item in this way (%1)"_s.arg(keys.toString(QKeySequence::NativeText)));
        button->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Fixed);
        const auto run = [this, mode = row.mode] {
            add(mode);
        };
        connect(button, &QPushButton::clicked, this, run);
        auto* key = new QShortcut(keys, this);
        key->setContext(Qt::WidgetWithChildrenShortcut);
        connect(key, &QShortcut::activated, this, run);
        grid.addWidget(button, first_row + place / 2, place % 2);
        ++place;
    }
}

const people::FilterKindRow& FusionChooser::kind() const
{
    return people::filter_kinds()[std::size_t(m_kinds->currentIndex())];
}

void FusionChooser::reload()
{
    m_list->set_items(m_setup->choices(kind().kind));
    m_marked->setVisible(kind().has_marks());
    m_value->setVisible(kind().has_value());
    m_value_caption->setVisible(kind().has_value());
}

void FusionChooser::show_entries()
{
    m_list->refresh();
}

void FusionChooser::show_values()
{
    const FilterItem* item = m_list->chosen();
    m_value->clear();
    m_value->addItem(u"Any value"_s);
    if (item && kind().has_value())
        m_value->addItems(people::flexi_values(*m_office.session, item->item));
}

void FusionChooser::add(FusionMode mode)
{
    const FilterItem* chosen = m_list->chosen();
    if (!chosen)
        return m_office.dialogue.show({u"Please choose an item to add"_s});
    FilterItem item = *chosen;
    if (kind().has_marks() && m_marked->isChecked())
        item.marks = people::Marks::marked;
    const QString value = m_value->currentText();
    if (kind().has_value() && !value.isEmpty() && value != m_value->itemText(0))
        item.value = value;
    Q_EMIT add_wanted(item, mode);
}

} // namespace kindrel::desktop
