#include "output/custom/custom_layout_parser.h"

#include "core/files.h"
#include "output/custom/custom_fields.h"
#include "output/custom/custom_pages.h"

#include <QFileInfo>
#include <QStringDecoder>

#include <algorithm>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

// What an office can need, far below what a run can bear.
constexpr std::size_t most_elements = 1000;
constexpr double most_band_height = 150;
constexpr double least_column = 60;
constexpr double least_height = 200;

bool may_stand(FieldScope scope, LayoutPlace place)
{
    const bool person = place == LayoutPlace::person || place == LayoutPlace::giver;
    switch (scope) {
    case FieldScope::run:
        break;
    case FieldScope::group:
        return person || place == LayoutPlace::family || place == LayoutPlace::end_of_group;
    case FieldScope::totals:
        return place == LayoutPlace::end_of_group || place == LayoutPlace::end;
    case FieldScope::page:
        return place == LayoutPlace::page_header || place == LayoutPlace::page_footer;
    case FieldScope::family:
        return person || place == LayoutPlace::family;
    case FieldScope::person:
        return person;
    case FieldScope::receipt:
        return place == LayoutPlace::giver;
    }
    return true;
}

bool may_stand(LayoutPlace place, LayoutKind kind)
{
    switch (place) {
    case LayoutPlace::family:
        return kind == LayoutKind::families;
    case LayoutPlace::person:
        return kind != LayoutKind::receipts;
    case LayoutPlace::giver:
        return kind == LayoutKind::receipts;
    case LayoutPlace::end_of_group:
        return kind != LayoutKind::receipts;
    case LayoutPlace::page_header:
    case LayoutPlace::page_footer:
    case LayoutPlace::start:
    case LayoutPlace::end:
        break;
    }
    return true;
}

void open_section(LayoutStatement& statement, LayoutText& text, LayoutPlace place)
{
    text.place = place;
    note_once(statement, text, words_of(place));
    const auto kind = text.parsed.layout.kind;
    if (!may_stand(place, kind))
        statement.fault(u"a \"%1\" has no section \"%2\""_s.arg(words_of(kind), words_of(place)));
    else if (place == LayoutPlace::end_of_group && !text.parsed.layout.grouping)
        statement.fault(u"\"end of group\" needs a line \"group by\" above the first section"_s);
}

/// The line that says what the layout is. It changes what holds when nothing is said.
void set_kind(LayoutStatement& statement, LayoutText& text, LayoutKind kind)
{
    const auto& before = text.parsed.layout;
    const bool first = text.said.empty() && before.styles.empty() && before.table.columns.empty();
    if (!first) {
        statement.fault(u"\"%1\" belongs on the first line"_s.arg(words_of(kind)));
        return;
    }
    text.said.emplace_back(words_of(kind), statement.line());
    const auto notes = text.parsed.layout.notes;
    text.parsed.layout = empty_layout(kind);
    text.parsed.layout.notes = notes;
}

void refuse(LayoutStatement& statement, const LayoutText& text)
{
    const auto word = statement.word_here();
    if (word.isEmpty()) {
        statement.fault(u"a line begins with a word that tells what it is, such as \"line\" or \"title\""_s);
        return;
    }
    const auto words = statement.plain_words();
    const auto section = nearest_word(words, all_of(layout_place_words()) + all_of(layout_kind_words()));
    if (!section.isEmpty() && words.contains(u' ')) {
        statement.fault(u"there is no \"%1\"; did you mean \"%2\"?"_s.arg(words, section));
        return;
    }
    const auto known = (text.place ? element_words() : setting_words()) + QStringList{u"start"_s, u"end"_s};
    statement.fault(u"no line begins with \"%1\"%2"_s.arg(word, did_you_mean(word, known)));
}

void read_statement(LayoutStatement& statement, LayoutText& text)
{
    const auto words = statement.plain_words();
    if (const auto place = value_of(layout_place_words(), words))
        open_section(statement, text, *place);
    else if (const auto kind = value_of(layout_kind_words(), words))
        set_kind(statement, text, *kind);
    else if (read_setting(statement, text) || read_element(statement, text))
        statement.end();
    else
        refuse(statement, text);
}

void read_line(int number, QStringView line, LayoutText& text)
{
    line = line.trimmed();
    if (line.isEmpty())
        return;
    if (line.startsWith(u'#')) {
        const auto note = line.sliced(1).trimmed().toString();
        if (text.place)
            text.parsed.layout.section(*text.place).push_back({.kind = LayoutElement::Kind::note, .text = note});
        else
            text.parsed.layout.notes += note;
        return;
    }
    LayoutStatement statement(number, line, text.parsed.faults);
    // A line of nothing but unreadable marks has been told of.
    if (!statement.at_end())
        read_statement(statement, text);
}

double height_of(const LayoutElement& element, const CustomLooks& looks)
{
    constexpr double line_height = 1.2;
    if (element.kind != LayoutElement::Kind::line)
        return element.height;
    double size = looks.type().body.size;
    for (const auto& part : element.parts) {
        if (part.kind == LayoutPart::Kind::style)
            size = std::max(size, looks.style(part.text).size);
    }
    return size * line_height;
}

/// What headers and footers leave of the pages.
void check_room(LayoutText& text)
{
    auto& [layout, faults] = text.parsed;
    const CustomLooks looks(layout, 100);
    const auto room = column_room(layout);
    double bands = 0;
    int line = 0;
    for (const auto place : {LayoutPlace::page_header, LayoutPlace::page_footer}) {
        const auto said = std::ranges::find(text.said, words_of(place), &std::pair<QString, int>::first);
        if (said == text.said.end())
            continue;
        double height = 0;
        for (const auto& element : layout.section(place))
            height += height_of(element, looks);
        if (height > most_band_height)
            faults.push_back(
                {said->second, u"the section \"%1\" is too high: it leaves no room on the pages"_s.arg(said->first)});
        line = std::max(line, said->second);
        bands += std::min(height, most_band_height);
    }
    if (room.width() < least_column || room.height() < least_height)
        faults.push_back({0, u"The margins and columns leave no room to print in"_s});
    else if (room.height() - bands < least_height)
        faults.push_back({line, u"page header and page footer leave no room between them on the pages"_s});
}

