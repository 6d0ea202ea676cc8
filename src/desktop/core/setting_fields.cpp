#include "desktop/core/setting_fields.h"

#include <QCheckBox>
#include <QComboBox>
#include <QFontDatabase>
#include <QLineEdit>
#include <QPlainTextEdit>
#include <QSignalBlocker>
#include <QSpinBox>

namespace kindrel::desktop {

using core::Settings;

SettingFields::SettingFields(std::function<Settings&()> settings, QObject* parent)
    : QObject(parent), m_settings(std::move(settings))
{
}

QCheckBox* SettingFields::tick(bool Settings::*member, const QString& name, const QString& text)
{
    auto* box = new QCheckBox(text);
    box->setObjectName(name);
    connect(box, &QCheckBox::toggled, this, [this, member](bool on) {
        m_settings().*member = on;
        Q_EMIT edited();
    });
    shown_by([box, member](const Settings& settings) { box->setChecked(settings.*member); });
    return box;
}

QLineEdit* SettingFields::line(QString Settings::*member, const QString& name)
{
    auto* line = new QLineEdit;
    line->setObjectName(name);
    connect(line, &QLineEdit::textEdited, this, [this, member](const QString& text) {
        m_settings().*member = text;
        Q_EMIT edited();
    });
    shown_by([line, member](const Settings& settings) {
        if (line->text() != settings.*member)
            line->setText(settings.*member);
    });
    return line;
}

QPlainTextEdit* SettingFields::paragraph(QString Settings::*member, const QString& name)
{
    auto* text = new QPlainTextEdit;
    text->setObjectName(name);
    text->setTabChangesFocus(true);
    connect(text, &QPlainTextEdit::textChanged, this, [this, text, member] {
        m_settings().*member = text->toPlainText();
        Q_EMIT edited();
    });
    shown_by([text, member](const Settings& settings) {
        const QSignalBlocker quiet(text);
        if (text->toPlainText() != settings.*member) // The cursor stays where it is.
            text->setPlainText(settings.*member);
    });
    return text;
}

QSpinBox* SettingFields::number(int Settings::*member, const QString& name, int most)
{
    auto* number = new QSpinBox;
    number->setObjectName(name);
    number->setRange(0, most);
    connect(number, &QSpinBox::valueChanged, this, [this, member](int value) {
        m_settings().*member = value;
        Q_EMIT edited();
    });
    shown_by([number, member](const Settings& settings) { number->setValue(settings.*member); });
    return number;
}

QComboBox* SettingFields::choice(int Settings::*member, const QString& name, const QStringList& texts)
{
    return choice([member](const Settings& settings) { return settings.*member; },
                  [member](Settings& settings, int place) { settings.*member = place; }, name, texts);
}

QComboBox* SettingFields::choice(std::function<int(const Settings&)> read, std::function<void(Settings&, int)> write,
                                 const QString& name, const QStringList& texts)
{
    auto* choice = new QComboBox;
    choice->setObjectName(name);
    choice->addItems(texts);
    connect(choice, &QComboBox::currentIndexChanged, this, [this, write = std::move(write)](int place) {
        write(m_settings(), place);
        Q_EMIT edited();
    });
    shown_by([choice, read = std::move(read)](const Settings& settings) { choice->setCurrentIndex(read(settings)); });
    return choice;
}

QComboBox* SettingFields::font(QString Settings::*member, const QString& name, const QString& none)
{
    auto* fonts = new QComboBox;
    fonts->setObjectName(name);
    fonts->addItem(none, QString());
    for (const auto& family : QFontDatabase::families())
        if (!QFontDatabase::isPrivateFamily(family))
            fonts->addItem(family, family);
    fonts->setMinimumContentsLength(none.size());
    fonts->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    connect(fonts, &QComboBox::currentIndexChanged, this, [this, fonts, member](int place) {
        m_settings().*member = fonts->itemData(place).toString();
        Q_EMIT edited();
    });
    shown_by([fonts, member](const Settings& settings) {
        const QString& stored = settings.*member;
        if (fonts->findData(stored) < 0)
            fonts->addItem(stored, stored);
        fonts->setCurrentIndex(fonts->findData(stored));
    });
    return fonts;
}

void SettingFields::show()
{
    // Showing makes the widgets tell of a change; nobody but the person may be heard.
    const QSignalBlocker quiet(this);
    const Settings settings = m_settings();
    for (const auto& show : m_shows)
        show(settings);
    m_settings() = settings;
}

void SettingFields::shown_by(std::function<void(const Settings&)> show)
{
    const QSignalBlocker quiet(this);
    const Settings settings = m_settings();
    show(settings);
    m_settings() = settings; // A widget that cannot show a value must not alter it.
    m_shows.push_back(std::move(show));
}

} // namespace kindrel::desktop
