#include "desktop/people/duplicate_watch.h"

#include "desktop/people/family_card.h"
#include "desktop/shell/note_bar.h"

#include <QLineEdit>

#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr std::array telling_fields{"surname", "phone",        "family_mobile", "family_email",
                                    "Name",    "mobile_phone", "Personal_email"};

}

DuplicateWatch::DuplicateWatch(EditorBench& bench, NoteBar& note, QObject* parent)
    : QObject(parent), m_bench(bench), m_note(note)
{
}

void DuplicateWatch::follow(const QWidget& page)
{
    for (const char* name : telling_fields)
        if (auto* field = page.findChild<QLineEdit*>(QString::fromLatin1(name)))
            connect(field, &QLineEdit::editingFinished, this, &DuplicateWatch::look);
}

void DuplicateWatch::look()
{
    Desk& desk = m_bench.desk;
    if (!m_bench.editor.altered())
        return;
    auto alike = people::likely_duplicates(*desk.office.session, m_bench.editor.file());
    if (alike == m_alike)
        return;
    m_alike = std::move(alike);
    if (m_alike.empty()) {
        m_note.clear();
        return;
    }
    std::vector<int> families;
    for (const auto& likeness : m_alike)
        families.push_back(likeness.surname_id);
    const auto& first = m_alike.front();
    m_note.offer(u"This may be the family %1: %2."_s.arg(first.family, first.reason), u"Look at it"_s,
                 [&desk, families] { open_family_card(desk, families, 0); });
}

} // namespace kindrel::desktop
