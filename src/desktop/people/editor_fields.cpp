#include "desktop/people/editor_fields.h"

#include "desktop/people/card_list_view.h"
#include "desktop/shell/date_field.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QAction>
#include <QComboBox>
#include <QGridLayout>
#include <QKeyEvent>
#include <QLabel>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int label_width = 92;
constexpr int greatest_width = 460;

/// Ctrl+H in the field does what a click on its eye does.
void add_key(QWidget& field, HiddenEye& eye)
{
    eye.setObjectName(field.objectName() + u"_eye"_s);
    auto* key = new QAction(&field);
    key->setShortcut(Qt::CTRL | Qt::Key_H);
    key->setShortcutContext(Qt::WidgetShortcut);
    QObject::connect(key, &QAction::triggered, &eye, &QToolButton::click);
    field.addAction(key);
}

} // namespace

void TypedLine::show_text(const QString& shown)
{
    if (text() != shown)
        setText(shown);
}

bool TypedLine::event(QEvent* event)
{
    if (asks_for_undo(*event)) {
        event->ignore();
        return false;
    }
    return QLineEdit::event(event);
}

HiddenEye::HiddenEye(const QString& label, FieldLink<bool> hidden) : m_hidden(std::move(hidden))
{
    setCheckable(true);
    setAutoRaise(true);
    setFocusPolicy(Qt::ClickFocus); // Ctrl+H does it from within the field.
    setAccessibleName(u"%1 hidden"_s.arg(QString(label).remove(u'&')));
    connect(this, &QToolButton::clicked, this, [this](bool checked) { m_hidden.change(checked); });
    show_file();
}

void HiddenEye::show_file()
{
    const bool hidden = m_hidden.value();
    setChecked(hidden);
    setIcon(desktop::icon(hidden ? u"view-hidden"_s : u"view-visible"_s));
    setToolTip(hidden ? u"Hidden: kept here, left out of every list and report (Ctrl+H)"_s
                      : u"Shown in lists and reports; press to hide it (Ctrl+H)"_s);
}

EditorForm::EditorForm(EditorBench& bench, const QString& title, bool people::RecordAccess::*section)
    : m_bench(bench), m_section(section), m_fields(new QWidget), m_grid(new QGridLayout(m_fields)),
      m_closed(new QLabel(closed_words()))
{
    setMaximumWidth(greatest_width);
    m_grid->setContentsMargins(0, 0, 0, 0);
    m_grid->setHorizontalSpacing(space::field);
    m_grid->setVerticalSpacing(space::field / 2);
    m_grid->setColumnMinimumWidth(0, label_width);
    m_grid->setColumnStretch(1, 1);
    dress(*m_closed, TextSize::secondary);
    m_closed->hide();
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field / 2);
    column->addWidget(make_heading(title));
    column->addWidget(m_closed);
    column->addWidget(m_fields);
}

void EditorForm::add_row(const QString& label, QWidget* field, QWidget* eye)
{
    const int line = m_grid->rowCount();
    auto* words = new QLabel(label);
    words->setBuddy(field);
    field->setAccessibleName(QString(label).remove(u'&'));
    m_grid->addWidget(words, line, 0);
    m_grid->addWidget(field, line, 1);
    if (!eye)
        return;
    m_grid->addWidget(eye, line, 2);
    if (auto* hidden = qobject_cast<HiddenEye*>(eye))
        add_key(*field, *hidden);
}

void EditorForm::add_wide(QWidget* part)
{
    m_grid->addWidget(part, m_grid->rowCount(), 0, 1, 3);
}

TypedLine* EditorForm::add_line(const QString& name, const QString& label, FieldLink<QString> text,
                                std::optional<FieldLink<bool>> hidden)
{
    auto* line = new TypedLine;
    line->setObjectName(name);
    connect(line, &QLineEdit::textEdited, this, text.change);
    on_show([line, value = std::move(text.value)] { line->show_text(value()); });
    HiddenEye* eye = hidden ? watched(new HiddenEye(label, std::move(*hidden))) : nullptr;
    add_row(label, line, eye);
    return line;
}

HiddenEye* EditorForm::watched(HiddenEye* eye)
{
    on_show([eye] { eye->show_file(); });
    return eye;
}

void EditorForm::show_file()
{
    const bool open = !m_section || m_bench.editor.file().access.*m_section;
    m_fields->setVisible(open);
    m_closed->setVisible(!open);
    for (const auto& show : m_shows)
        show();
    set_editable(*this, m_bench.editor.may_edit());
}

void set_editable(QWidget& part, bool editable)
{
    for (QLineEdit* line : part.findChildren<QLineEdit*>())
        line->setReadOnly(!editable);
    for (QComboBox* choice : part.findChildren<QComboBox*>())
        choice->setEnabled(editable);
    for (QAbstractButton* button : part.findChildren<QAbstractButton*>())
        button->setEnabled(editable);
}

QHBoxLayout* side_by_side(std::initializer_list<QLayout*> columns)
{
    auto* row = new QHBoxLayout;
    row->setSpacing(2 * space::group);
    for (QLayout* column : columns)
        row->addLayout(column, 1);
    return row;
}

} // namespace kindrel::desktop
