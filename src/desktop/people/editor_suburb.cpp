#include "desktop/people/editor_suburb.h"

#include "desktop/people/choice_line.h"
#include "desktop/people/quick_add_dialogs.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/note_bar.h"
#include "people/sort_key.h"

#include <QHBoxLayout>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::SetupItem;
using people::SetupKind;
using people::SuburbType;

namespace {

constexpr int postcode_width = 72;
const QString no_suburbs =
    u"To enter a suburb to this family file you first need to enter all the suburbs in your area "
    "in the family file setup area of %1"_s;

QString text_of(const QString& suburb, const QString& postcode)
{
    return u"%1 %2"_s.arg(suburb, postcode).trimmed();
}

} // namespace

void SuburbBook::read(core::Session& session)
{
    m_items = people::read_setup_items(session, SetupKind::suburbs);
}

QStringList SuburbBook::texts() const
{
    QStringList texts;
    for (const SetupItem& item : m_items)
        texts += text_of(item.text, item.postcode);
    return texts;
}

const SetupItem* SuburbBook::with_key(int key) const
{
    const auto found = std::ranges::find(m_items, key, &SetupItem::key);
    return found == m_items.end() ? nullptr : &*found;
}

const SetupItem* SuburbBook::find(const QString& typed) const
{
    const QString wanted = people::sort_key(typed.simplified());
    const SetupItem* partly = nullptr;
    int parts = 0;
    for (const SetupItem& item : m_items) {
        const QString text = people::sort_key(text_of(item.text, item.postcode));
        if (wanted == text || wanted == people::sort_key(item.text) || wanted == people::sort_key(item.postcode))
            return &item;
        if (text.contains(wanted)) {
            partly = &item;
            ++parts;
        }
    }
    return parts == 1 ? partly : nullptr;
}

SuburbFields::SuburbFields(EditorBench& bench, NoteBar& note, SuburbBook& book, SuburbType type, EditorForm& form)
    : QObject(&form), m_bench(bench), m_note(note), m_book(book), m_type(type),
      m_place(type == SuburbType::residential ? &people::FamilyFile::residential : &people::FamilyFile::postal),
      m_suburb(new ChoiceLine), m_postcode(new TypedLine)
{
    const bool residential = type == SuburbType::residential;
    m_suburb->setObjectName(residential ? u"res_suburb"_s : u"post_suburb"_s);
    m_suburb->setPlaceholderText(u"Suburb or postcode"_s);
    m_postcode->setObjectName(residential ? u"res_postcode"_s : u"post_postcode"_s);
    connect(m_suburb, &QLineEdit::editingFinished, this, &SuburbFields::finish_suburb);
    connect(m_suburb, &ChoiceLine::taken, this, &SuburbFields::finish_suburb, Qt::QueuedConnection);
    connect(m_suburb, &ChoiceLine::nothing_to_choose, this, &SuburbFields::tell_empty);
    connect(m_postcode, &QLineEdit::editingFinished, this, &SuburbFields::finish_postcode);
    add_to(form);
}

void SuburbFields::add_to(EditorForm& form)
{
    const bool residential = m_type == SuburbType::residential;
    auto* add = new QToolButton;
    add->setIcon(icon(u"list-add"_s));
    add->setAutoRaise(true);
    add->setFocusPolicy(Qt::ClickFocus);
    add->setObjectName(m_suburb->objectName() + u"_add"_s);
    add->setToolTip(u"Add suburb\u2026"_s);
    add->setAccessibleName(u"Add suburb\u2026"_s);
    connect(add, &QToolButton::clicked, this, [this] { add_new({}); });
    form.add_row(residential ? u"Subu&rb"_s : u"Suburb"_s, m_suburb, add);
    form.add_row(u"Postcode"_s, m_postcode);
    keep_width(*m_postcode, postcode_width);
    form.on_show([this] { show_file(); });
}

void SuburbFields::show_file()
{
    m_suburb->set_choices(m_book.texts());
    const auto& now = suburb();
    const QString name = now ? now->suburb : QString();
    const QString postcode = now ? now->shown_postcode() : QString();
    if (!m_suburb->isModified())
        m_suburb->show_text(name);
    if (!m_postcode->isModified())
        m_postcode->show_text(postcode);
}

void SuburbFields::focus_suburb()
{
    m_suburb->setFocus();
    m_suburb->selectAll();
}

void SuburbFields::focus_postcode()
{
    m_postcode->setFocus();
    m_postcode->selectAll();
}

void SuburbFields::set(const std::optional<people::Suburb>& suburb, const char* what)
{
    m_bench.editor.change(QLatin1StringView(what) + m_suburb->objectName(),
                          [&](people::FamilyFile& file) { file.*m_place = suburb; });
    m_bench.show_again();
}

void SuburbFields::take(const SetupItem* item)
{
    const bool same = suburb() && suburb()->suburb_id == item->key;
    if (!same)
        set(people::Suburb{item->key, m_type, {}, item->text, item->postcode}, "suburb ");
    show_file();
}

void SuburbFields::finish_suburb()
{
    const QString typed = m_suburb->text().simplified();
    m_suburb->setModified(false);
    if (typed == (suburb() ? suburb()->suburb : QString()) || m_suburb->isReadOnly())
        return;
    if (typed.isEmpty()) {
        set(std::nullopt, "suburb ");
    } else if (const SetupItem* item = m_book.find(typed)) {
        take(item);
    } else {
        show_file();
        refuse(typed);
    }
}

void SuburbFields::finish_postcode()
{
    if (!m_postcode->isModified())
        return;
    m_postcode->setModified(false);
    const QString typed = m_postcode->text().simplified();
    if (suburb()) {
        auto changed = *suburb();
        changed.postcode_var = typed == changed.postcode ? QString() : typed;
        set(changed, "postcode ");
    } else if (const SetupItem* item = typed.isEmpty() ? nullptr : m_book.find(typed)) {
        take(item);
    } else {
        show_file();
        if (!typed.isEmpty())
            refuse(typed);
    }
}

void SuburbFields::finish_typing()
{
    finish_suburb();
    finish_postcode();
}

void SuburbFields::tell_empty()
{
    m_bench.desk.office.dialogue.show({no_suburbs.arg(core::product)});
}

void SuburbFields::refuse(const QString& typed)
{
    if (m_book.is_empty())
        tell_empty();
    m_note.offer(u"\u201c%1\u201d is none of the suburbs, or the beginning of several."_s.arg(typed),
                 u"Add suburb\u2026"_s, [this, typed] { add_new(typed); });
}

void SuburbFields::add_new(const QString& typed)
{
    auto& office = m_bench.desk.office;
    const bool number = !typed.isEmpty() && typed.front().isDigit();
    const QStringList texts = number ? QStringList{{}, typed} : QStringList{typed, {}};
    const auto key = ask_for_new_item(office, SetupKind::suburbs, texts, m_suburb);
    m_book.read(*office.session);
    show_file();
    focus_suburb();
    if (const SetupItem* item = key ? m_book.with_key(*key) : nullptr)
        take(item);
}

} // namespace kindrel::desktop
