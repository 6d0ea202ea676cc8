#include "desktop/registers/register_dates.h"

#include "core/day_refusal.h"
#include "desktop/registers/new_day.h"
#include "desktop/shell/date_field.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"

#include <QComboBox>
#include <QLabel>
#include <QListWidget>
#include <QPushButton>
#include <QShortcut>
#include <QVBoxLayout>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

RegisterDates::RegisterDates(Desk& desk, registers::DatedRegister& dated, std::function<bool()> finish_typing,
                             QWidget* parent)
    : QWidget(parent), m_desk(desk), m_register(dated), m_finish_typing(std::move(finish_typing)),
      m_column(new QVBoxLayout(this)), m_project(new QComboBox), m_new(new DateField(desk.office)),
      m_dates(new QListWidget)
{
    m_project->setObjectName(u"project"_s);
    m_project->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    m_new->setObjectName(u"new_date"_s);
    m_new->require_year(core::day_refusal);
    m_dates->setObjectName(u"dates"_s);
    lay_out();
    connect(m_project, &QComboBox::activated, this, settled(&RegisterDates::choose_project));
    // After the key or click, for the list is filled anew.
    const auto open_later = [this] {
        QMetaObject::invokeMethod(this, settled(&RegisterDates::open_chosen), Qt::QueuedConnection);
    };
    connect(m_dates, &QListWidget::itemActivated, this, open_later);
    connect(m_dates, &QListWidget::itemClicked, this, open_later);
    connect(m_dates, &QListWidget::currentRowChanged, this, &RegisterDates::chosen_changed);
    connect(m_new, &DateField::entered, this, [this](std::optional<core::Date> date) {
        m_typed = date;
        Q_EMIT remarked(date ? m_register.date_note(*date) : QString());
    });
    connect(
        m_new, &QLineEdit::returnPressed, this,
        [this, add = settled(&RegisterDates::add_typed)] {
            if (!m_new->isModified()) // Otherwise the field has refused what was typed.
                add();
        },
        Qt::QueuedConnection);
    auto* remove_key = new QShortcut(Qt::Key_Delete, m_dates);
    remove_key->setContext(Qt::WidgetShortcut);
    connect(remove_key, &QShortcut::activated, this, settled(&RegisterDates::remove));
}

std::function<void()> RegisterDates::settled(void (RegisterDates::*act)())
{
    return [this, act] {
        if (!m_finish_typing())
            return show_register();
        try {
            (this->*act)();
        } catch (const core::DatabaseError&) {
            done(false); // What is shown is what there is.
            throw;
        }
    };
}

void RegisterDates::lay_out()
{
    const auto add_captioned = [this](const QString& caption, QWidget* of, QWidget* line, int stretch = 0) {
        auto* label = new QLabel(caption);
        label->setBuddy(of);
        m_column->addWidget(label);
        m_column->addWidget(line, stretch);
    };
    m_column->setContentsMargins(0, 0, 0, 0);
    m_column->setSpacing(space::field / 2);
    add_captioned(u"&Project"_s, m_project, m_project);
    m_column->addSpacing(space::field / 2);
    add_captioned(u"New &date"_s, m_new, make_new_line());
    m_column->addSpacing(space::field / 2);
    add_captioned(u"Da&tes"_s, m_dates, m_dates, 1);
    add_button(make_button({u"&Change date"_s, u"view-calendar-day"_s, u"btn_edit"_s,
                            u"Gives the chosen date, with everything on it, another day"_s},
                           &RegisterDates::change_date));
    add_button(
        make_button({u"De&lete"_s, u"edit-delete"_s, u"delete"_s, u"Deletes the chosen date (Delete in the list)"_s},
                    &RegisterDates::remove));
}

QWidget* RegisterDates::make_new_line()
{
    auto* line = new QWidget;
    auto* row = new QHBoxLayout(line);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(space::field);
    row->addWidget(m_new, 1);
    row->addWidget(
        make_button({u"Add"_s, u"list-add"_s, u"add_date"_s, u"Adds the date and opens it (Enter in the field)"_s},
                    &RegisterDates::add_typed));
    return line;
}

