#include "pages/chart.h"

#include "pages/chart_canvas.h"

#include <QPolygonF>
#include <QTransform>
#include <gtest/gtest.h>

#include <algorithm>

using namespace Qt::StringLiterals;

namespace kindrel::pages {

namespace {

constexpr QSizeF size(511, 235);
constexpr QStringView empty_words = u"No figures";

ChartSeries series(const QString& name, std::vector<std::optional<double>> values)
{
    return {name, std::move(values)};
}

/// Figures that rise and fall around `middle`, without a pattern that all series share.
ChartData made(int series_count, int categories, double middle)
{
    ChartData data{.title = u"Attendance"_s, .categories = {}, .series = {}};
    for (int i = 0; i < categories; ++i)
        data.categories += u"%1/03/2007"_s.arg(i);
    for (int s = 0; s < series_count; ++s) {
        data.series.push_back({u"Category %1"_s.arg(s), {}});
        for (int i = 0; i < categories; ++i)
            data.series.back().values.push_back(middle + (i * 37 + s * 53) % 101 - 50);
    }
    return data;
}

/// The surroundings of a text as it is drawn, turned or not.
QPolygonF outline_of(const TextItem& text)
{
    const QRectF upright(0, -text.style.size * 0.7, text.width, text.style.size * 0.75);
    return QTransform().translate(text.at.x(), text.at.y()).rotate(text.angle).map(QPolygonF(upright));
}

QRectF bounds_of(const Item& item)
{
    if (const auto* text = std::get_if<TextItem>(&item))
        return outline_of(*text).boundingRect();
    if (const auto* line = std::get_if<LineItem>(&item))
        return QRectF(line->from, line->to).normalized();
    const auto& points = std::get<PolygonItem>(item).points;
    return QPolygonF(QList<QPointF>(points.begin(), points.end())).boundingRect();
}

class ChartTest : public ::testing::Test
{
protected:
    Drawing draw(const ChartData& data, const QString& style)
    {
        return chart(data, *find_chart_style(style), size, type, metrics);
    }
    template <class Kind>
    static std::vector<Kind> all(const Drawing& drawing)
    {
        std::vector<Kind> found;
        for (const auto& item : drawing.items) {
            if (const auto* one = std::get_if<Kind>(&item))
                found.push_back(*one);
        }
        return found;
    }
    static QStringList texts(const Drawing& drawing)
    {
        QStringList found;
        for (const auto& text : all<TextItem>(drawing))
            found += text.text;
        return found;
    }
    /// The polygons of the look's front faces, in the order of drawing.
    static std::vector<QRectF> faces(const Drawing& drawing, std::size_t look)
    {
        std::vector<QRectF> found;
        for (const auto& polygon : all<PolygonItem>(drawing)) {
            if ((polygon.fill | 0xff000000) == look_of(look).fill)
                found.push_back(bounds_of(polygon));
        }
        return found;
    }
    /// The height at which the axis bears the label.
    static qreal height_of(const Drawing& drawing, const QString& label)
    {
        for (const auto& text : all<TextItem>(drawing)) {
            if (text.text == label)
                return bounds_of(text).center().y();
        }
        ADD_FAILURE() << "no label " << label.toStdString();
        return 0;
    }

