#include "pages/packing.h"

#include <algorithm>
#include <cstring>
#include <type_traits>

namespace kindrel::pages {

namespace {

template <class T>
concept Plain = std::is_trivially_copyable_v<T>;

class Packer
{
public:
    template <Plain... T>
    void put(const T&... values)
    {
        (append(&values, sizeof values), ...);
    }
    void put_text(const QString& text)
    {
        put(qint32(text.size()));
        append(text.constData(), size_t(text.size()) * sizeof(QChar));
    }
    void put_bytes(const QByteArray& bytes)
    {
        put(qint32(bytes.size()));
        append(bytes.constData(), size_t(bytes.size()));
    }
    template <Plain T>
    void put_all(const std::vector<T>& values)
    {
        put(qint32(values.size()));
        append(values.data(), values.size() * sizeof(T));
    }
    [[nodiscard]] QByteArray take() { return std::move(m_bytes); }

private:
    void append(const void* data, size_t size) { m_bytes.append(static_cast<const char*>(data), qsizetype(size)); }

    QByteArray m_bytes;
};

class Unpacker
{
public:
    explicit Unpacker(const QByteArray& bytes) : m_at(bytes.constData()), m_end(m_at + bytes.size()) {}

    template <Plain... T>
    void take(T&... values)
    {
        (copy(&values, sizeof values), ...);
    }
    template <Plain T>
    [[nodiscard]] T take()
    {
        T value{};
        take(value);
        return value;
    }
    [[nodiscard]] QString take_text()
    {
        QString text(take<qint32>(), Qt::Uninitialized);
        copy(text.data(), size_t(text.size()) * sizeof(QChar));
        return text;
    }
    [[nodiscard]] QByteArray take_bytes()
    {
        QByteArray bytes(take<qint32>(), Qt::Uninitialized);
        copy(bytes.data(), size_t(bytes.size()));
        return bytes;
    }
    template <Plain T>
    void take_all(std::vector<T>& values)
    {
        values.resize(size_t(take<qint32>()));
        copy(values.data(), values.size() * sizeof(T));
    }

private:
    void copy(void* to, size_t size)
    {
        Q_ASSERT(m_end - m_at >= qptrdiff(size));
        if (size > 0)
            std::memcpy(to, m_at, size);
        m_at += size;
    }

    const char* m_at;
    const char* m_end;
};

/// The styles of one page in the order they were met.
class Palette
{
public:
    [[nodiscard]] qint32 index_of(const TextStyle& style)
    {
        const auto known = std::ranges::find(m_styles, style);
        if (known != m_styles.end())
            return qint32(known - m_styles.begin());
        m_styles.push_back(style);
        return qint32(m_styles.size()) - 1;
    }
    [[nodiscard]] const TextStyle& at(qint32 index) const { return m_styles[size_t(index)]; }

    void pack(Packer& out) const
    {
        out.put(qint32(m_styles.size()));
        for (const auto& style : m_styles) {
            out.put_text(style.family);
            out.put(style.size, style.bold, style.italic, style.underline, style.colour);
        }
    }
    void unpack(Unpacker& in)
    {
        m_styles.resize(size_t(in.take<qint32>()));
        for (auto& style : m_styles) {
            style.family = in.take_text();
            in.take(style.size, style.bold, style.italic, style.underline, style.colour);
        }
    }

private:
    std::vector<TextStyle> m_styles;
};

struct ItemPacker
{
    Packer& out;
    Palette& palette;

    void operator()(const TextItem& item) const
    {
        out.put(item.at, item.width, item.align, item.right_to_left, item.angle, palette.index_of(item.style));
        out.put_text(item.text);
        out.put(qint32(item.spans.size()));
        for (const auto& span : item.spans)
            out.put(span.length, palette.index_of(span.style));
    }
    void operator()(const LineItem& item) const { out.put(item); }
    void operator()(const RectsItem& item) const
    {
        out.put_all(item.rects);
        out.put(item.fill, item.outline, item.thickness);
    }
    void operator()(const PolygonItem& item) const
    {
        out.put_all(item.points);
        out.put(item.fill, item.outline, item.thickness);
    }
    void operator()(const PictureItem& item) const
    {
        out.put(item.where);
        out.put_bytes(item.picture.key());
    }
};

struct ItemUnpacker
{
    Unpacker& in;
    const Palette& palette;
    const std::function<Picture(const QByteArray&)>& picture;

    void operator()(TextItem& item) const
    {
        in.take(item.at, item.width, item.align, item.right_to_left, item.angle);
        item.style = palette.at(in.take<qint32>());
        item.text = in.take_text();
        item.spans.resize(size_t(in.take<qint32>()));
        for (auto& span : item.spans) {
            in.take(span.length);
            span.style = palette.at(in.take<qint32>());
        }
    }
    void operator()(LineItem& item) const { in.take(item); }
    void operator()(RectsItem& item) const
    {
        in.take_all(item.rects);
        in.take(item.fill, item.outline, item.thickness);
    }
    void operator()(PolygonItem& item) const
    {
        in.take_all(item.points);
        in.take(item.fill, item.outline, item.thickness);
    }
    void operator()(PictureItem& item) const
    {
        in.take(item.where);
        const auto key = in.take_bytes();
        item.picture = key.isEmpty() ? Picture() : picture(key);
    }
};

/// An item of the variant's alternative `kind`.
Item item_of_kind(quint8 kind)
{
    switch (kind) {
    case 0:
        return TextItem();
    case 1:
        return LineItem();
    case 2:
        return RectsItem();
    case 3:
        return PolygonItem();
    default:
        return PictureItem();
    }
}

} // namespace

QByteArray packed(const Page& page)
{
    Packer items;
    Palette palette;
    for (const auto& item : page.items) {
        items.put(quint8(item.index()));
        std::visit(ItemPacker{items, palette}, item);
    }
    Packer whole;
    whole.put(page.number, page.size, qint32(page.items.size()));
    palette.pack(whole);
    return whole.take() + items.take();
}

Page unpacked(const QByteArray& bytes, const std::function<Picture(const QByteArray& key)>& picture)
{
    Unpacker in(bytes);
    Page page;
    in.take(page.number, page.size);
    const auto count = size_t(in.take<qint32>());
    page.items.reserve(count);
    Palette palette;
    palette.unpack(in);
    while (page.items.size() < count) {
        auto& item = page.items.emplace_back(item_of_kind(in.take<quint8>()));
        std::visit(ItemUnpacker{in, palette, picture}, item);
    }
    return page;
}

} // namespace kindrel::pages
