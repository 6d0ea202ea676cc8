#pragma once

#include "core/office.h"
#include "people/person_files.h"

#include <QWidget>

class QLabel;
class QPlainTextEdit;

namespace kindrel::desktop {

class Chip;

/// A page of the notebook under its heading. It is written by save() alone.
class NotebookPage : public QWidget
{
    Q_OBJECT

public:
    /// `name` becomes the text's object name.
    NotebookPage(core::Office& office, const QString& name, QWidget* parent = nullptr);

    void set_heading(const QString& heading);
    /// Reads another page; without a file there is `why` to read instead. What was typed before must be saved or
    /// dropped by then. Throws core::FileError.
    void turn_to(const std::optional<people::OwnFile>& file, const QString& why = {});
    void set_editable(bool editable);
    [[nodiscard]] bool altered() const;
    /// False, after saying why, when the page could not be written.
    bool save();
    void drop();

Q_SIGNALS:
    void typed();

private:
    void show_state();

    core::Office& m_office;
    QLabel* m_heading;
    Chip* m_state;
    QPlainTextEdit* m_text;
    std::optional<people::OwnFile> m_file;
    QString m_stored;
};

} // namespace kindrel::desktop
