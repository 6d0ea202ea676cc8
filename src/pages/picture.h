#pragma once

#include <QByteArray>
#include <QImage>
#include <QSizeF>
#include <QString>

#include <memory>

namespace kindrel::pages {

/// An encoded picture, shared by all who draw it. A missing or unreadable one is empty and prints as an empty frame.
class Picture
{
public:
    Picture() = default;

    /// Reads the file turned the way it was taken, at no more pixels than 300 dpi need for `within` (points).
    [[nodiscard]] static Picture from_file(const QString& file, QSizeF within);
    /// The same from a file's bytes.
    [[nodiscard]] static Picture from_bytes(const QByteArray& bytes, QSizeF within);
    [[nodiscard]] static Picture from_image(const QImage& image);
    /// Takes back what `encoded` and `key` gave.
    [[nodiscard]] static Picture restored(const QByteArray& encoded, const QByteArray& key, QSize pixels);

    [[nodiscard]] bool empty() const { return !m_content; }
    [[nodiscard]] QSize pixels() const { return m_content ? m_content->pixels : QSize(); }
    [[nodiscard]] QByteArray encoded() const { return m_content ? m_content->encoded : QByteArray(); }
    /// Equal for equal content; empty for an empty picture.
    [[nodiscard]] QByteArray key() const { return m_content ? m_content->key : QByteArray(); }
    [[nodiscard]] QImage decoded() const;

    bool operator==(const Picture& other) const { return key() == other.key(); }

private:
    struct Content
    {
        QByteArray encoded;
        QByteArray key;
        QSize pixels;
    };
    std::shared_ptr<const Content> m_content;
};

} // namespace kindrel::pages
