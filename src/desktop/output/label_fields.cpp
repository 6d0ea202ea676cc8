#include "desktop/output/label_fields.h"

#include "desktop/core/setup_form.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"
#include "output/labels/label_stock.h"

#include <QCheckBox>
#include <QComboBox>
#include <QDoubleSpinBox>
#include <QFontDatabase>
#include <QGridLayout>
#include <QLabel>
#include <QSignalBlocker>
#include <QSpinBox>

#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using output::LabelFont;
using output::LabelGrid;

namespace {

// More than can be printed, so that whoever types too much is told why.
constexpr int most_labels = 9999;
constexpr double most_millimetres = 2000;
constexpr int most_points = 999;
constexpr int measure_width = 98;
constexpr int shown_letters = 12; ///< Of a font's name.

enum class Unit { number, tenths };

} // namespace

struct LabelFields::Measure
{
    const char16_t *name, *caption;
    int LabelGrid::*value;
    Unit unit = Unit::tenths;
    const char16_t* spoken = nullptr; ///< Where the caption says too little by itself.
};

LabelFields::LabelFields(const QString& prefix, LabelGrid& grid, QWidget* parent)
    : QWidget(parent), m_prefix(prefix), m_grid(grid), m_stock(new QComboBox), m_column(new QVBoxLayout(this)),
      m_texts(new QGridLayout)
{
    m_column->setContentsMargins(0, 0, 0, 0);
    m_column->setSpacing(space::field);
    add_stock(*m_column);
    add_measures(*m_column);
    m_column->addSpacing(space::field);
    m_column->addWidget(make_heading(u"What is printed"_s));
    m_texts->setSpacing(space::field);
    m_texts->setColumnStretch(1, 1);
    m_column->addLayout(m_texts);
}

void LabelFields::add_stock(QBoxLayout& column)
{
    m_stock->setObjectName(m_prefix + "stock"_L1);
    m_stock->addItem(u"Own measurements"_s);
    for (const auto& stock : output::label_stocks())
        m_stock->addItem(QString::fromLatin1(stock.name));
    add_below_caption(column, u"&Stock"_s, m_stock);
    connect(m_stock, &QComboBox::currentIndexChanged, this, &LabelFields::take_stock);
    shown_by(m_stock, [this] { show_stock(); });
}

void LabelFields::add_measures(QBoxLayout& column)
{
    static constexpr std::array across{
        Measure{u"page_width", u"Page &width", &LabelGrid::page_width},
        Measure{u"columns", u"&Columns", &LabelGrid::columns, Unit::number},
        Measure{u"width", u"Label w&idth", &LabelGrid::width},
        Measure{u"column_gap", u"Ga&p between", &LabelGrid::column_gap, Unit::tenths, u"Gap between columns"},
        Measure{u"left_margin", u"&Left margin", &LabelGrid::left_margin},
    };
    static constexpr std::array down{
        Measure{u"page_height", u"Page &height", &LabelGrid::page_height},
        Measure{u"rows", u"&Rows", &LabelGrid::rows, Unit::number},
        Measure{u"height", u"Label hei&ght", &LabelGrid::height},
        Measure{u"row_gap", u"Gap &between", &LabelGrid::row_gap, Unit::tenths, u"Gap between rows"},
        Measure{u"top_margin", u"&Top margin", &LabelGrid::top_margin},
    };
    const auto direction = [this](const QString& title, const auto& measures) {
        auto* fields = new QVBoxLayout;
        fields->setSpacing(space::field / 2);
        fields->addWidget(make_heading(title));
        for (const auto& measure : measures)
            add_measure(*fields, measure);
        return fields;
    };
    auto* both = new QHBoxLayout;
    both->setSpacing(2 * space::group);
    both->addLayout(direction(u"Across"_s, across), 1);
    both->addLayout(direction(u"Down"_s, down), 1);
    column.addLayout(both);
    add_measure(column, {u"start", u"St&art at label", &LabelGrid::start, Unit::number});
}

