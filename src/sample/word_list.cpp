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

std::vector<QStringList> read_list(const QString& name)
{
    load_resources();
    QFile file(u":/sample/%1.txt"_s.arg(name));
    if (!file.open(QIODevice::ReadOnly))
        throw std::logic_error("no list of this name was compiled in: " + name.toStdString());
    std::vector<QStringList> lines;
    for (const QString& line : QString::fromUtf8(file.readAll()).split(u'\n')) {
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
