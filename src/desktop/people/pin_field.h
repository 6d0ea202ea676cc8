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

private:
    void take_new();

    EditorBench& m_bench;
    FieldLink<QString> m_link;
    TypedLine* m_pin;
};

} // namespace kindrel::desktop