void LabelFields::add_measure(QBoxLayout& column, const Measure& measure)
{
    const auto value = measure.value;
    QWidget* field = nullptr;
    if (measure.unit == Unit::number) {
        auto* number = new QSpinBox;
        number->setRange(0, most_labels);
        connect(number, &QSpinBox::valueChanged, this, [this, value](int now) {
            m_grid.*value = now;
            altered();
        });
        shown_by(number, [this, number, value] { number->setValue(m_grid.*value); });
        field = number;
    } else {
        auto* millimetres = new QDoubleSpinBox;
        millimetres->setDecimals(1);
        millimetres->setRange(0, most_millimetres);
        millimetres->setSuffix(u" mm"_s);
        connect(millimetres, &QDoubleSpinBox::valueChanged, this, [this, value](double now) {
            m_grid.*value = qRound(now * 10);
            altered();
        });
        shown_by(millimetres, [this, millimetres, value] { millimetres->setValue(m_grid.*value / 10.0); });
        field = millimetres;
    }
    field->setObjectName(m_prefix + QString::fromUtf16(measure.name));
    keep_width(*field, measure_width);
    add_beside_caption(column, QString::fromUtf16(measure.caption), field);
    if (measure.spoken)
        field->setAccessibleName(QString::fromUtf16(measure.spoken));
}

void LabelFields::take_stock(int place)
{
    if (place == 0 && !m_own)
        return; // The measures are there to be altered.
    m_grid = place > 0 ? output::label_stocks()[std::size_t(place - 1)].grid : *m_own;
    show_values();
    Q_EMIT edited();
}

void LabelFields::show_stock()
{
    const auto* stock = output::stock_of(m_grid);
    if (!stock)
        m_own = m_grid;
    m_stock->setCurrentIndex(stock ? int(stock - output::label_stocks().data()) + 1 : 0);
}

void LabelFields::altered()
{
    const QSignalBlocker quiet(m_stock);
    show_stock();
    Q_EMIT edited();
}

void LabelFields::add_text(const QString& name, const QString& caption, LabelFont& font)
{
    const int row = m_texts->rowCount();
    const auto begin = m_prefix + name;
    const auto of = QString(caption).remove(u'&') + u", "_s;
    auto* family = make_family(begin + "_font"_L1, of + u"font"_s, font);
    auto* words = new QLabel(caption);
    words->setBuddy(family);
    m_texts->addWidget(words, row, 0);
    m_texts->addWidget(family, row, 1);
    auto* size = new QSpinBox;
    size->setObjectName(begin + "_size"_L1);
    size->setAccessibleName(of + u"size"_s);
    size->setRange(0, most_points);
    size->setSuffix(u" pt"_s);
    connect(size, &QSpinBox::valueChanged, this, [this, &font](int points) {
        font.size = points;
        Q_EMIT edited();
    });
    shown_by(size, [size, &font] { size->setValue(font.size); });
    m_texts->addWidget(size, row, 2);
    m_texts->addWidget(make_tick(begin + "_bold"_L1, u"Bold"_s, of + u"bold"_s, font.bold), row, 3);
    m_texts->addWidget(make_tick(begin + "_italic"_L1, u"Italic"_s, of + u"italic"_s, font.italic), row, 4);
}

QComboBox* LabelFields::make_family(const QString& name, const QString& accessible_name, LabelFont& font)
{
    auto* families = new QComboBox;
    families->setObjectName(name);
    families->setAccessibleName(accessible_name);
    families->setMinimumContentsLength(shown_letters);
    families->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    for (const auto& family : QFontDatabase::families())
        if (!QFontDatabase::isPrivateFamily(family))
            families->addItem(family);
    connect(families, &QComboBox::currentTextChanged, this, [this, &font](const QString& family) {
        font.family = family;
        Q_EMIT edited();
    });
    shown_by(families, [families, &font] {
        if (families->findText(font.family, Qt::MatchFixedString) < 0) // One that this workstation lacks.
            families->insertItem(0, font.family);
        families->setCurrentIndex(families->findText(font.family, Qt::MatchFixedString));
    });
    return families;
}

void LabelFields::add_tick(const QString& name, const QString& text, bool& on)
{
    m_column->addWidget(make_tick(m_prefix + name, text, QString(text).remove(u'&'), on));
}

QCheckBox* LabelFields::make_tick(const QString& name, const QString& text, const QString& accessible_name, bool& on)
{
    auto* box = new QCheckBox(text);
    box->setObjectName(name);
    box->setAccessibleName(accessible_name);
    connect(box, &QCheckBox::toggled, this, [this, &on](bool now) {
        on = now;
        Q_EMIT edited();
    });
    shown_by(box, [box, &on] { box->setChecked(on); });
    return box;
}

void LabelFields::shown_by(QWidget* field, std::function<void()> show)
{
    const auto quietly = [field, show = std::move(show)] {
        const QSignalBlocker quiet(field);
        show();
    };
    quietly();
    m_shows.push_back(quietly);
}

void LabelFields::show_values()
{
    for (const auto& show : m_shows)
        show();
}

} // namespace kindrel::desktop
