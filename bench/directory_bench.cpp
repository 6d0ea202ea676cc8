// Directory 1 of a whole church, from the database to the PDF, against a bare painter that draws the same texts and
// lines from memory.
#include "output/catalogue.h"

#include "core/schema.h"
#include "core/sqlite_session.h"
#include "core/system_workstation.h"
#include "pages/pdf.h"
#include "people/family_store.h"
#include "sample/church.h"

#include <QFile>
#include <QGuiApplication>
#include <QPageLayout>
#include <QPainter>
#include <QPdfWriter>
#include <QTemporaryDir>

#include <algorithm>
#include <chrono>
#include <cstdio>

using namespace Qt::StringLiterals;
using namespace kindrel;

namespace {

using Stopwatch = std::chrono::steady_clock;

constexpr int usual_families = 20'000;
constexpr int rounds = 3;

double seconds_since(Stopwatch::time_point start)
{
    return std::chrono::duration<double>(Stopwatch::now() - start).count();
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

/// Nobody is asked anything; what is told stands on standard error.
class SilentDialogue : public core::Dialogue
{
public:
    void show(const core::Message& message) override { std::fprintf(stderr, "%s\n", qUtf8Printable(message.text)); }
    bool confirm(const core::Message&, core::Answer safe) override { return safe == core::Answer::yes; }
    std::optional<bool> confirm_or_cancel(const core::Message&) override { return {}; }
    std::optional<QString> ask_text(const core::Message&, bool) override { return {}; }
    std::optional<int> choose(const core::Message&, const QStringList&) override { return {}; }
    std::optional<QString> choose_file(const core::FileQuestion&) override { return {}; }
    void play(const QString&) override {}
};

/// A church of its own, every family of it on the working list.
struct Church
{
    explicit Church(int families)
        : office{.paths = core::Paths(folder.path(), folder.path(), folder.path(), core::Mode::normal, 1),
                 .workstation = workstation,
                 .dialogue = dialogue,
                 .clock = clock}
    {
        office.session = core::create_sqlite(folder.filePath(u"KR10_records.kdl"_s));
        core::create_schema(*office.session);
        sample::fill_church(*office.session, {.families = families, .seed = 1, .today = clock.today()}, {}, {});
        office.church_name = u"A Church"_s;
        office.settings = core::read_settings(*office.session);
        office.rights = core::Rights::all();
        auto rows = office.session->select(
            u"SELECT p.[person_id],s.[Surname_ID] FROM [tbl_surname] s INNER JOIN [tbl_people] p "
            "ON p.[Surname_ID]=s.[Surname_ID] ORDER BY s.[sort_key],s.[Surname_ID],p.[position];"_s);
        for (const core::Row& row : rows)
            list.members.push_back({row.integer(core::Column{0}), row.integer(core::Column{1})});
        list.criteria = u"All Families"_s;
    }

    QTemporaryDir folder;
    core::SystemWorkstation workstation;
    SilentDialogue dialogue;
    core::SystemClock clock;
    core::Office office;
    people::WorkingList list;
};

/// Seconds from the start.
struct Times
{
    double first_page = 0, last_page = 0, pdf = 0;
};

Times write_directory(Church& church, const QString& file, std::vector<pages::Page>* keep)
{
    Times times;
    core::SilentProgress progress;
    const auto start = Stopwatch::now();
    pages::PageSpool spool;
    spool.on_page([&](int number) {
        if (number == 1)
            times.first_page = seconds_since(start);
    });
    const auto& report = *output::find_report(u"k10");
    if (!output::run_report(report, {church.office, church.list}, progress, spool))
        return {};
    times.last_page = seconds_since(start);
    if (!pages::write_pdf(spool, file))
        return {};
    times.pdf = seconds_since(start);
    for (int number = 1; keep && number <= spool.page_count(); ++number)
        keep->push_back(spool.page(number));
    return times;
}

/// The families as output reads them, without a page.
double read_families(Church& church)
{
    const auto start = Stopwatch::now();
    const auto keys = church.list.families();
    constexpr std::size_t at_once = 500;
    for (std::size_t first = 0; first < keys.size(); first += at_once) {
        const auto count = std::min(at_once, keys.size() - first);
        static_cast<void>(people::load_families(*church.office.session, std::span(keys).subspan(first, count),
                                                people::Part::address));
    }
    return seconds_since(start);
}

/// What any program must do to draw these pages: each text at its place in its font, each line.
double draw_bare(const std::vector<pages::Page>& pages, const QString& file)
{
    const auto start = Stopwatch::now();
    QPdfWriter writer(file);
    writer.setPageLayout(QPageLayout(QPageSize(QPageSize::A4), QPageLayout::Portrait, {}));
    const auto unit = writer.resolution() / 72.0;
    QPainter painter(&writer);
    for (const auto& page : pages) {
        if (page.number > 1)
            writer.newPage();
        for (const auto& item : page.items) {
            if (const auto* text = std::get_if<pages::TextItem>(&item)) {
                QFont font(text->style.family);
                font.setPointSizeF(text->style.size);
                font.setBold(text->style.bold);
                painter.setFont(font);
                painter.setPen(QColor::fromRgba(text->style.colour));
                painter.drawText(text->at * unit, text->text);
            } else if (const auto* line = std::get_if<pages::LineItem>(&item)) {
                painter.drawLine(line->from * unit, line->to * unit);
            } else if (const auto* rects = std::get_if<pages::RectsItem>(&item)) {
                for (const auto& rect : rects->rects)
                    painter.drawRect(QRectF(rect.topLeft() * unit, rect.size() * unit));
            }
        }
    }
    painter.end();
    return seconds_since(start);
}

} // namespace

int main(int argc, char** argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QGuiApplication application(argc, argv);
    const int families = argc > 1 ? QByteArray(argv[1]).toInt() : usual_families;
    Church church(families);
    const auto before = peak_megabytes();
    const auto target = church.folder.filePath(u"directory.pdf"_s);

    auto best = write_directory(church, target, nullptr);
    const auto first_page = best.first_page;
    const auto peak = peak_megabytes();
    std::vector<pages::Page> pages;
    auto bare = 0.0;
    auto reading = 0.0;
    for (int round = 0; round < rounds; ++round) {
        const auto next = write_directory(church, target, round == 0 ? &pages : nullptr);
        best = next.pdf < best.pdf ? next : best;
        const auto drawn = draw_bare(pages, church.folder.filePath(u"bare.pdf"_s));
        bare = round == 0 ? drawn : std::min(bare, drawn);
        const auto read = read_families(church);
        reading = round == 0 ? read : std::min(reading, read);
    }
    std::printf("%d families, %zu pages\n", families, pages.size());
    std::printf("first page           %8.3f s\n", first_page);
    std::printf("reading the families %8.3f s\n", reading);
    std::printf("all pages            %8.3f s\n", best.last_page);
    std::printf("PDF written          %8.3f s\n", best.pdf);
    std::printf("bare painter         %8.3f s\n", bare);
    std::printf("ratio                %8.2f\n", best.pdf / bare);
    std::printf("peak memory          %8.1f MB (%.1f MB before the first run)\n", peak, before);
}