/// What only the whole shows.
void check_whole(LayoutText& text)
{
    const auto& layout = text.parsed.layout;
    auto& faults = text.parsed.faults;
    const auto tell = [&](const QString& fault) {
        faults.push_back({0, fault});
    };
    std::size_t elements = 0;
    for (const auto& section : layout.sections)
        elements += section.size();
    if (elements > most_elements)
        tell(u"The sections of a layout can hold %1 lines together, and these hold %2"_s.arg(most_elements)
                 .arg(elements));
    const auto prints = [&](LayoutPlace place) {
        return !layout.section(place).empty();
    };
    if (faults.empty() && !prints(LayoutPlace::family) && !prints(LayoutPlace::person) && !prints(LayoutPlace::giver))
        tell(u"The layout prints nobody: it needs a section \"%1\" with lines in it"_s.arg(
            words_of(layout.kind == LayoutKind::families ? LayoutPlace::family
                     : layout.kind == LayoutKind::people ? LayoutPlace::person
                                                         : LayoutPlace::giver)));
    check_room(text);
}

ParsedLayout refused(LayoutKind kind, const QString& text)
{
    return {empty_layout(kind), {{0, text}}};
}

} // namespace

QString words_of(LayoutKind kind)
{
    return word_of(layout_kind_words(), kind);
}

QString words_of(LayoutPlace place)
{
    return word_of(layout_place_words(), place);
}

QSizeF column_room(const CustomLayout& layout)
{
    auto page = layout.page;
    QSizeF room = page.size();
    for (const auto paper : {pages::Paper::a4, pages::Paper::letter}) {
        page.paper = paper;
        const auto height = page.size().height() - page.margins.top() - page.margins.bottom();
        room = room.boundedTo({page.column_width(), height});
    }
    return room;
}

void note_once(LayoutStatement& statement, LayoutText& text, const QString& what)
{
    const auto before = std::ranges::find(text.said, what, &std::pair<QString, int>::first);
    if (before == text.said.end())
        text.said.emplace_back(what, statement.line());
    else
        statement.fault(u"\"%1\" stands on line %2 already"_s.arg(what).arg(before->second));
}

void check_field(LayoutStatement& statement, LayoutField& field, LayoutPlace place)
{
    const auto* known = find_custom_field(field.name);
    if (!known) {
        statement.fault(
            u"there is no field \"%1\"%2"_s.arg(field.name.left(60), did_you_mean(field.name, custom_field_names())));
        return;
    }
    field.name = QString::fromLatin1(known->name);
    if (!may_stand(known->scope, place))
        statement.fault(u"the field \"%1\" has no value in \"%2\""_s.arg(field.name, words_of(place)));
    if (!field.item.isEmpty() && !known->items)
        statement.fault(u"the field \"%1\" is no list from which \"%2\" could be taken"_s.arg(field.name, field.item));
}

QString LayoutFault::shown() const
{
    return line > 0 ? u"Line %1: %2."_s.arg(line).arg(text).replace(u"?."_s, u"?"_s) : text + u'.';
}

CustomLayout empty_layout(LayoutKind kind)
{
    const bool receipt = kind == LayoutKind::receipts;
    return {.kind = kind, .decorated = !receipt, .one_to_a_page = receipt};
}

ParsedLayout parse_layout(const QString& text, LayoutKind kind)
{
    LayoutText state{.parsed = {empty_layout(kind), {}}};
    const auto plain = QString(text).replace("\r\n"_L1, "\n"_L1).replace(u'\r', u'\n');
    int number = 0;
    for (const auto line : QStringView(plain).split(u'\n'))
        read_line(++number, line, state);
    check_whole(state);
    std::ranges::stable_sort(state.parsed.faults, {}, [](const auto& fault) {
        return fault.line == 0 ? std::numeric_limits<int>::max() : fault.line;
    });
    return std::move(state.parsed);
}

LayoutKind layout_kind_of(const QString& file)
{
    const auto ending = QFileInfo(file).suffix().toLower();
    return ending == u"rct" ? LayoutKind::receipts : ending == u"rpy" ? LayoutKind::people : LayoutKind::families;
}

ParsedLayout parse_layout_file(const QByteArray& content, LayoutKind kind)
{
    if (content.size() > largest_layout)
        return refused(kind, u"The file is too large for a layout, which can have one megabyte"_s);
    if (content.contains('\0'))
        return refused(kind, u"The file is no text: it holds something else, such as a picture or a program's data"_s);
    QStringDecoder decoder(QStringDecoder::Utf8);
    const QString text = decoder(content);
    if (decoder.hasError())
        return refused(kind, u"The file is not saved as UTF-8 text; save it again with this encoding"_s);
    if (text.trimmed().isEmpty())
        return refused(kind, u"The file is empty"_s);
    return parse_layout(text, kind);
}

ParsedLayout load_layout(const QString& file)
{
    const auto kind = layout_kind_of(file);
    if (QFileInfo(file).size() > largest_layout)
        return refused(kind, u"The file is too large for a layout, which can have one megabyte"_s);
    const auto content = core::read_file(file);
    return content ? parse_layout_file(*content, kind) : refused(kind, u"The file is no longer there"_s);
}

} // namespace kindrel::output