QPushButton* RegisterDates::make_button(const Button& looks, void (RegisterDates::*act)())
{
    auto* button = new QPushButton(icon(looks.icon), looks.text);
    button->setObjectName(looks.name);
    button->setToolTip(looks.tip);
    connect(button, &QPushButton::clicked, this, settled(act));
    return button;
}

void RegisterDates::add_button(QPushButton* button)
{
    m_column->addWidget(button);
}

void RegisterDates::show_register()
{
    const QSignalBlocker quiet(m_project);
    m_project->clear();
    for (const auto& project : m_register.projects())
        m_project->addItem(project.name, project.key);
    m_project->setCurrentIndex(m_project->findData(m_register.project()));
    m_project->setToolTip(m_project->currentText());
    show_dates();
}

void RegisterDates::show_dates()
{
    const int open = m_register.open_date() ? m_register.open_date()->key : 0;
    const int wanted = open != 0 ? open : chosen();
    int row = 0;
    {
        const QSignalBlocker quiet(m_dates);
        m_dates->clear();
        for (const auto& date : m_register.dates()) {
            auto* item = new QListWidgetItem(date.date.shown(m_desk.office.day_order()), m_dates);
            item->setData(Qt::UserRole, date.key);
            if (date.key == wanted)
                row = m_dates->row(item);
            if (date.key == open) {
                item->setText(item->text() + u"  open"_s);
                QFont bold = item->font();
                bold.setBold(true);
                item->setFont(bold);
            }
        }
        m_dates->setCurrentRow(m_dates->count() == 0 ? -1 : row);
    }
    Q_EMIT chosen_changed();
}

int RegisterDates::chosen() const
{
    const auto* item = m_dates->currentItem();
    return item ? item->data(Qt::UserRole).toInt() : 0;
}

void RegisterDates::focus_dates()
{
    m_dates->count() == 0 ? focus_new_date() : m_dates->setFocus();
}

void RegisterDates::focus_new_date()
{
    m_new->setFocus();
    m_new->selectAll();
}

void RegisterDates::done(bool made)
{
    show_register();
    Q_EMIT changed();
    if (made)
        Q_EMIT opened();
}

void RegisterDates::choose_project()
{
    (void)m_register.choose_project(m_project->currentData().toInt());
    Q_EMIT remarked({});
    done(false);
}

void RegisterDates::open_chosen()
{
    const auto& open = m_register.open_date();
    if (open && open->key == chosen())
        return Q_EMIT opened();
    const bool made = m_register.open(chosen());
    Q_EMIT remarked({});
    done(made);
}

void RegisterDates::add_typed()
{
    if (m_new->isModified() && !m_new->finish())
        return;
    if (!m_typed)
        m_desk.office.dialogue.show(core::bad_date_message(m_desk.office.day_order()));
    const auto note = m_typed ? m_register.date_note(*m_typed) : QString();
    const bool added = m_typed && m_register.add(*m_typed);
    if (added) {
        m_typed.reset();
        m_new->show_date({});
        Q_EMIT remarked(note);
    }
    done(added);
    if (!added)
        focus_new_date();
}

void RegisterDates::change_date()
{
    const auto& open = m_register.open_date();
    if ((!open || open->key != chosen()) && !m_register.open(chosen()))
        return done(false);
    done(false); // The question is about what one sees.
    const auto date = ask_new_day(m_desk.office, m_register);
    if (!date)
        return done(true);
    const auto note = m_register.date_note(*date);
    const bool changed_date = m_register.change_date(*date);
    Q_EMIT remarked(changed_date ? note : QString());
    done(changed_date);
    if (!changed_date)
        focus_dates();
}

void RegisterDates::remove()
{
    const bool removed = m_register.remove(chosen());
    if (removed)
        Q_EMIT remarked({});
    done(false);
    focus_dates();
}

} // namespace kindrel::desktop
