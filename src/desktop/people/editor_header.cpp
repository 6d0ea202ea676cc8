#include "desktop/people/editor_header.h"

#include "desktop/people/card_text.h"
#include "desktop/people/status_words.h"
#include "desktop/shell/chip.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"
#include "people/names.h"

#include <QHBoxLayout>
#include <QLabel>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::FileAccess;

namespace {

QString access_word(FileAccess access)
{
    switch (access) {
    case FileAccess::read_only:
        return u"Read only"_s;
    case FileAccess::booked_out:
        return u"\u2192 Booked out"_s;
    case FileAccess::edit:
        break;
    }
    return {};
}

QString reason_of(FileAccess access, const people::Family& family, core::DayOrder order)
{
    if (access == FileAccess::read_only)
        return u"Your password lets you read family files, not change them. Texts can be selected and copied."_s;
    const QString note = people::booked_out_note(family, order).trimmed();
    return note.isEmpty() ? u"This family is not among those that are booked out to this computer."_s : note;
}

} // namespace

EditorHeader::EditorHeader(EditorBench& bench)
    : m_bench(bench), m_new(new Chip), m_status(new Chip), m_access(new Chip), m_dates(make_value()),
      m_reason(make_value()), m_strip(make_strip())
{
    m_dates->setObjectName(u"file_dates"_s);
    m_dates->setWordWrap(false);
    dress(*m_dates, TextSize::secondary);
    auto* line = new QHBoxLayout;
    line->setContentsMargins(space::group, 0, space::group, 0);
    line->setSpacing(space::field);
    for (Chip* chip : {m_new, m_status, m_access})
        line->addWidget(chip);
    line->addWidget(m_dates);
    line->addStretch(1);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, space::field);
    column->setSpacing(space::field / 2);
    column->addLayout(line);
    column->addWidget(m_strip);
}

QWidget* EditorHeader::make_strip()
{
    auto* strip = new QFrame;
    strip->setObjectName(u"read_only_strip"_s);
    strip->setAutoFillBackground(true);
    strip->setBackgroundRole(QPalette::Button);
    auto* padlock = new QLabel;
    padlock->setPixmap(icon(u"object-locked"_s).pixmap(16, 16));
    auto* row = new QHBoxLayout(strip);
    row->setContentsMargins(space::group, space::field / 2, space::group, space::field / 2);
    row->addWidget(padlock);
    row->addWidget(m_reason, 1);
    strip->hide();
    return strip;
}

void EditorHeader::show_file()
{
    const people::FamilyEditor& editor = m_bench.editor;
    const people::Family& family = editor.file().family;
    const auto order = m_bench.desk.office.day_order();
    m_new->set(editor.is_new() ? u"New"_s : QString(), State::altered);
    m_status->set(status_word(family.Condition), state_of(family.Condition));
    const auto access = editor.access();
    m_access->set(access_word(access), access == FileAccess::booked_out ? State::booked_out : State::plain);
    m_dates->setText(file_dates(family, order));
    m_reason->setText(editor.may_edit() ? QString() : reason_of(access, family, order));
    m_strip->setVisible(!editor.may_edit());
}

} // namespace kindrel::desktop
