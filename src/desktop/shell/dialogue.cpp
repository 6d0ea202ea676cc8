#include "desktop/shell/dialogue.h"

#include "desktop/shell/icons.h"
#include "desktop/shell/question_box.h"

#include <QApplication>
#include <QFileDialog>
#include <QLineEdit>
#include <QListWidget>
#include <QMessageBox>
#include <QProcess>
#include <QStandardPaths>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int icon_size = 48;

QWidget* window_in_front()
{
    QWidget* modal = QApplication::activeModalWidget();
    return modal ? modal : QApplication::activeWindow();
}

void fill(QMessageBox& box, const core::Message& message)
{
    box.setWindowTitle(message.caption);
    box.setTextFormat(Qt::PlainText);
    box.setText(message.text);
    box.setInformativeText(message.more);
    box.setIconPixmap(icon(icon_name(message.icon)).pixmap(icon_size, icon_size));
    box.setTextInteractionFlags(Qt::TextSelectableByMouse);
}

/// `safe` takes Enter as well as Escape.
int answer(const core::Message& message, QMessageBox::StandardButtons buttons, QMessageBox::StandardButton safe,
           const Stopwatch& now)
{
    QMessageBox box(window_in_front());
    fill(box, message);
    box.setStandardButtons(buttons);
    box.setDefaultButton(safe);
    box.setEscapeButton(safe);
    InputGuard guard(box, now);
    return box.exec();
}

QString player()
{
    for (const auto& name : {u"pw-play"_s, u"paplay"_s, u"aplay"_s})
        if (const QString program = QStandardPaths::findExecutable(name); !program.isEmpty())
            return program;
    return {};
}

} // namespace

void QtDialogue::show(const core::Message& message)
{
    answer(message, QMessageBox::Ok, QMessageBox::Ok, m_now);
}

bool QtDialogue::confirm(const core::Message& message, core::Answer safe)
{
    const auto button = safe == core::Answer::yes ? QMessageBox::Yes : QMessageBox::No;
    return answer(message, QMessageBox::Yes | QMessageBox::No, button, m_now) == QMessageBox::Yes;
}

std::optional<bool> QtDialogue::confirm_or_cancel(const core::Message& message)
{
    const auto buttons = QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel;
    const int given = answer(message, buttons, QMessageBox::Cancel, m_now);
    if (given == QMessageBox::Cancel)
        return std::nullopt;
    return given == QMessageBox::Yes;
}

std::optional<QString> QtDialogue::ask_text(const core::Message& message, bool secret)
{
    auto* line = new QLineEdit;
    line->setEchoMode(secret ? QLineEdit::Password : QLineEdit::Normal);
    QuestionBox box(message, line, window_in_front(), m_now);
    if (!box.ask())
        return std::nullopt;
    return line->text();
}

std::optional<int> QtDialogue::choose(const core::Message& message, const QStringList& from)
{
    auto* list = new QListWidget;
    list->addItems(from);
    list->setCurrentRow(0);
    QuestionBox box(message, list, window_in_front(), m_now);
    QObject::connect(list, &QListWidget::itemDoubleClicked, &box, &QDialog::accept);
    if (!box.ask() || list->currentRow() < 0)
        return std::nullopt;
    return list->currentRow();
}

std::optional<QString> QtDialogue::choose_file(const core::FileQuestion& question)
{
    using Kind = core::FileQuestion::Kind;
    QFileDialog box(window_in_front(), question.title, {}, question.filter);
    box.setAcceptMode(question.kind == Kind::save ? QFileDialog::AcceptSave : QFileDialog::AcceptOpen);
    box.setFileMode(question.kind == Kind::save     ? QFileDialog::AnyFile
                    : question.kind == Kind::folder ? QFileDialog::Directory
                                                    : QFileDialog::ExistingFile);
    if (!question.suggested.isEmpty())
        box.selectFile(question.suggested);
    if (question.kind == Kind::save)
        box.setDefaultSuffix(suffix_of(question.filter));
    if (box.exec() != QDialog::Accepted || box.selectedFiles().isEmpty())
        return std::nullopt;
    return box.selectedFiles().first();
}

void QtDialogue::play(const QString& sound)
{
    const QString program = player();
    if (sound.isEmpty() || program.isEmpty() || !QProcess::startDetached(program, {m_audio_folder + sound}))
        QApplication::beep();
}

} // namespace kindrel::desktop
