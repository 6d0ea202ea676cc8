#include "output/custom/custom_fixture.h"

#include <cmath>

namespace kindrel::test {

using namespace Qt::StringLiterals;

output::CustomReport CustomTest::lay(const QString& name, const QString& text)
{
    const auto file = office.paths.folder(core::Folder::custom) + name;
    DataFolder::write(file, text.toUtf8());
    return {file, name};
}

std::vector<QStringList> CustomTest::read_back(const pages::PageSpool& spool)
{
    constexpr qreal slack = 0.5;
    std::vector<QStringList> all;
    for (int number = 1; number <= spool.page_count(); ++number) {
        QStringList lines;
        const auto page = spool.page(number);
        const pages::TextItem* before = nullptr;
        for (const auto& item : page.items) {
            const auto* text = std::get_if<pages::TextItem>(&item);
            if (!text)
                continue;
            const auto words = QString(text->text).replace(pages::page_total_mark, QString::number(spool.page_count()));
            const bool same_line = before && std::abs(text->at.y() - before->at.y()) < slack;
            const bool apart = same_line && std::abs(text->at.x() - before->at.x() - before->width) > slack;
            if (same_line)
                lines.back() += (apart ? u" | "_s : QString()) + words;
            else
                lines += words;
            before = text;
        }
        all.push_back(lines);
    }
    return all;
}

std::vector<QStringList> CustomTest::pages_of(const QString& layout, const QString& name)
{
    pages::PageSpool spool;
    const auto custom = lay(name, u"decoration no\n"_s + layout);
    EXPECT_TRUE(output::run_custom_report(custom, {office, list, options}, progress, spool));
    EXPECT_TRUE(spool.finished());
    return read_back(spool);
}

QStringList CustomTest::printed(const QString& layout, const QString& name)
{
    QStringList all;
    for (const auto& page : pages_of(layout, name))
        all += page;
    return all;
}

QString damaged(QString text, std::mt19937& chance)
{
    const auto below = [&](qsizetype limit) {
        return qsizetype(chance() % unsigned(limit));
    };
    const QStringList scraps{u"\""_s,        u"["_s,     u"]"_s,      u"{"_s,   u"}"_s,      u"|"_s,
                             u"\n"_s,        u"#"_s,     u" "_s,      u"9"_s,   u"-1e309"_s, u"lines"_s,
                             u"joined "_s,   u"end\n"_s, u"mm"_s,     u"\t"_s,  u"é"_s,      u"\u2028"_s,
                             u"group by "_s, u"line "_s, u"style "_s, u"row "_s};
    for (auto changes = 1 + below(4); changes > 0; --changes) {
        const auto at = below(text.size());
        if (below(3) == 0)
            text.remove(at, 1 + below(12));
        else if (below(2) == 0)
            text.insert(at, scraps[below(scraps.size())]);
        else
            text.insert(at, text.mid(below(text.size()), below(30)));
    }
    return text;
}

} // namespace kindrel::test
