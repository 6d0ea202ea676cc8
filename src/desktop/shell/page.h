#pragma once

#include "core/dialogue.h"

#include <QWidget>

#include <functional>

class QAction;
class QHBoxLayout;
class QLabel;
class QVBoxLayout;

namespace kindrel::desktop {

class Chip;
class NoteBar;

/// What every page has in common: a header with title, state chip and actions, the note bar, and the content.
class Page : public QWidget
{
    Q_OBJECT

public:
    explicit Page(const QString& title, QWidget* parent = nullptr);

    [[nodiscard]] QString title() const;
    void set_title(const QString& title);
    [[nodiscard]] NoteBar& note() { return *m_note; }
    [[nodiscard]] Chip& chip() { return *m_chip; }
    /// What the status bar shows of the page, for example how many rows its list has.
    [[nodiscard]] QString status() const { return m_status; }
    void set_status(const QString& status);
    /// The name of the page's help text.
    [[nodiscard]] virtual QString help() const = 0;

    /// The page comes to the front.
    virtual void entered() {}
    /// The cursor goes to where one finds things on this page.
    virtual void find() {}
    virtual void print() {}
    /// False, after saying why, when something could not be saved.
    virtual bool save() { return true; }
    /// Something was changed that is not saved yet.
    [[nodiscard]] virtual bool altered() const { return false; }
    /// The page keeps other workstations out of what it works on.
    [[nodiscard]] virtual bool holds_lock() const { return false; }
    /// Saves or drops what is altered, as the person wishes. False: the page must stay open.
    [[nodiscard]] virtual bool leave() { return true; }

Q_SIGNALS:
    void status_changed();
    /// What altered() or holds_lock() answers.
    void state_changed();
    /// Nothing is left to do on the page: it is to be closed.
    void finished();

protected:
    /// A button at the right of the header.
    QAction* add_action(const QString& text, const QString& icon_name, const QString& tip);
    void set_content(QWidget* content);
    /// How a page that is saved as a whole leaves: what is altered is saved or, by `drop`, forgotten, as the person
    /// answers the question. False when the page must stay.
    [[nodiscard]] bool save_or_drop(core::Dialogue& dialogue, const QString& question,
                                    const std::function<void()>& drop);

private:
    QLabel* m_title;
    Chip* m_chip;
    NoteBar* m_note;
    QHBoxLayout* m_header;
    QVBoxLayout* m_column;
    QString m_status;
};

} // namespace kindrel::desktop
