#pragma once

#include "desktop/people/editor_tab.h"

#include <QLineEdit>
#include <QToolButton>

#include <span>

class QGridLayout;
class QHBoxLayout;
class QLabel;
class QLayout;

namespace kindrel::desktop {

/// The record that a field of the editor belongs to: the family, its address, or the chosen person, null for none.
template <class Record, class File>
auto* record_of(File& file, int person)
{
    if constexpr (std::is_same_v<Record, people::Family>)
        return &file.family;
    else if constexpr (std::is_same_v<Record, people::Address>)
        return &file.address;
    else
        return person < 0 || person >= std::ssize(file.people) ? nullptr : &file.people[std::size_t(person)];
}

/// Reads one field of what the bench holds, and changes it there.
template <class Value>
struct FieldLink
{
    std::function<Value()> value;
    std::function<void(const Value&)> change;
};

/// `name` names the field for undoing. What is changed is shown everywhere at once.
template <class Record, class Value>
[[nodiscard]] FieldLink<Value> field_link(EditorBench& bench, const char* name, Value Record::*member)
{
    const auto value = [&bench, member] {
        const auto* record = record_of<Record>(bench.editor.file(), bench.person());
        return record ? record->*member : Value();
    };
    const auto change = [&bench, name, member](const Value& wanted) {
        const int person = bench.person();
        bench.editor.change(QStringLiteral("%1 %2").arg(QLatin1StringView(name)).arg(person),
                            [&](people::FamilyFile& file) {
                                if (auto* record = record_of<Record>(file, person))
                                    record->*member = wanted;
                            });
        bench.show_again();
    };
    return {value, change};
}

/// A line whose text is in the family with every key: the editor undoes it, not the line.
class TypedLine : public QLineEdit
{
    Q_OBJECT

public:
    using QLineEdit::QLineEdit;
    void show_text(const QString& text);

protected:
    bool event(QEvent* event) override;
};

/// Says whether a value is kept out of every list and report, and changes that.
class HiddenEye : public QToolButton
{
    Q_OBJECT

public:
    HiddenEye(const QString& label, FieldLink<bool> hidden);
    void show_file();

private:
    FieldLink<bool> m_hidden;
};

/// A row of a form: a text of the record with its hidden twin, where it has one. `name` is the field's object name.
template <class Record>
struct FormLine
{
    const char* name;
    const char* label; ///< With the mark of its key.
    QString Record::*text;
    bool Record::*hidden = nullptr;
};

/// Rows of label, field and eye over one section of the record. A closed section says so in place of its fields.
class EditorForm : public QWidget
{
    Q_OBJECT

public:
    EditorForm(EditorBench& bench, const QString& title, bool people::RecordAccess::*section);

    /// `field` gets the label as its accessible name; an empty label goes on from the row above.
    void add_row(const QString& label, QWidget* field, QWidget* eye = nullptr);
    /// Over the whole width.
    void add_wide(QWidget* part);
    TypedLine* add_line(const QString& name, const QString& label, FieldLink<QString> text,
                        std::optional<FieldLink<bool>> hidden = {});
    template <class Record>
    void add_lines(std::span<const FormLine<Record>> lines)
    {
        for (const auto& line : lines) {
            std::optional<FieldLink<bool>> hidden;
            if (line.hidden)
                hidden = field_link(m_bench, line.name, line.hidden);
            add_line(QString::fromLatin1(line.name), QString::fromUtf8(line.label),
                     field_link(m_bench, line.name, line.text), hidden);
        }
    }
    template <class Record>
    [[nodiscard]] HiddenEye* make_eye(const char* name, const QString& label, bool Record::*hidden)
    {
        return watched(new HiddenEye(label, field_link(m_bench, name, hidden)));
    }
    /// Is called whenever the form shows the family.
    void on_show(std::function<void()> show) { m_shows.push_back(std::move(show)); }
    void show_file();

private:
    HiddenEye* watched(HiddenEye* eye);

    EditorBench& m_bench;
    bool people::RecordAccess::*m_section;
    QWidget* m_fields;
    QGridLayout* m_grid;
    QLabel* m_closed;
    std::vector<std::function<void()>> m_shows;
};

/// Fields to be read and copied only, or to be typed in.
void set_editable(QWidget& part, bool editable);

/// Forms beside each other.
[[nodiscard]] QHBoxLayout* side_by_side(std::initializer_list<QLayout*> columns);

} // namespace kindrel::desktop
