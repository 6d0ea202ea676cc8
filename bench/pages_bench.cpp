// A directory of N families through Flow into a PDF, against a bare painter that draws the same lines.
#include "pages/flow.h"
#include "pages/pdf.h"

#include <QFile>
#include <QGuiApplication>
#include <QPageLayout>
#include <QPainter>
#include <QPdfWriter>
#include <QTemporaryDir>

#include <algorithm>
#include <array>
#include <chrono>
#include <cstdio>

using namespace Qt::StringLiterals;
using namespace kindrel;

namespace {

struct Entry
{
    QString name, street, suburb, phone, email;
};

Entry entry(int i)
{
    static const std::array surnames{u"Abbott"_s,   u"Ávila"_s,   u"Naismith"_s,
                                     u"O'Connor"_s, u"Tavener"_s, u"van der Berg"_s};
    return {surnames[size_t(i) % surnames.size()] + u", John & Ann %1"_s.arg(i), u"%1 Avenue Road"_s.arg(i),
            u"Hightown NSW %1"_s.arg(2000 + i % 900), u"(02) %1"_s.arg(91000000 + i), u"family%1@example.org"_s.arg(i)};
}

using Clock = std::chrono::steady_clock;

double milliseconds_since(Clock::time_point start)
{
    return std::chrono::duration<double, std::milli>(Clock::now() - start).count();
}

double peak_megabytes()
{
    QFile status(u"/proc/self/status"_s);
    if (!status.open(QIODevice::ReadOnly))
        return 0;
    for (const auto& line : status.readAll().split('\n')) {
        if (line.startsWith("VmHWM:"))
            return line.mid(6, line.indexOf("kB") - 6).trimmed().toDouble() / 1024;
    }
    return 0;
}

struct Times
{
    double first_page = 0, laid_out = 0, done = 0;
    int pages = 0;
};

void write_family(pages::Flow& flow, const Entry& family)
{
    const pages::Keep keep(flow);
    flow.line(family.name, flow.type().body.bolder());
    flow.line(family.street);
    flow.line(family.suburb);
    flow.caption(u"Family Ph: "_s, family.phone);
    flow.caption(u"Family Email: "_s, family.email);
    flow.space(6);
}

Times through_flow(int families, const QString& file)
{
    const auto start = Clock::now();
    Times times;
    pages::PageSpool spool;
    spool.on_page([&](int number) {
        if (number == 1)
            times.first_page = milliseconds_since(start);
    });
    pages::Flow flow(spool, {.margins = {42, 36, 42, 36}});
    flow.set_header([](pages::Writer& band, int) { band.line(u"Directory 1"_s, band.type().headings[0]); });
    flow.set_footer([](pages::Writer& band, int number) { band.line(u"Page: %1"_s.arg(number), band.type().small); });
    for (int i = 0; i < families; ++i)
        write_family(flow, entry(i));
    flow.finish();
    times.laid_out = milliseconds_since(start);
    if (!pages::write_pdf(spool, file))
        return {};
    times.done = milliseconds_since(start);
    times.pages = spool.page_count();
    return times;
}

/// What the flow would cost without layout, keeping together, spool and repeatable drawing.
class BarePainter
{
public:
    explicit BarePainter(const QString& file) : m_writer(file)
    {
        m_writer.setPageLayout(QPageLayout(QPageSize(QPageSize::A4), QPageLayout::Portrait, {}));
        m_unit = m_writer.resolution() / 72.0;
        m_bold.setBold(true);
        m_painter.begin(&m_writer);
        m_caption_width = QFontMetricsF(m_plain, &m_writer).horizontalAdvance(u"Family Email: "_s) / m_unit;
        begin_page();
    }
    void draw(const Entry& family)
    {
        if (m_y + 58 > 790) {
            m_writer.newPage();
            begin_page();
        }
        text(42, family.name, m_bold);
        m_y += 10.35;
        for (const auto& line : {family.street, family.suburb}) {
            text(42, line, m_plain);
            m_y += 10.35;
        }
        for (const auto& [caption, value] :
             {std::pair(u"Family Ph: "_s, family.phone), {u"Family Email: "_s, family.email}}) {
            text(42, caption, m_plain);
            text(42 + m_caption_width, value, m_plain);
            m_y += 10.35;
        }
        m_y += 6;
    }

private:
    void begin_page()
    {
        m_y = 44;
        text(42, u"Directory 1"_s, m_bold);
        m_y = 810;
        text(42, u"Page: %1"_s.arg(++m_page), m_plain);
        m_y = 70;
    }
    void text(double x, const QString& words, const QFont& font)
    {
        m_painter.setFont(font);
        m_painter.drawText(QPointF(x * m_unit, m_y * m_unit), words);
    }

    QPdfWriter m_writer;
    QPainter m_painter;
    QFont m_plain{u"Liberation Sans"_s, 9};
    QFont m_bold{u"Liberation Sans"_s, 9};
    double m_unit = 1, m_caption_width = 0, m_y = 0;
    int m_page = 0;
};

double bare(int families, const QString& file)
{
    const auto start = Clock::now();
    {
        BarePainter painter(file);
        for (int i = 0; i < families; ++i)
            painter.draw(entry(i));
    }
    return milliseconds_since(start);
}

} // namespace

int main(int argc, char** argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QGuiApplication application(argc, argv);
    const QTemporaryDir folder;
    std::printf("%9s %7s %12s %10s %10s %10s %7s %9s\n", "families", "pages", "first page", "laid out", "PDF",
                "bare PDF", "ratio", "peak MB");
    for (const int count : {1000, 10000, 20000, 60000}) {
        auto flow = through_flow(count, folder.filePath(u"flow.pdf"_s));
        const auto peak = peak_megabytes(), first_page = flow.first_page;
        auto plain = bare(count, folder.filePath(u"bare.pdf"_s));
        for (int again = 0; again < 2; ++again) {
            const auto next = through_flow(count, folder.filePath(u"flow.pdf"_s));
            flow = next.done < flow.done ? next : flow;
            plain = std::min(plain, bare(count, folder.filePath(u"bare.pdf"_s)));
        }
        std::printf("%9d %7d %9.1f ms %7.0f ms %7.0f ms %7.0f ms %7.2f %9.1f\n", count, flow.pages, first_page,
                    flow.laid_out, flow.done, plain, flow.done / plain, peak);
    }
}
