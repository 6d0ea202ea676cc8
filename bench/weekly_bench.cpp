// Weekly figures of 200 categories: entering and saving a date against the bare statements through SQLite's C
// interface, and reports over 12 years of weeks against the bare selection and painter, in the same run.

#include "bare_painter.h"
#include "bare_sqlite.h"
#include "measure.h"
#include "quiet_dialogue.h"

#include "core/schema.h"
#include "core/sqlite_session.h"
#include "core/system_workstation.h"
#include "pages/pdf.h"
#include "registers/weekly_register.h"
#include "registers/weekly_reports.h"

#include <QGuiApplication>
#include <QTemporaryDir>

#include <numeric>

using namespace kindrel;
using namespace kindrel::bench;
using namespace Qt::StringLiterals;

namespace {

constexpr int categories = 200;
constexpr int years = 12;
constexpr int first_year = 2015;
constexpr int rounds = 9;
constexpr double goal = 2;

/// A weekly project with 100 categories of each kind and a figure for each in every week of twelve years.
struct Church
{
    Church()
        : office{.paths = core::Paths(folder.path(), folder.path(), folder.path(), core::Mode::normal, 1),
                 .session = core::create_sqlite(file()),
                 .rights = core::Rights::all(),
                 .workstation = workstation,
                 .dialogue = dialogue,
                 .clock = clock}
    {
        core::create_schema(*office.session);
        core::Transaction transaction(*office.session);
        office.session->execute(
            u"INSERT INTO [tbl_weekly_project] ([weekly_project_id],[weekly_project],[position]) VALUES (1,?,1);"_s,
            u"Sundays"_s);
        fill(u"tbl_weekly_group"_s, {u"group_id"_s, u"group"_s, u"position"_s, u"group_type"_s, u"weekly_project_id"_s},
             category_rows());
        fill_dates();
        transaction.commit();
    }

    [[nodiscard]] QString file() const { return folder.filePath(u"KR10_records.kdl"_s); }

    QTemporaryDir folder;
    core::SystemWorkstation workstation;
    QuietDialogue dialogue;
    core::SystemClock clock;
    core::Office office;
    int dates = 0;

private:
    using Rows = std::vector<std::vector<core::Value>>;

    void fill(const QString& table, const QStringList& fields, const Rows& rows)
    {
        office.session->insert(table, fields, rows);
    }
    [[nodiscard]] static Rows category_rows()
    {
        Rows rows;
        for (qint64 key = 1; key <= categories; ++key)
            rows.push_back({key, u"Category %1"_s.arg(key), (key + 1) / 2, key % 2 ? qint64(1) : qint64(2), qint64(1)});
        return rows;
    }
    void fill_dates()
    {
        Rows days, figures;
        for (QDate day(first_year, 1, 4); day.year() < first_year + years; day = day.addDays(7)) {
            const qint64 date = ++dates;
            days.push_back({date, day.toString(Qt::ISODate), qint64(1)});
            for (qint64 key = 1; key <= categories; ++key)
                figures.push_back({date, key, (100 + (date * key) % 400) * 10000});
        }
        fill(u"tbl_weekly_date"_s, {u"weekly_date_id"_s, u"weekly_date"_s, u"weekly_project_id"_s}, days);
        fill(u"tbl_weekly_amount"_s, {u"date_id"_s, u"group_id"_s, u"amount"_s}, figures);
        fill(u"tbl_id_weekly_date"_s, {u"id_found"_s}, {{qint64(dates)}});
    }
};

/// A new date with all its figures, typed, saved and left.
void enter_date(Church& church, int round)
{
    registers::WeeklyRegister weekly(church.office);
    if (!weekly.enter() || !weekly.add(core::Date::from(QDate(2030, 1, 6).addDays(7 * round))))
        throw std::runtime_error("no date");
    for (int row = 0; row < categories; ++row) {
        if (!weekly.enter_figure(row, QString::number(100 + row)))
            throw std::runtime_error("no figure");
    }
    if (!weekly.save() || !weekly.leave())
        throw std::runtime_error("not saved");
}

/// The same with nothing around the statements: categories and dates read, lock taken, date added, figures of the date
/// before read, figures written, lock given back.
class BareEntry
{
public:
    explicit BareEntry(const BareDatabase& database)
        : m_database(database),
          m_groups(database.get(), "SELECT * FROM qry_weekly_load_groups WHERE weekly_project_id=1"),
          m_dates(database.get(), "SELECT * FROM Qry_weekly_load_dates WHERE weekly_project_id=1"),
          m_lock(database.get(), "INSERT INTO tbl_weekly_locked (weekly_locked) VALUES (1)"),
          m_unlock(database.get(), "DELETE FROM tbl_weekly_locked WHERE weekly_locked=1"),
          m_date(database.get(), "INSERT INTO tbl_weekly_date (weekly_date_id,weekly_date,weekly_project_id) "
                                 "VALUES (?,?,1)"),
          m_last(database.get(), "SELECT group_id,amount FROM tbl_weekly_amount WHERE date_id=?"),
          m_figure(database.get(), "INSERT INTO tbl_weekly_amount (date_id,group_id,amount) VALUES (?,?,?)")
    {
    }

