#include "desktop/shell/item_picker.h"

#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "people/search_words.h"
#include "people/sort_key.h"

#include <QDialogButtonBox>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QPushButton>
#include <QVBoxLayout>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr QSize first_size{340, 420};
constexpr int icon_size = 16;
constexpr int place_role = Qt::UserRole;
constexpr int new_item = -1;

} // namespace

ItemPicker::ItemPicker(const QString& title, std::vector<PickerItem> items, const QString& none, QWidget* parent)
    : QDialog(parent), m_items(std::move(items)), m_none(none), m_filter(new QLineEdit), m_list(new QListWidget),
      m_words(new QLabel)
{
    setObjectName(u"item_picker"_s);
    setWindowTitle(title);
    m_filter->setObjectName(u"wanted"_s);
    m_filter->setAccessibleName(title);
    m_filter->setPlaceholderText(u"Type to find"_s);
    m_filter->addAction(icon(u"edit-find"_s), QLineEdit::LeadingPosition);
    m_filter->installEventFilter(this);
    m_list->setObjectName(u"items"_s);
    m_list->setAccessibleName(title);
    m_list->setUniformItemSizes(true);
    m_list->setIconSize({icon_size, icon_size});
    m_list->installEventFilter(this);
    dress(*m_words, TextSize::secondary);
    m_words->setWordWrap(true);
    auto* buttons = new QDialogButtonBox(QDialogButtonBox::Cancel);
    auto* choose = buttons->addButton(u"C&hoose"_s, QDialogButtonBox::AcceptRole);
    choose->setObjectName(u"choose"_s);
    connect(m_filter, &QLineEdit::textChanged, this, &ItemPicker::narrow);
    connect(m_list, &QListWidget::itemDoubleClicked, this, &ItemPicker::take);
    connect(buttons, &QDialogButtonBox::accepted, this, &ItemPicker::take);
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);

    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(space::margin, space::margin, space::margin, space::margin);
    column->setSpacing(space::field);
    for (QWidget* part : std::initializer_list<QWidget*>{m_filter, m_words, m_list, buttons})
        column->addWidget(part, part == m_list ? 1 : 0);
    resize(first_size);
    m_filter->setFocus();
    narrow();
}

void ItemPicker::allow_new()
{
    m_new_allowed = true;
    m_filter->setPlaceholderText(u"Type to find, or a new one"_s);
    narrow();
}

bool ItemPicker::add_matches(const QString& typed)
{
    const QString wanted = people::sort_key(typed);
    const QStringList words = people::wanted_words(typed);
    bool called_so = false;
    for (std::size_t place = 0; place < m_items.size(); ++place) {
        const QString& text = m_items[place].text;
        if (!people::has_all(people::search_words(text), words))
            continue;
        auto* row = new QListWidgetItem(text, m_list);
        row->setData(place_role, int(place));
        called_so = called_so || people::sort_key(text) == wanted;
    }
    return called_so;
}

void ItemPicker::narrow()
{
    const QString typed = m_filter->text().simplified();
    m_list->clear();
    const bool called_so = add_matches(typed);
    const bool found = m_list->count() > 0;
    if (found && !typed.isEmpty())
        m_list->setCurrentRow(0);
    if (m_new_allowed && !typed.isEmpty() && !called_so) {
        // Never chosen by itself: a slip of the keys must not become an item.
        auto* row = new QListWidgetItem(icon(u"list-add"_s), u"Add \u201c%1\u201d"_s.arg(typed), m_list);
        row->setData(place_role, new_item);
    }
    m_words->setText(m_items.empty() ? m_none : u"Nothing is called \u201c%1\u201d."_s.arg(typed));
    m_words->setVisible(!found);
}

void ItemPicker::take()
{
    const QListWidgetItem* row = m_list->currentItem();
    if (!row)
        return;
    const int place = row->data(place_role).toInt();
    const QString typed = m_filter->text().simplified();
    accept();
    if (place == new_item)
        Q_EMIT new_wanted(typed);
    else
        Q_EMIT chosen(m_items[std::size_t(place)].key);
}

bool ItemPicker::filter_key(int key)
{
    if (key != Qt::Key_Down && key != Qt::Key_PageDown)
        return false;
    // The first match stands chosen already: Down goes to it, not past it.
    if (m_list->currentRow() < 0)
        m_list->setCurrentRow(0);
    m_list->setFocus(Qt::TabFocusReason);
    return true;
}

bool ItemPicker::list_key(const QString& text, int key)
{
    const bool back = key == Qt::Key_Up && m_list->currentRow() <= 0;
    const bool typed = key == Qt::Key_Backspace || (!text.isEmpty() && text[0].isPrint());
    if (!back && !typed)
        return false;
    m_filter->setFocus();
    if (key == Qt::Key_Backspace)
        m_filter->backspace();
    else if (typed)
        m_filter->insert(text);
    return true;
}

bool ItemPicker::eventFilter(QObject* target, QEvent* event)
{
    if (event->type() != QEvent::KeyPress)
        return QDialog::eventFilter(target, event);
    const auto& press = static_cast<const QKeyEvent&>(*event);
    if (press.key() == Qt::Key_Return || press.key() == Qt::Key_Enter) {
        take();
        return true;
    }
    const bool used =
        target == m_filter ? filter_key(press.key()) : target == m_list && list_key(press.text(), press.key());
    return used || QDialog::eventFilter(target, event);
}

} // namespace kindrel::desktop
