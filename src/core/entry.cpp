#include "core/entry.h"

#include "core/open_church.h"

#include <algorithm>
#include <ranges>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

// In all texts %1 stands for the product.

constexpr auto while_setting_up =
    u"To insure the integrity of your data files nobody is allowed into this area while another user is altering the "
    "lists that it works with. If you are permanently locked out use the '%1 Mender' program to unlock the area.";
constexpr auto visitation_alone =
    u"To insure the integrity of your data files only one user at a time is allowed to work on the Visitation notes. "
    "If you are permanently locked out use the '%1 Mender' program to unlock the area.";
constexpr auto one_in_setup =
    u"To protect the integrity of your data only one person is allowed into the setup area at a time. If you are "
    "permanently locked out of this area the '%1 Mender' program will unlock the setup areas.";
constexpr auto one_in_security =
    u"To protect the integrity of your data only one person is allowed into the Security area at a time. If you are "
    "permanently locked out of this area the '%1 Mender' program will unlock the area.";
constexpr auto roll_in_use =
    u"To protect the integrity of your data nobody is allowed to alter the Roll setup area while a user is working "
    "with Roll data. If you are permanently locked out of this area the '%1 Mender' program will remove all locks.";
constexpr auto finance_in_use =
    u"To protect the integrity of your data nobody is allowed to alter the Finance setup area while a user is working "
    "with Finance data. If you are permanently locked out of this area the '%1 Mender' program will remove all locks.";
constexpr auto weekly_in_use =
    u"To protect the integrity of your data nobody is allowed to alter the Weekly Statistics setup area while a user "
    "is working with Weekly Statistics data. If you are permanently locked out of this area the '%1 Mender' program "
    "will remove all locks.";
constexpr auto roster_in_use =
    u"To protect the integrity of your data nobody is allowed to alter the Roster setup area while a user is working "
    "with Roster data. If you are permanently locked out of this area the '%1 Mender' program will remove all locks.";
constexpr auto wardline_in_use =
    u"To protect the integrity of your data nobody is allowed to alter the Wardline setup area while a user is working "
    "with Wardline data. If you are permanently locked out of this area the '%1 Mender' program will remove all locks.";

/// A lock that keeps others out of an area. Without a code: any lock of the kind.
struct Obstacle
{
    LockKind kind;
    std::optional<AreaCode> code;
    const char16_t* sentence;
    const char16_t* explanation = u""; ///< Stands beneath the sentence, above who holds the lock.
};

constexpr Obstacle held_area(AreaCode code, const char16_t* sentence, const char16_t* explanation)
{
    return {LockKind::area, code, sentence, explanation};
}
constexpr Obstacle in_use(LockKind kind, const char16_t* sentence, const char16_t* explanation = u"")
{
    return {kind, std::nullopt, sentence, explanation};
}

constexpr Obstacle before_family_editor[]{
    held_area(AreaCode::setup, u"Unable to enter the family file editor as another user is in the setup area of %1",
              while_setting_up)};
constexpr Obstacle before_tagging[]{
    held_area(AreaCode::setup, u"Unable to enter the Tagging program as another user is in the setup area of %1",
              while_setting_up)};
constexpr Obstacle before_organiser[]{
    held_area(AreaCode::setup, u"Unable to enter the Organiser program, another user is in the setup area of %1",
              while_setting_up)};
constexpr auto roll_set_up = u"Unable to enter the Roll program as another user is in the setup area of %1";
constexpr Obstacle before_roll[]{held_area(AreaCode::setup, roll_set_up, while_setting_up),
                                 held_area(AreaCode::project_setup, roll_set_up, while_setting_up)};
constexpr auto finance_set_up = u"Unable to enter the Finance program as another user is in the setup area of %1";
constexpr Obstacle before_finance[]{held_area(AreaCode::setup, finance_set_up, while_setting_up),
                                    held_area(AreaCode::project_setup, finance_set_up, while_setting_up)};
constexpr auto weekly_set_up =
    u"Unable to enter the Weekly Statistics program as another user is in the setup area of %1";