    void run(int round) const
    {
        std::vector<std::string> cells;
        const int date = 1'000'000 + round;
        const auto day = QDate(2040, 1, 1).addDays(7 * round).toString(Qt::ISODate).toStdString();
        m_groups.read(cells);
        m_dates.read(cells);
        in_transaction([&] { m_lock.run(); });
        in_transaction([&] {
            sqlite3_bind_int(m_date.get(), 1, date);
            sqlite3_bind_text(m_date.get(), 2, day.c_str(), -1, SQLITE_TRANSIENT);
            m_date.run();
        });
        sqlite3_bind_int(m_last.get(), 1, date - 1);
        m_last.read(cells);
        in_transaction([&] {
            for (int key = 1; key <= categories; ++key) {
                sqlite3_bind_int(m_figure.get(), 1, date);
                sqlite3_bind_int(m_figure.get(), 2, key);
                sqlite3_bind_int64(m_figure.get(), 3, (100 + key) * 10000LL);
                m_figure.run();
            }
        });
        in_transaction([&] { m_unlock.run(); });
    }

private:
    void in_transaction(const Work& work) const
    {
        m_database.run("BEGIN IMMEDIATE");
        work();
        m_database.run("COMMIT");
    }

    const BareDatabase& m_database;
    BareStatement m_groups, m_dates, m_lock, m_unlock, m_date, m_last, m_figure;
};

void measure_entry(Church& church, const BareDatabase& database)
{
    const BareEntry bare(database);
    int ours_round = 0, bare_round = 0;
    print("entering and saving a date", categories,
          compare([&] { enter_date(church, ++ours_round); }, [&] { bare.run(++bare_round); }, rounds), goal);
}

registers::WeeklyReportRequest request_of(const registers::WeeklyReport& report)
{
    registers::WeeklyReportRequest request{.project = 1, .report = &report};
    request.categories.resize(std::size_t(std::min(categories, report.most_categories)));
    std::iota(request.categories.begin(), request.categories.end(), 1);
    request.period.kind = report.period == registers::ReportPeriod::years      ? registers::PeriodKind::year_span
                          : report.period == registers::ReportPeriod::one_year ? registers::PeriodKind::calendar_year
                                                                               : registers::PeriodKind::date_range;
    request.period.year = QString::number(first_year);
    request.period.to_year = QString::number(first_year + years - 1);
    request.period.from = core::Date{first_year, 1, 1};
    request.period.to = core::Date{first_year + years - 1, 12, 31};
    if (report.charts == registers::ReportCharts::required)
        request.chart = pages::chart_styles().data();
    return request;
}

/// The figures of the period through the stored query, copied out, and the pages' items drawn.
void measure_report(Church& church, const BareDatabase& database, const registers::WeeklyReport& report)
{
    const auto request = request_of(report);
    const auto target = church.folder.filePath(u"report.pdf"_s);
    std::vector<pages::Page> pages;
    const auto ours = [&] {
        core::SilentProgress progress;
        pages::PageSpool spool;
        registers::ReportCheck check{church.office.dialogue};
        const auto plan = registers::plan_weekly_report(church.office, request, check);
        if (!plan || !registers::write_weekly_report(church.office, *plan, pages::Paper::a4, progress, spool) ||
            !pages::write_pdf(spool, target))
            throw std::runtime_error(report.name);
        pages.clear();
        for (int number = 1; number <= spool.page_count(); ++number)
            pages.push_back(spool.page(number));
    };
    ours();
    const auto last_year = report.period == registers::ReportPeriod::one_year ? first_year : first_year + years - 1;
    const BareStatement figures(
        database.get(), "SELECT weekly_date,group_id,amount FROM Qry_weekly_output_anlaysis WHERE weekly_project_id=1 "
                        "AND weekly_date>='" +
                            std::to_string(first_year) + "-01-01' AND weekly_date<='" + std::to_string(last_year) +
                            "-12-31' AND group_id<=" + std::to_string(request.categories.size()));
    const auto bare = [&] {
        std::vector<std::string> cells;
        figures.read(cells);
        draw_bare(pages, church.folder.filePath(u"bare.pdf"_s));
    };
    print(report.name, int(request.categories.size()), compare(ours, bare, 3), goal);
}

} // namespace

int main(int argc, char** argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QGuiApplication application(argc, argv);
    Church church;
    const BareDatabase database(church.file().toStdString());
    std::printf("%d dates of %d categories\n\n", church.dates, categories);
    std::printf("| work                               | categ. |   ours ms |   bare ms | ratio | goal |\n");
    measure_entry(church, database);
    for (const auto& report : registers::weekly_reports())
        measure_report(church, database, report);
}
