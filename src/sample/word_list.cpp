#include "sample/word_list.h"

#include <QFile>

#include <stdexcept>

// Resources of a static library are only there once this was called, outside of any namespace.
static void load_resources()
{
    Q_INIT_RESOURCE(sample_lists);
}

namespace kindrel::sample {

using namespace Qt::StringLiterals;

QByteArray read_sample(const QString& name)
{
    load_resources();
    QFile file(u":/sample/"_s + name);
    if (!file.open(QIODevice::ReadOnly))
        throw std::logic_error("no file of this name was compiled in: " + name.toStdString());
    return file.readAll();
}

std::vector<QStringList> read_list(const QString& name)
{
    std::vector<QStringList> lines;
    for (const QString& line : QString::fromUtf8(read_sample(name + u".txt"_s)).split(u'\n')) {
        if (line.isEmpty() || line.startsWith(u'#'))
            continue;
        auto& columns = lines.emplace_back(line.split(u'|'));
        for (auto& column : columns)
            column = column.trimmed();
    }
    return lines;
}

QStringList read_words(const QString& name)
{
    QStringList words;
    for (const auto& columns : read_list(name))
        words += columns.first();
    return words;
}

} // namespace kindrel::sample
