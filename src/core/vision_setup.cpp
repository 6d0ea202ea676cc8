#include "core/vision_setup.h"

#include "core/entry.h"
#include "core/open_church.h"

#include <algorithm>
#include <cmath>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr std::array fields{
    SettingField{u"vision", &Settings::vision},
    SettingField{u"church_vision", &Settings::church_vision},
    SettingField{u"Include_vision_reports", &Settings::Include_vision_reports},
    SettingField{u"vision_font", &Settings::vision_font},
    SettingField{u"vision_font_size", &Settings::vision_font_size},
    SettingField{u"vision_format", &Settings::vision_format},
    SettingField{u"vision_alignment", &Settings::vision_alignment},
    SettingField{u"vision_line", &Settings::vision_line},
    SettingField{u"vision_thick_line", &Settings::vision_thick_line},
    SettingField{u"footer_vision", &Settings::footer_vision},
    SettingField{u"footer_vision_line2", &Settings::footer_vision_line2},
    SettingField{u"include_vision_footer", &Settings::include_vision_footer},
    SettingField{u"footer_line", &Settings::footer_line},
};

/// How long a text may be.
struct LengthRule
{
    const char16_t* field;
    QString Settings::*text;
    int longest;
    const char16_t* refusal;
};

constexpr auto statement_too_long = u"The vision statement is too long: there is room for %1 characters.";
constexpr auto line_too_long = u"The line at the foot of reports is too long: there is room for %1 characters.";
constexpr std::array lengths{
    LengthRule{u"vision", &Settings::vision, longest_vision, statement_too_long},
    LengthRule{u"church_vision", &Settings::church_vision, longest_vision, statement_too_long},
    LengthRule{u"footer_vision", &Settings::footer_vision, longest_footer_line, line_too_long},
    LengthRule{u"footer_vision_line2", &Settings::footer_vision_line2, longest_footer_line, line_too_long},
};

const QString size_refused = u"Please choose letters from %1 to %2 points high."_s;
const QString head_too_high = u"The vision statement would take more than a third of every %1 of a report."_s;
const QString foot_too_high = u"The lines at the foot would take more than a sixth of every %1 of a report."_s;
const QString make_room = u"Please shorten the text or choose smaller letters."_s;

/// In points, what both A4 and Letter have of a page that lies this way.
struct PaperArea
{
    const char16_t* page;
    double line_width, height;
};
constexpr std::array papers{
    PaperArea{u"page", 511, 792},
    PaperArea{u"landscape page", 708, 595},
};
constexpr double head_share = 1.0 / 3;
constexpr double foot_share = 1.0 / 6;

/// Without a size of its own the statement takes that of the report, which is hardly ever larger.
constexpr int letters_of_reports = 11;

/// An estimate that errs to the large side: there is nothing here to measure letters with.
double height_of(const QString& text, int chosen_letters, double line_width)
{
    const int letters = chosen_letters > 0 ? chosen_letters : letters_of_reports;
    const double across = letters * 0.55, down = letters * 1.25;
    double height = 0;
    for (const auto& line : text.split(u'\n'))
        height += down * std::max(1.0, std::ceil(double(line.size()) * across / line_width));
    return height;
}

/// The first way a page can lie on which the text would take more than its share; null when there is none.
const PaperArea* too_small_for(const QString& text, int letters, double share)
{
    const auto small = std::ranges::find_if(papers, [&](const PaperArea& paper) {
        return height_of(text, letters, paper.line_width) > paper.height * share;
    });
    return small == papers.end() ? nullptr : &*small;
}

const QString& head_text(const Settings& settings)
{
    return settings.church_vision.isEmpty() ? settings.vision : settings.church_vision;
}

} // namespace

VisionSetup::VisionSetup(Office& office) : m_office(&office), m_draft(*office.session, fields) {}

std::optional<VisionSetup> VisionSetup::open(Office& office)
{
    if (!permitted(office, Area::vision_setup))
        return std::nullopt;
    return VisionSetup(office);
}

bool VisionSetup::accepted()
{
    const Settings& wanted = m_draft.edited;
    const auto refuse = [this](const char16_t* field, const Message& message) {
        m_faulty = QString::fromUtf16(field);
        m_office->dialogue.show(message);
        return false;
    };
    for (const auto& rule : lengths)
        if (m_draft.altered(rule.field) && (wanted.*rule.text).size() > rule.longest)
            return refuse(rule.field, {QString::fromUtf16(rule.refusal).arg(rule.longest)});
    if (m_draft.altered(u"vision_font_size") &&
        (wanted.vision_font_size < smallest_vision_letters || wanted.vision_font_size > largest_vision_letters))
        return refuse(u"vision_font_size", {size_refused.arg(smallest_vision_letters).arg(largest_vision_letters)});
    const int letters = wanted.vision_font_size;
    if (wanted.Include_vision_reports)
        if (const auto* paper = too_small_for(head_text(wanted), letters, head_share))
            return refuse(wanted.church_vision.isEmpty() ? u"vision" : u"church_vision",
                          {head_too_high.arg(QStringView(paper->page)), make_room});
    const QString foot = wanted.footer_vision + u'\n' + wanted.footer_vision_line2;
    if (wanted.include_vision_footer)
        if (const auto* paper = too_small_for(foot, letters, foot_share))
            return refuse(u"footer_vision", {foot_too_high.arg(QStringView(paper->page)), make_room});
    m_faulty.clear();
    return true;
}

bool VisionSetup::save()
{
    if (!accepted() || !network_guard(*m_office))
        return false;
    Transaction transaction(*m_office->session);
    m_draft.write(*m_office->session);
    transaction.commit();
    m_draft.follow(*m_office->session, m_office->settings);
    return true;
}

} // namespace kindrel::core
