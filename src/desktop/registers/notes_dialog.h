#pragma once

#include "registers/notes.h"

#include <QDialog>

class QDialogButtonBox;
class QListWidget;
class QPlainTextEdit;

namespace kindrel::desktop {

/// The notes of a project's dates: dates at the left, the note of the chosen one beside them.
class NotesDialog : public QDialog
{
    Q_OBJECT

public:
    /// `date_key` is shown first, else the newest date.
    NotesDialog(core::Office& office, registers::NotesArea area, int project, int date_key, QWidget* parent = nullptr);

protected:
    /// Saves and closes.
    void accept() override;
    /// Asks about what is not saved.
    void reject() override;
    /// Enter on a date goes to its note: it presses no button.
    void keyPressEvent(QKeyEvent* event) override;

private:
    void lay_out();
    [[nodiscard]] QDialogButtonBox* make_buttons();
    void show_dates();
    void show_note();
    void choose(int place);
    [[nodiscard]] bool save();
    /// Runs what saves; false also when that failed, which is told.
    [[nodiscard]] bool stored(const std::function<bool()>& store);
    void show_state();

    core::Office& m_office;
    registers::Notes m_notes;
    QListWidget* m_dates;
    QPlainTextEdit* m_text;
};

/// Opens the notes over the window of `parent`; `closed` is called when they are closed.
void open_notes(core::Office& office, registers::NotesArea area, int project, int date_key, QWidget* parent,
                const std::function<void()>& closed);

} // namespace kindrel::desktop
