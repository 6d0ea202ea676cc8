#pragma once

#include <QLineEdit>

#include <functional>

namespace kindrel::desktop {

/// A name that is handed over when its field is left or Enter is pressed; Enter goes on to the next field. A refused
/// name stays, selected and with the cursor in it; Escape gives it up.
class NameField : public QLineEdit
{
    Q_OBJECT

public:
    /// False, after saying why, when the name is refused.
    using Take = std::function<bool(const QString&)>;

    explicit NameField(Take take, QWidget* parent = nullptr);

    void show_name(const QString& name);
    /// Hands over what was typed; false when it was refused.
    bool finish();
    /// Forgets what was typed.
    void drop();
    /// Something was typed that is not handed over.
    [[nodiscard]] bool typing() const { return isModified() && text() != m_name; }

protected:
    void keyPressEvent(QKeyEvent* event) override;

private:
    Take m_take;
    QString m_name;
    bool m_asking = false;
};

} // namespace kindrel::desktop
