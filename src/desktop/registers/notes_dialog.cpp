#include "desktop/registers/notes_dialog.h"

#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QDialogButtonBox>
#include <QGridLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QListWidget>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QShortcut>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr QSize first_size{680, 440};
constexpr int dates_width = 176;

} // namespace

NotesDialog::NotesDialog(core::Office& office, registers::NotesArea area, int project, int date_key, QWidget* parent)
    : QDialog(parent), m_office(office), m_notes(office, area, project, date_key), m_dates(new QListWidget),
      m_text(new QPlainTextEdit)
{
    setObjectName(u"Roll_notes"_s);
    setWindowTitle(registers::notes_title(area));
    m_dates->setObjectName(u"note_dates"_s);
    m_text->setObjectName(u"note"_s);
    m_text->setTabChangesFocus(true);
    lay_out();
    resize(first_size);
    show_dates();
    connect(m_dates, &QListWidget::currentRowChanged, this, &NotesDialog::choose);
    connect(m_text, &QPlainTextEdit::textChanged, this, [this] {
        m_notes.type(m_text->toPlainText());
        show_state();
    });
    auto* keep = new QShortcut(QKeySequence::Save, this);
    connect(keep, &QShortcut::activated, this, [this] { (void)save(); });
    (m_notes.shown() ? static_cast<QWidget*>(m_text) : m_dates)->setFocus();
}

void NotesDialog::lay_out()
{
    auto* dates = make_heading(u"&Dates"_s);
    dates->setBuddy(m_dates);
    auto* note = make_heading(u"N&ote"_s);
    note->setBuddy(m_text);
    keep_width(*m_dates, dates_width);
    auto* grid = new QGridLayout(this);
    grid->setContentsMargins(space::group, space::group, space::group, space::margin);
    grid->setHorizontalSpacing(space::group);
    grid->setVerticalSpacing(space::field);
    grid->setColumnStretch(1, 1);
    grid->setRowStretch(1, 1);
    grid->addWidget(dates, 0, 0);
    grid->addWidget(note, 0, 1);
    grid->addWidget(m_dates, 1, 0);
    grid->addWidget(m_text, 1, 1);
    grid->addWidget(make_buttons(), 2, 0, 1, 2);
}

QDialogButtonBox* NotesDialog::make_buttons()
{
    auto* buttons = new QDialogButtonBox(QDialogButtonBox::Save | QDialogButtonBox::Close);
    buttons->button(QDialogButtonBox::Save)->setObjectName(u"save"_s);
    buttons->button(QDialogButtonBox::Save)->setToolTip(u"Save the note and close; Ctrl+S saves and stays"_s);
    connect(buttons, &QDialogButtonBox::accepted, this, &NotesDialog::accept);
    connect(buttons, &QDialogButtonBox::rejected, this, &NotesDialog::reject);
    return buttons;
}

void NotesDialog::show_dates()
{
    const QSignalBlocker quiet(m_dates);
    m_dates->clear();
    for (const auto& date : m_notes.dates()) {
        const QString day = date.date.shown(m_office.day_order());
        m_dates->addItem(date.note.isEmpty() ? day : u"%1  note"_s.arg(day));
    }
    show_note();
}

void NotesDialog::show_note()
{
    const QSignalBlocker quiet_dates(m_dates);
    m_dates->setCurrentRow(m_notes.shown().value_or(-1));
    if (m_text->toPlainText() != m_notes.text()) {
        const QSignalBlocker quiet_text(m_text);
        m_text->setPlainText(m_notes.text());
        m_text->moveCursor(QTextCursor::End);
    }
    m_text->setReadOnly(!m_notes.shown());
    m_text->setPlaceholderText(m_notes.shown() ? QString() : u"There is no date yet that could have a note."_s);
    show_state();
}

void NotesDialog::show_state()
{
    setWindowTitle(registers::notes_title(m_notes.area()) + (m_notes.altered() ? u" – not saved"_s : QString()));
}

void NotesDialog::choose(int place)
{
    if (place < 0 || place == m_notes.shown())
        return;
    (void)stored([this, place] { return m_notes.show(place); });
    show_dates();
}

bool NotesDialog::stored(const std::function<bool()>& store)
{
    try {
        return store();
    } catch (const core::DatabaseError& error) {
        m_office.dialogue.show({u"Unable to save the note"_s, error.text()});
        return false;
    }
}

bool NotesDialog::save()
{
    const bool saved = stored([this] { return m_notes.save(); });
    show_dates();
    if (!saved)
        m_text->setFocus();
    return saved;
}

void NotesDialog::accept()
{
    if (save())
        QDialog::accept();
}

void NotesDialog::reject()
{
    if (stored([this] { return m_notes.leave(); }))
        QDialog::reject();
    else
        show_dates();
}

void NotesDialog::keyPressEvent(QKeyEvent* event)
{
    if (event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter)
        m_text->setFocus();
    else
        QDialog::keyPressEvent(event);
}

void open_notes(core::Office& office, registers::NotesArea area, int project, int date_key, QWidget* parent,
                const std::function<void()>& closed)
{
    auto* dialog = new NotesDialog(office, area, project, date_key, parent);
    dialog->setAttribute(Qt::WA_DeleteOnClose);
    QObject::connect(dialog, &QDialog::finished, parent, closed);
    dialog->open();
}

} // namespace kindrel::desktop