constexpr Obstacle before_weekly[]{held_area(AreaCode::setup, weekly_set_up, while_setting_up),
                                   held_area(AreaCode::project_setup, weekly_set_up, while_setting_up)};
constexpr auto roster_set_up = u"Unable to enter the Roster program as another user is in the setup area of %1";
constexpr Obstacle before_roster[]{held_area(AreaCode::setup, roster_set_up, while_setting_up),
                                   held_area(AreaCode::roster_setup, roster_set_up, while_setting_up)};
constexpr auto wardline_set_up = u"Unable to enter the Wardline program as another user is in the setup area of %1";
constexpr Obstacle before_wardline[]{held_area(AreaCode::setup, wardline_set_up, while_setting_up),
                                     held_area(AreaCode::wardline_setup, wardline_set_up, while_setting_up)};
constexpr Obstacle before_visitation[]{held_area(
    AreaCode::visitation, u"Unable to enter the Visitation area as another user is working on the Visitation notes",
    visitation_alone)};

constexpr Obstacle before_family_setup[]{
    in_use(LockKind::family, u"Unable to enter the %1 setup area as another user is editing a family file."),
    in_use(LockKind::roll, u"Unable to enter the %1 setup area as another user is using the Roll Program."),
    in_use(LockKind::finance, u"Unable to enter the %1 setup area as another user is using the Finance Program."),
    in_use(LockKind::weekly,
           u"Unable to enter the %1 setup area as another user is using the Weekly Statisitcs Program."),
    held_area(AreaCode::setup, u"Unable to enter the setup area as another user is presently in the setup area.",
              one_in_setup)};
constexpr Obstacle before_project_setup[]{
    in_use(LockKind::roll,
           u"Unable to enter the Roll setup area as another user is currently working in the Roll program.",
           roll_in_use),
    in_use(LockKind::finance,
           u"Unable to enter the Finance setup area as another user is currently working in the Finance program.",
           finance_in_use),
    in_use(LockKind::weekly,
           u"Unable to enter the Weekly Statistics setup area as another user is currently working in the Weekly "
           "Statistics program.",
           weekly_in_use),
    held_area(AreaCode::project_setup,
              u"Unable to enter the Roll/Finance/Weekly setup area as another user is presently in the setup area.",
              one_in_setup)};
constexpr auto roster_setup_held =
    u"Unable to enter the Roster setup area as another user is presently in the setup area.";
constexpr Obstacle before_roster_setup[]{
    in_use(LockKind::roster,
           u"Unable to enter the Roster setup area as another user is currently working in the Roster program.",
           roster_in_use),
    held_area(AreaCode::setup, roster_setup_held, one_in_setup),
    held_area(AreaCode::roster_setup, roster_setup_held, one_in_setup)};
constexpr Obstacle before_wardline_setup[]{
    in_use(LockKind::wardline,
           u"Unable to enter the Wardline setup area as another user is currently working in the Wardline program.",
           wardline_in_use),
    held_area(AreaCode::wardline_setup,
              u"Unable to enter the Wardline setup area as another user is presently in the setup area.",
              one_in_setup)};
constexpr Obstacle before_security[]{held_area(
    AreaCode::security, u"Unable to enter the Security area as another user is presently in the Security area.",
    one_in_security)};

/// What an area takes for as long as somebody is in it.
enum class Takes {
    nothing,
    area_code, ///< The area is for one person at a time.
    people     ///< A place among those who work with people's files.
};
struct OwnLock
{
    Takes takes = Takes::nothing;
    AreaCode code = {};
    LockKind kind = LockKind::area;
};
constexpr OwnLock alone(AreaCode code)
{
    return {Takes::area_code, code};
}
constexpr OwnLock people(LockKind kind)
{
    return {Takes::people, {}, kind};
}

/// The answer to a person who works on booked-out data.
struct RemoteRefusal
{
    const char16_t* sentence = nullptr; ///< Null: the area is open.
    const char16_t* explanation = u"";
};
constexpr auto remote_access =
    u"When in this mode you can only edit the family files that are booked out. All family files can be viewed, "
    "reports can be run, analysis can be conducted on all the data.";
