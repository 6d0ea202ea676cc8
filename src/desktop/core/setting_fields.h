#pragma once

#include "core/settings.h"

#include <QObject>

#include <functional>
#include <vector>

class QCheckBox;
class QComboBox;
class QLineEdit;
class QPlainTextEdit;
class QSpinBox;

namespace kindrel::desktop {

/// Makes the widgets that alter single settings. Each bears the stored name of its field as object name.
class SettingFields : public QObject
{
    Q_OBJECT

public:
    /// `settings` gives what is being altered; it is asked each time.
    explicit SettingFields(std::function<core::Settings&()> settings, QObject* parent);

    [[nodiscard]] QCheckBox* tick(bool core::Settings::*member, const QString& name, const QString& text);
    [[nodiscard]] QLineEdit* line(QString core::Settings::*member, const QString& name);
    /// Tab leaves it.
    [[nodiscard]] QPlainTextEdit* paragraph(QString core::Settings::*member, const QString& name);
    [[nodiscard]] QSpinBox* number(int core::Settings::*member, const QString& name, int most);
    /// The stored number is the place in the list.
    [[nodiscard]] QComboBox* choice(int core::Settings::*member, const QString& name, const QStringList& texts);
    [[nodiscard]] QComboBox* choice(std::function<int(const core::Settings&)> read,
                                    std::function<void(core::Settings&, int)> write, const QString& name,
                                    const QStringList& texts);
    /// The fonts of this workstation, `none` for the empty name, and the stored one wherever it comes from.
    [[nodiscard]] QComboBox* font(QString core::Settings::*member, const QString& name, const QString& none);

    /// Shows the settings as they are now.
    void show();

Q_SIGNALS:
    /// By the person.
    void edited();

private:
    /// How a widget shows its setting; it is shown at once.
    void shown_by(std::function<void(const core::Settings&)> show);

    std::function<core::Settings&()> m_settings;
    std::vector<std::function<void(const core::Settings&)>> m_shows;
};

} // namespace kindrel::desktop
