#pragma once

#include <QWidget>

#include <vector>

class QHBoxLayout;
class QLineEdit;

namespace kindrel::desktop {

/// The fields of one new item beside each other. Enter goes on to the next field while that is empty.
class AddLine : public QWidget
{
    Q_OBJECT

public:
    /// `captions` name the fields; the first reads "New …".
    explicit AddLine(const QStringList& captions, QWidget* parent = nullptr);

    [[nodiscard]] QStringList texts() const;
    [[nodiscard]] bool is_empty() const;
    void set_texts(const QStringList& texts);
    void clear() { set_texts({}); }
    /// The cursor goes there, with the text selected.
    void focus_field(int place);
    /// To the first field that is empty, else to the first.
    void focus_lacking_field();
    void add_button(QWidget* button);

Q_SIGNALS:
    void edited();
    /// Enter was pressed and nothing is left to go on to.
    void entered();

protected:
    /// Enter goes no further: in a dialog it would press the button as well.
    void keyPressEvent(QKeyEvent* event) override;

private:
    void go_on_from(std::size_t field);
    [[nodiscard]] bool lacks(std::size_t field) const;

    QHBoxLayout* m_row;
    std::vector<QLineEdit*> m_fields;
};

} // namespace kindrel::desktop