    TypeScale type = TypeScale::around({});
    TextMetrics metrics;
};

} // namespace

TEST_F(ChartTest, TheNineStylesAreFoundByTheirNames)
{
    QStringList names;
    for (const auto& style : chart_styles()) {
        names += QString::fromUtf8(style.name);
        EXPECT_EQ(find_chart_style(names.back().toLower()), &style);
    }

    EXPECT_EQ(names, QStringList({u"3D Bar"_s, u"2D Bar"_s, u"3D Line"_s, u"2D Line"_s, u"3D Area"_s, u"2D Area"_s,
                                  u"3D Step"_s, u"2D Step"_s, u"2D Pie"_s}));
    EXPECT_EQ(find_chart_style(u"3D Pie"), nullptr);
}

TEST_F(ChartTest, TheAxisGoesInRoundStepsAndContainsZero)
{
    struct Case
    {
        std::vector<std::optional<double>> values;
        double finest;
        QStringList labels;
    };
    const std::vector<Case> cases{
        {{3, 47}, 0, {u"0"_s, u"10"_s, u"20"_s, u"30"_s, u"40"_s, u"50"_s}},
        {{0.7}, 0, {u"0"_s, u"0.1"_s, u"0.2"_s, u"0.3"_s, u"0.4"_s, u"0.5"_s, u"0.6"_s, u"0.7"_s}},
        {{2}, 1, {u"0"_s, u"1"_s, u"2"_s}},
        {{-30, 70}, 0, {u"-40"_s, u"-20"_s, u"0"_s, u"20"_s, u"40"_s, u"60"_s, u"80"_s}},
        {{-5, -900}, 0, {u"-1000"_s, u"-800"_s, u"-600"_s, u"-400"_s, u"-200"_s, u"0"_s}},
        {{99999}, 0, {u"0"_s, u"20000"_s, u"40000"_s, u"60000"_s, u"80000"_s, u"100000"_s}},
        {{0, 0}, 1, {u"0"_s, u"1"_s}},
    };
    for (const auto& one : cases) {
        const ChartData data{
            .title = {}, .categories = {}, .series = {series({}, one.values)}, .finest_step = one.finest};
        auto found = texts(draw(data, u"2D Bar"_s));
        EXPECT_EQ(found, one.labels) << found.join(u' ').toStdString();
    }
}

TEST_F(ChartTest, BarsBelowZeroHangFromTheZeroLine)
{
    const ChartData data{.title = {}, .categories = {}, .series = {series({}, {40, -20})}};
    for (const auto& style : {u"2D Bar"_s, u"3D Bar"_s}) {
        const auto drawing = draw(data, style);
        const auto bars = faces(drawing, 0);
        ASSERT_EQ(bars.size(), 2) << style.toStdString();
        EXPECT_NEAR(bars[0].bottom(), height_of(drawing, u"0"_s), 1);
        EXPECT_NEAR(bars[0].top(), height_of(drawing, u"40"_s), 1);
        EXPECT_NEAR(bars[1].top(), height_of(drawing, u"0"_s), 1);
        EXPECT_NEAR(bars[1].bottom(), height_of(drawing, u"-20"_s), 1);
    }
}

TEST_F(ChartTest, BarsOfOneCategoryStandSideBySide)
{
    const auto drawing =
        draw({.title = {}, .categories = {}, .series = {series(u"A"_s, {5, 6}), series(u"B"_s, {7, 8})}}, u"2D Bar"_s);
    const auto first = faces(drawing, 0), second = faces(drawing, 1);

    // The first of each is the legend's.
    EXPECT_NEAR(first[1].right(), second[1].left(), 0.01);
    EXPECT_GT(first[2].left(), second[1].right());
}

TEST_F(ChartTest, ABodyInFrontIsDrawnAfterWhatItHides)
{
    const ChartData data{
        .title = {}, .categories = {}, .series = {series(u"Large"_s, {90, 90}), series(u"Small"_s, {20, 20})}};
    for (const auto& style : {u"2D Area"_s, u"3D Area"_s}) {
        const auto drawing = draw(data, style);
        qsizetype large = -1, small = -1;
        const auto polygons = all<PolygonItem>(drawing);
        for (std::size_t i = 0; i < polygons.size(); ++i) {
            if ((polygons[i].fill | 0xff000000) == look_of(0).fill && bounds_of(polygons[i]).height() > 30)
                large = qsizetype(i);
            if ((polygons[i].fill | 0xff000000) == look_of(1).fill && bounds_of(polygons[i]).height() > 30)
                small = qsizetype(i);
        }
        EXPECT_GE(large, 0);
        EXPECT_GT(small, large) << style.toStdString();
    }
}

TEST_F(ChartTest, ALineBreaksWhereAValueIsMissing)
{
    const auto drawing = draw({.title = {}, .categories = {}, .series = {series({}, {5, 6, {}, 8, 9})}}, u"2D Line"_s);
    int strokes = 0;
    for (const auto& line : all<LineItem>(drawing))
        strokes += line.colour == look_of(0).fill;

    EXPECT_EQ(strokes, 2);
    EXPECT_EQ(faces(drawing, 0).size(), 4) << "a marker for each value";
}

TEST_F(ChartTest, ValuesAreShownByTheirOwnFormat)
{
    const ChartData data{.title = {}, .categories = {}, .series = {series({}, {15})}, .shown = [](double value) {
                             return u"$%1"_s.arg(value, 0, 'f', 2);
                         }};

    EXPECT_TRUE(texts(draw(data, u"2D Bar"_s)).contains(u"$10.00"_s));
    EXPECT_EQ(texts(draw(data, u"2D Pie"_s)).back(), u": $15.00 (100.0%)"_s);
}

TEST_F(ChartTest, LooksDifferWithoutColour)
{
    for (std::size_t one = 0; one < look_count; ++one) {
        for (std::size_t other = 0; other < one; ++other) {
            const auto &a = look_of(one), &b = look_of(other);
            EXPECT_NE(a.marker, b.marker);
            EXPECT_TRUE(a.hatch != b.hatch || std::abs(qGray(a.fill) - qGray(b.fill)) > 30) << one << " and " << other;
        }
    }
}

TEST_F(ChartTest, TheLegendNamesTheSeriesAndCountsThoseThatFindNoPlace)
{
    const auto few = texts(draw(made(9, 12, 60), u"2D Bar"_s));
    for (int i = 0; i < 9; ++i)
        EXPECT_TRUE(few.contains(u"Category %1"_s.arg(i)));

    const auto many = texts(draw(made(200, 2, 60), u"2D Bar"_s));
    const auto named = many.filter(u"Category "_s).size();
    EXPECT_TRUE(many.contains(u"and %1 more"_s.arg(200 - named)));

    EXPECT_FALSE(texts(draw(made(1, 12, 60), u"2D Bar"_s)).contains(u"Category 0"_s));
}

TEST_F(ChartTest, APieNamesTheShareOfEachSlice)
{
    struct Case
    {
        ChartData data;
        QStringList labels;
    };
    const QStringList months{u"May"_s, u"June"_s, u"July"_s, u"August"_s};
    const std::vector<Case> cases{
        {{.title = {}, .categories = months, .series = {series({}, {10, 20, {}, 30})}},
         {u"May: 10 (16.7%)"_s, u"June: 20 (33.3%)"_s, u"August: 30 (50.0%)"_s}},
        {{.title = {}, .categories = months, .series = {series(u"A"_s, {10, 20}), series(u"B"_s, {90})}},
         {u"A: 30 (25.0%)"_s, u"B: 90 (75.0%)"_s}},
        {{.title = {}, .categories = months, .series = {series({}, {1000, 9, 990, 1})}},
         {u"May: 1000 (50.0%)"_s, u"July: 990 (49.5%)"_s, u"Other: 10 (0.5%)"_s}},
        {{.title = {}, .categories = months, .series = {series({}, {75, -5, 25})}},
         {u"Below zero and not shown: June"_s, u"May: 75 (75.0%)"_s, u"July: 25 (25.0%)"_s}},
    };
    for (auto one : cases) {
        auto found = texts(draw(one.data, u"2D Pie"_s));
        found.sort();
        one.labels.sort();
        EXPECT_EQ(found, one.labels) << found.join(u", "_s).toStdString();
    }
}

TEST_F(ChartTest, APieShortensTheNameOfASliceAndNeverItsFigure)
{
    const auto name = u"Thanksgiving offering for the work in distant countries"_s;
    const ChartData data{.title = {},
                         .categories = {name, name, name},
                         .series = {series({}, {62599374, 62599374, 125198748})},
                         .shown = [](double value) {
                             return QString::number(value, 'f', 0);
                         }};
    const auto found = texts(draw(data, u"2D Pie"_s));
    ASSERT_EQ(found.size(), 3);
    for (const auto& label : found) {
        EXPECT_TRUE(label.endsWith(u": 62599374 (25.0%)"_s) || label.endsWith(u": 125198748 (50.0%)"_s))
            << label.toStdString();
        EXPECT_TRUE(label.contains(u'…')) << label.toStdString();
    }
}

TEST_F(ChartTest, WithoutFiguresEveryStyleSaysSo)
{
    for (const auto& style : chart_styles()) {
        const auto name = QString::fromUtf8(style.name);
        EXPECT_TRUE(texts(draw({}, name)).contains(empty_words)) << style.name;
        EXPECT_TRUE(texts(draw({.title = {}, .categories = {u"May"_s}, .series = {series({}, {{}})}}, name))
                        .contains(empty_words))
            << style.name;
        EXPECT_FALSE(texts(draw(made(1, 1, 90), name)).contains(empty_words)) << style.name;
    }
}

struct Amounts
{
    const char* name;
    int series, categories;
    double middle;
};

class ChartRoomTest : public ChartTest, public ::testing::WithParamInterface<Amounts>
{
};

TEST_P(ChartRoomTest, EverythingStaysInItsPlaceAndNoTextsMeet)
{
    const auto& amounts = GetParam();
    const auto data = made(amounts.series, amounts.categories, amounts.middle);
    for (const auto& style : chart_styles()) {
        const auto drawing = draw(data, QString::fromUtf8(style.name));
        for (const auto& item : drawing.items)
            ASSERT_TRUE(QRectF({}, size).adjusted(-1, -1, 1, 1).contains(bounds_of(item).adjusted(0, 0, 1e-9, 1e-9)))
                << style.name;
        const auto written = all<TextItem>(drawing);
        for (std::size_t one = 0; one < written.size(); ++one) {
            for (std::size_t other = 0; other < one; ++other)
                ASSERT_FALSE(outline_of(written[one]).intersects(outline_of(written[other])))
                    << style.name << ": " << written[one].text.toStdString() << ", "
                    << written[other].text.toStdString();
        }
    }
}

INSTANTIATE_TEST_SUITE_P(Amounts, ChartRoomTest,
                         ::testing::Values(Amounts{"one_value", 1, 1, 60}, Amounts{"a_year", 3, 12, 60},
                                           Amounts{"variances", 2, 12, 0}, Amounts{"nine_series", 9, 12, 60},
                                           Amounts{"two_years_of_weeks", 2, 120, 60},
                                           Amounts{"two_hundred", 1, 200, -40}, Amounts{"large", 2, 52, 99949},
                                           Amounts{"many_series", 200, 3, 10}),
                         [](const auto& test) { return std::string(test.param.name); });

} // namespace kindrel::pages
