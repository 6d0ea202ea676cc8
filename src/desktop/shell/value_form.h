#pragma once

#include <QWidget>

#include <vector>

class QGridLayout;
class QLabel;

namespace kindrel::desktop {

/// The words that mark a value kept out of every list and report.
[[nodiscard]] QString hidden_mark();

/// Rows of caption and value to be read and copied, not changed.
class ValueForm : public QWidget
{
    Q_OBJECT

public:
    explicit ValueForm(const QString& title, const QStringList& captions, QWidget* parent = nullptr);

    /// A row without a caption goes on from the one above and is left out when it is empty.
    void set(int row, const QString& value, bool hidden = false);

private:
    struct Row
    {
        QLabel* caption;
        QLabel* value;
        QWidget* hidden;
    };

    void add_row(const QString& caption);

    QGridLayout* m_grid;
    std::vector<Row> m_rows;
};

/// A group's heading.
[[nodiscard]] QLabel* make_heading(const QString& text);
/// A text that can be selected by mouse and keyboard.
[[nodiscard]] QLabel* make_value();

} // namespace kindrel::desktop
