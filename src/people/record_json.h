#pragma once

#include "core/date.h"

#include <QJsonArray>
#include <QJsonObject>

#include <concepts>
#include <optional>
#include <type_traits>
#include <vector>

namespace kindrel::people {

// Records as JSON objects. A record is described once, for the writer and the reader alike: by a function
// `template <class Side> void describe(Side&, Record&)` in this namespace that hands out each member by its name.

/// Collects a record's members. Changes none of them: they are taken as the descriptions hand them out.
class JsonWriter
{
public:
    template <class Value>
    void member(const char* name, Value& value)
    {
        m_object.insert(QString::fromLatin1(name), json(value));
    }
    template <class Code>
    void code(const char* name, Code& value, int)
    {
        member(name, value);
    }
    template <class Record>
    [[nodiscard]] static QJsonObject json(Record& record)
    {
        JsonWriter writer;
        describe(writer, record);
        return writer.m_object;
    }

private:
    static QJsonValue json(int& number) { return number; }
    static QJsonValue json(bool& flag) { return flag; }
    static QJsonValue json(QString& text) { return text; }
    /// A day that was never set becomes an empty text.
    static QJsonValue json(core::Date& date) { return date.stored(); }
    template <class Code>
    requires std::is_enum_v<Code>
    static QJsonValue json(Code& code) { return static_cast<int>(code); }
    template <class Inner>
    static QJsonValue json(std::optional<Inner>& maybe)
    {
        return maybe ? QJsonValue(json(*maybe)) : QJsonValue();
    }
    template <class Record>
    static QJsonValue json(std::vector<Record>& list)
    {
        QJsonArray array;
        for (auto& record : list)
            array.append(json(record));
        return array;
    }

    QJsonObject m_object;
};

/// Fills a record; false once a member is missing, of another kind or beyond its range.
class JsonReader
{
public:
    template <class Value>
    void member(const char* name, Value& value)
    {
        m_good = m_good && read(m_object.value(QLatin1StringView(name)), value);
    }
    /// An enumeration, set or not, with `count` values from 0 on.
    template <class Code>
    void code(const char* name, Code& value, int count)
    {
        member(name, value);
        const auto json = m_object.value(QLatin1StringView(name));
        m_good = m_good && (json.isNull() || (json.toInt(-1) >= 0 && json.toInt() < count));
    }
    template <class Record>
    [[nodiscard]] static bool read(const QJsonValue& json, Record& record)
    {
        JsonReader reader(json.toObject());
        describe(reader, record);
        return reader.m_good;
    }

private:
    explicit JsonReader(QJsonObject object) : m_object(std::move(object)) {}

    static bool read(const QJsonValue& json, int& number)
    {
        number = json.toInt();
        return json.isDouble();
    }
    static bool read(const QJsonValue& json, bool& flag)
    {
        flag = json.toBool();
        return json.isBool();
    }
    static bool read(const QJsonValue& json, QString& text)
    {
        text = json.toString();
        return json.isString();
    }
    static bool read(const QJsonValue& json, core::Date& date)
    {
        const auto text = json.toString();
        date = core::Date::from_stored(text).value_or(core::Date{});
        return json.isString() && (text.isEmpty() || date.valid());
    }
    template <class Code>
    requires std::is_enum_v<Code>
    static bool read(const QJsonValue& json, Code& code)
    {
        code = static_cast<Code>(json.toInt());
        return json.isDouble();
    }
    template <class Inner>
    static bool read(const QJsonValue& json, std::optional<Inner>& maybe)
    {
        return json.isNull() || read(json, maybe.emplace());
    }
    template <class Record>
    static bool read(const QJsonValue& json, std::vector<Record>& list)
    {
        for (const auto& element : json.toArray()) {
            if (!read(element, list.emplace_back()))
                return false;
        }
        return json.isArray();
    }

    QJsonObject m_object;
    bool m_good = true;
};

} // namespace kindrel::people
