#include "desktop/people/notebook_page.h"

#include "core/files.h"
#include "desktop/shell/chip.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QPlainTextEdit>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

NotebookPage::NotebookPage(core::Office& office, const QString& name, QWidget* parent)
    : QWidget(parent), m_office(office), m_heading(make_heading({})), m_state(new Chip), m_text(new QPlainTextEdit)
{
    m_heading->setTextFormat(Qt::PlainText);
    m_heading->setWordWrap(true);
    m_text->setObjectName(name);
    m_text->setTabChangesFocus(true);
    connect(m_text, &QPlainTextEdit::textChanged, this, &NotebookPage::show_state);
    auto* line = new QHBoxLayout;
    line->setSpacing(space::margin);
    line->addStrut(space::control);
    line->addWidget(m_heading, 1);
    line->addWidget(m_state);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field / 2);
    column->addLayout(line);
    column->addWidget(m_text, 1);
    turn_to({});
}

void NotebookPage::set_heading(const QString& heading)
{
    m_heading->setText(heading);
    m_text->setAccessibleName(heading);
}

void NotebookPage::turn_to(const std::optional<people::OwnFile>& file, const QString& why)
{
    m_file.reset(); // A page that cannot be read is not written either.
    m_stored = file ? people::read_notebook(m_office.paths, *file) : QString();
    m_file = file;
    m_text->setPlaceholderText(why);
    m_text->setEnabled(file.has_value());
    drop();
}

void NotebookPage::set_editable(bool editable)
{
    m_text->setReadOnly(!editable);
    m_text->setTextInteractionFlags(editable ? Qt::TextEditorInteraction
                                             : Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
}

bool NotebookPage::altered() const
{
    return m_file && m_text->toPlainText() != m_stored;
}

bool NotebookPage::save()
{
    if (!altered())
        return true;
    const QString text = m_text->toPlainText();
    try {
        people::write_notebook(m_office.paths, *m_file, text);
    } catch (const core::FileError& error) {
        m_office.dialogue.show({u"Unable to save the notes"_s, error.text()});
        return false;
    }
    m_stored = text;
    show_state();
    return true;
}

void NotebookPage::drop()
{
    m_text->setPlainText(m_stored);
    show_state();
}

void NotebookPage::show_state()
{
    m_state->set(altered() ? u"not saved"_s : QString(), State::altered);
    Q_EMIT typed();
}

} // namespace kindrel::desktop