constexpr RemoteRefusal no_wardline{u"The Wardline area is not available when in Booked Out Mode"};
constexpr RemoteRefusal no_altering{u"Unable to alter data while in Remote Access Mode", remote_access};
constexpr RemoteRefusal no_function{u"Unable to perform this function as %1 is in Remote Access Mode", remote_access};

/// Any one of the rights opens the area.
struct Rule
{
    AreaId area;
    std::array<std::optional<Area>, 3> rights;
    RemoteRefusal remote = {};
    std::span<const Obstacle> obstacles = {};
    OwnLock own = {};
};

constexpr Rule rules[]{
    {AreaId::family_editor,
     {Area::search_for_family, Area::add_family, Area::read_only_family_data},
     {},
     before_family_editor},
    {AreaId::search, {Area::search_for_family}},
    {AreaId::tagging, {Area::tagging}, {}, before_tagging},
    {AreaId::organiser, {Area::people_organiser}, {}, before_organiser},
    {AreaId::roll, {Area::roll}, {}, before_roll, people(LockKind::roll_area)},
    {AreaId::finance,
     {Area::full_financial, Area::pin_financial_only},
     {},
     before_finance,
     people(LockKind::finance_area)},
    {AreaId::weekly, {Area::weekly_statistics}, {}, before_weekly},
    {AreaId::roster, {Area::rosters}, {}, before_roster, people(LockKind::roster_area)},
    {AreaId::wardline, {Area::wardline}, no_wardline, before_wardline, people(LockKind::wardline_area)},
    {AreaId::visitation, {Area::visitation}, {}, before_visitation, alone(AreaCode::visitation)},
    {AreaId::reports, {Area::report_outputs}},
    {AreaId::data_analysis, {Area::data_analysis}},
    {AreaId::custom_letter, {Area::custom_letter}},
    {AreaId::email, {Area::create_and_send_emails}},
    {AreaId::export_text, {Area::export_text}},
    {AreaId::custom_report, {Area::custom_report}},
    {AreaId::fusions, {Area::filter_fusion_setup}},
    {AreaId::group_history, {Area::group_history_manager}},
    {AreaId::school_year, {Area::school_year_manager}, no_altering},
    {AreaId::file_clearance, {Area::file_clearance}, no_altering},
    {AreaId::family_setup, {Area::family_file_setup}, no_altering, before_family_setup, alone(AreaCode::setup)},
    {AreaId::project_setup, {Area::project_setup}, no_altering, before_project_setup, alone(AreaCode::project_setup)},
    {AreaId::roster_setup, {Area::roster_setup}, no_altering, before_roster_setup, alone(AreaCode::roster_setup)},
    {AreaId::wardline_setup,
     {Area::wardline_setup},
     no_wardline,
     before_wardline_setup,
     alone(AreaCode::wardline_setup)},
    {AreaId::global_data, {Area::global_data_setup}, no_altering},
    {AreaId::vision_setup, {Area::vision_setup}, no_altering},
    {AreaId::network_setup, {Area::network_setup}},
    {AreaId::security, {Area::security}, no_altering, before_security, alone(AreaCode::security)},
    {AreaId::backup, {Area::backup_data}},
    {AreaId::restore, {Area::restore_data}, no_function},
    {AreaId::book_in_out, {Area::book_in_out}, no_function},
};
static_assert(std::size(rules) == area_id_count);
static_assert(std::ranges::is_sorted(rules, {}, &Rule::area));

constexpr std::size_t most_holders_named = 5;
/// Between a refused take and the next look the lock may have been released again.
constexpr int looks = 3;

const Rule& rule_of(AreaId area)
{
    return rules[static_cast<std::size_t>(area)];
}

QString with_product(const char16_t* text)
{
    return QString::fromUtf16(text).replace(u"%1"_s, product.toString());
}

LockCheck check_of(const Obstacle& obstacle)
{
    return {obstacle.kind, obstacle.code ? std::optional<LockKey>(*obstacle.code) : std::nullopt};
}

