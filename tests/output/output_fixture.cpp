#include "output/output_fixture.h"

#include "pages/pdf.h"
#include "people/family_store.h"
#include "people/fields.h"

#include <QProcess>

#include <cmath>

namespace kindrel::test {

using namespace Qt::StringLiterals;

namespace {

bool follows(const pages::TextItem& text, const pages::TextItem& before)
{
    constexpr qreal slack = 0.5;
    return text.at.y() == before.at.y() && std::abs(text.at.x() - before.at.x() - before.width) < slack;
}

QStringList lines_of(const pages::Page& page, int total)
{
    QStringList lines;
    const pages::TextItem* before = nullptr;
    for (const auto& item : page.items) {
        const auto* text = std::get_if<pages::TextItem>(&item);
        if (!text)
            continue;
        const auto words = QString(text->text).replace(pages::page_total_mark, QString::number(total));
        if (before && follows(*text, *before))
            lines.back() += words;
        else
            lines += words;
        before = text;
    }
    return lines;
}

/// The words that full_family() gives a record's texts.
template <class Record>
QStringList texts_of_record(const Record& record, std::span<const people::Field<Record>> fields)
{
    QStringList words;
    for (const auto& field : fields) {
        if (const auto* text = std::get_if<QString Record::*>(&field.member))
            words += record.**text;
    }
    return words;
}

} // namespace

QStringList hidden_words(const people::FamilyFile& family)
{
    auto words = texts_of_record(family.address, people::address_fields());
    words += {u"suburb 1"_s, u"suburb 2"_s, u"3999"_s, u"3000"_s, u"1977"_s};
    for (const auto& person : family.people) {
        words += texts_of_record(person, people::detail_fields());
        words += person.preferred_name;
    }
    return words;
}

ReportTest::ReportTest()
    : office{.paths = core::Paths(church.folder() + u'/', church.folder() + u'/', church.folder() + u'/',
                                  core::Mode::normal, 1),
             .workstation = workstation,
             .dialogue = dialogue,
             .clock = clock}
{
    add_setup_items(church.session());
    office.church_name = u"St Aidan's"_s;
    office.session = church.another();
    office.settings = core::read_settings(*office.session);
    office.rights = core::Rights::all();
}

void ReportTest::add(const std::vector<people::FamilyFile>& families)
{
    for (const auto& family : families) {
        const auto stored = people::save_family(*office.session, family, clock.today());
        for (const auto& person : stored.people)
            list.members.push_back({person.person_id, stored.family.Surname_ID});
    }
}

bool ReportTest::run(pages::PageSpool& spool, pages::Paper paper)
{
    options.paper = paper;
    return output::run_report(report, {office, list, options}, progress, spool);
}

std::vector<QStringList> ReportTest::pages()
{
    pages::PageSpool spool;
    EXPECT_TRUE(run(spool));
    std::vector<QStringList> pages;
    for (int number = 1; number <= spool.page_count(); ++number)
        pages.push_back(lines_of(spool.page(number), spool.page_count()));
    return pages;
}

QStringList ReportTest::texts()
{
    QStringList all;
    for (const auto& page : pages())
        all += page;
    return all;
}

QString ReportTest::pdf_text(pages::Paper paper)
{
    pages::PageSpool spool;
    EXPECT_TRUE(run(spool, paper));
    EXPECT_TRUE(pages::write_pdf(spool, pdf_file()));
    return output_of(u"pdftotext"_s, {u"-enc"_s, u"UTF-8"_s, pdf_file(), u"-"_s}).simplified();
}

QString output_of(const QString& program, const QStringList& arguments)
{
    QProcess process;
    process.start(program, arguments);
    EXPECT_TRUE(process.waitForFinished()) << program.toStdString();
    return QString::fromUtf8(process.readAllStandardOutput());
}

} // namespace kindrel::test
