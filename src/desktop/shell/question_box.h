#pragma once

#include "core/dialogue.h"
#include "desktop/shell/input_guard.h"

#include <QDialog>

namespace kindrel::desktop {

[[nodiscard]] QString icon_name(core::Icon icon);
/// "txt" of "Text (*.txt)"; empty where the filter names none.
[[nodiscard]] QString suffix_of(const QString& filter);

/// A message with a field or list to answer it in; Enter accepts what stands there.
class QuestionBox : public QDialog
{
    Q_OBJECT

public:
    /// Takes over `answer`.
    QuestionBox(const core::Message& message, QWidget* answer, QWidget* parent, const Stopwatch& now);

    /// False when the person turned away.
    [[nodiscard]] bool ask() { return exec() == Accepted; }
};

} // namespace kindrel::desktop
