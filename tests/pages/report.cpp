#include "pages/report.h"

#include <QGuiApplication>

#include <cmath>

using namespace Qt::StringLiterals;

namespace kindrel::pages {

PageSetup Report::ten_lines(int columns)
{
    PageSetup setup;
    setup.columns = columns;
    const auto height = TextMetrics().line_height(TextStyle()) * 10.2;
    setup.margins = {40, 40, 40, setup.size().height() - 40 - height};
    return setup;
}

std::vector<Placed> Report::placed() const
{
    std::vector<Placed> all;
    for (int number = 1; number <= spool.page_count(); ++number) {
        for (const auto& item : spool.page(number).items) {
            if (const auto* text = std::get_if<TextItem>(&item))
                all.push_back({text->text, number, text->at, text->at.x() + text->width});
        }
    }
    return all;
}

std::string Report::columns_of(const PageSetup& setup) const
{
    QString all;
    int page = 1, column = 0;
    for (const auto& text : placed()) {
        const auto its_column =
            int(std::floor((text.at.x() - setup.margins.left() + 0.5) / (setup.column_width() + setup.column_gap)));
        if (text.page != page)
            all += u"|| "_s;
        else if (its_column != column)
            all += u"| "_s;
        page = text.page;
        column = its_column;
        all += text.text + u' ';
    }
    return all.trimmed().toStdString();
}

void write_lines(Writer& writer, int from, int to)
{
    for (int i = from; i <= to; ++i)
        writer.line(QString::number(i));
}

} // namespace kindrel::pages

int main(int argc, char** argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QGuiApplication application(argc, argv);
    ::testing::InitGoogleTest(&argc, argv);
    return RUN_ALL_TESTS();
}
