#pragma once

#include "desktop/people/editor_fields.h"

namespace kindrel::desktop {

/// The chosen person's giving number, with what looks for a free one and what looks for another holder.
class PinField : public QWidget
{
    Q_OBJECT

public:
    explicit PinField(EditorBench& bench);
    void show_file();
    /// They stand beneath the field, where there is more room.
    [[nodiscard]] QWidget* buttons() { return m_buttons; }

private:
    void take_new();

    EditorBench& m_bench;
    FieldLink<QString> m_link;
    TypedLine* m_pin;
    QWidget* m_buttons;
};

} // namespace kindrel::desktop
