#pragma once

#include <QSettings>

#include <span>

class QHeaderView;
class QSplitter;
class QWidget;

namespace kindrel::desktop {

/// What the screens of one church look like on this workstation: sizes, columns, last choices. Keys only, never a
/// name of a person.
class Remembered
{
public:
    /// `local_settings` ends in the separator.
    Remembered(const QString& local_settings, int church);

    [[nodiscard]] QVariant value(const QString& key, const QVariant& fallback = {}) const;
    void keep(const QString& key, const QVariant& value);
    /// The same for all churches of the workstation.
    [[nodiscard]] QVariant common_value(const QString& key, const QVariant& fallback = {}) const;
    void keep_common(const QString& key, const QVariant& value);

private:
    QSettings m_file;
    QString m_church;
};

/// Bring back the state kept under the widget's object name, and keep each change from there on.
void follow(Remembered& remembered, QSplitter& splitter);
/// Columns share the list's width until the person moves one; from then on they stay as they were put. `shares` are
/// hundredths, a column each.
void follow(Remembered& remembered, QHeaderView& header, std::span<const int> shares);
/// A window's size and place; kept whenever it is hidden or closed.
void follow_window(Remembered& remembered, QWidget& window, QSize first_size);

} // namespace kindrel::desktop