/// The explanation, and beneath it who holds what.
QString told_beneath(const char16_t* explanation, const std::vector<HeldLock>& locks, DayOrder order)
{
    QStringList lines{with_product(explanation)};
    for (const HeldLock& lock : locks | std::views::take(most_holders_named))
        lines += held_line(lock, order);
    if (locks.size() > most_holders_named)
        lines += u"And %1 more."_s.arg(locks.size() - most_holders_named);
    lines.removeAll(QString());
    return lines.join(u'\n');
}

/// True when none of the obstacles is in the way; otherwise tells of the first.
bool way_is_free(const Office& office, Locks& locks, std::span<const Obstacle> obstacles)
{
    for (const Obstacle& obstacle : obstacles) {
        const auto held = locks.held(check_of(obstacle));
        if (held.empty())
            continue;
        office.dialogue.show({.text = with_product(obstacle.sentence),
                              .more = told_beneath(obstacle.explanation, held, office.day_order())});
        return false;
    }
    return true;
}

bool open_in_mode(const Office& office, const RemoteRefusal& refusal)
{
    if (office.mode != Mode::booked_out || !refusal.sentence)
        return true;
    office.dialogue.show({.text = with_product(refusal.sentence), .more = with_product(refusal.explanation)});
    return false;
}

Message missing_right(Area area)
{
    return {u"Your password does not give access to \"%1\""_s.arg(area_name(area))};
}

} // namespace

AreaEntry::AreaEntry(AreaEntry&& other) noexcept : m_area(other.m_area), m_taken(std::move(other.m_taken))
{
    other.m_taken.reset();
}

AreaEntry& AreaEntry::operator=(AreaEntry&& other) noexcept
{
    if (this == &other)
        return *this;
    leave();
    m_area = other.m_area;
    if (other.m_taken)
        m_taken.emplace(std::move(*other.m_taken));
    other.m_taken.reset();
    return *this;
}

AreaEntry::~AreaEntry()
{
    leave();
}

void AreaEntry::leave() noexcept
{
    if (m_taken)
        m_taken->locks.release(m_taken->kind, m_taken->key);
    m_taken.reset();
}

std::optional<AreaEntry> enter(Office& office, AreaId area)
{
    const Rule& rule = rule_of(area);
    if (!may_enter(office, area)) {
        office.dialogue.show(missing_right(*rule.rights.front()));
        return std::nullopt;
    }
    if (!open_in_mode(office, rule.remote) || !network_guard(office))
        return std::nullopt;
    AreaEntry entry(area);
    if (!office.shared())
        return entry;

    Locks locks(office);
    std::vector<LockCheck> unless;
    std::ranges::transform(rule.obstacles, std::back_inserter(unless), check_of);
    const LockKey key = rule.own.takes == Takes::people ? Locks::own_place() : LockKey(rule.own.code);
    for (int look = 0; look < looks && way_is_free(office, locks, rule.obstacles); ++look) {
        if (rule.own.takes == Takes::nothing)
            return entry;
        if (locks.take(rule.own.kind, key, unless)) {
            entry.m_taken.emplace(AreaEntry::Taken{locks, rule.own.kind, key});
            return entry;
        }
    }
    return std::nullopt;
}

bool may_enter(const Office& office, AreaId area)
{
    return std::ranges::any_of(rule_of(area).rights, [&](const auto& right) { return right && office.may(*right); });
}

bool permitted(const Office& office, Area area)
{
    if (office.may(area))
        return true;
    office.dialogue.show(missing_right(area));
    return false;
}

bool may_delete_people(Office& office)
{
    Locks locks(office);
    std::vector<HeldLock> at_work;
    for (const auto kind :
         {LockKind::roll_area, LockKind::finance_area, LockKind::roster_area, LockKind::wardline_area})
        std::ranges::move(locks.held({kind}), std::back_inserter(at_work));
    if (at_work.empty())
        return true;
    office.dialogue.show(
        {.text = u"Unable to delete people as currently another user has an area of the program active in which they "
                 "are working with peoples files."_s,
         .more = told_beneath(u"To protect the integrity of your data, %1 only allows people to be deleted when other "
                              "users are not working with people. If no user is on the system then you will need to "
                              "run the '%1 Mender' program to remove all locks.",
                              at_work, office.day_order())});
    return false;
}

} // namespace kindrel::core
