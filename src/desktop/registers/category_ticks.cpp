#include "desktop/registers/category_ticks.h"

#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QListWidget>
#include <QPushButton>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int button_width = 64;

} // namespace

CategoryTicks::CategoryTicks(const Captions& captions, const QString& name, QWidget* parent)
    : QWidget(parent), m_list(new QListWidget), m_count(new QLabel)
{
    auto* heading = make_heading(captions.heading);
    heading->setBuddy(m_list);
    heading->setWordWrap(true);
    m_list->setObjectName(name);
    m_list->setTextElideMode(Qt::ElideRight);
    m_list->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    m_list->setUniformItemSizes(true);
    dress(*m_count, TextSize::secondary);
    auto* buttons = new QHBoxLayout;
    buttons->setSpacing(space::field);
    const auto add = [&](const QString& text, const QString& suffix, bool on) {
        auto* button = new QPushButton(text);
        button->setObjectName(name + suffix);
        keep_width(*button, button_width);
        connect(button, &QPushButton::clicked, this, [this, on] { tick_all(on); });
        buttons->addWidget(button);
    };
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field);
    column->addWidget(heading);
    column->addWidget(m_list, 1);
    column->addWidget(m_count);
    add(captions.all, u"_all"_s, true);
    add(captions.none, u"_none"_s, false);
    buttons->addStretch(1);
    column->addLayout(buttons);
    connect(m_list, &QListWidget::itemChanged, this, [this] {
        show_count();
        Q_EMIT changed();
    });
}

void CategoryTicks::show_categories(const std::vector<registers::Category>& categories, const QList<int>& left_out)
{
    const QSignalBlocker quiet(m_list);
    m_list->clear();
    for (const auto& category : categories) {
        auto* item = new QListWidgetItem(category.name, m_list);
        item->setData(Qt::UserRole, category.key);
        item->setToolTip(category.name);
        item->setFlags(item->flags() | Qt::ItemIsUserCheckable);
        item->setCheckState(left_out.contains(category.key) ? Qt::Unchecked : Qt::Checked);
    }
    m_list->setCurrentRow(categories.empty() ? -1 : 0);
    show_count();
}

std::vector<int> CategoryTicks::ticked() const
{
    std::vector<int> keys;
    for (int row = 0; row < m_list->count(); ++row)
        if (m_list->item(row)->checkState() == Qt::Checked)
            keys.push_back(m_list->item(row)->data(Qt::UserRole).toInt());
    return keys;
}

QList<int> CategoryTicks::left_out() const
{
    QList<int> keys;
    for (int row = 0; row < m_list->count(); ++row)
        if (m_list->item(row)->checkState() != Qt::Checked)
            keys.push_back(m_list->item(row)->data(Qt::UserRole).toInt());
    return keys;
}

void CategoryTicks::tick_all(bool on)
{
    {
        const QSignalBlocker quiet(m_list);
        for (int row = 0; row < m_list->count(); ++row)
            m_list->item(row)->setCheckState(on ? Qt::Checked : Qt::Unchecked);
    }
    m_list->viewport()->update();
    show_count();
    Q_EMIT changed();
}

void CategoryTicks::show_count()
{
    m_count->setText(m_list->count() == 0 ? u"The project has none."_s
                                          : u"%1 of %2 chosen"_s.arg(ticked().size()).arg(m_list->count()));
}

void CategoryTicks::focus_list()
{
    m_list->setFocus();
}

} // namespace kindrel::desktop
