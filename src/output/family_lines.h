#pragma once

#include "output/list_reader.h"
#include "pages/writer.h"

#include <QStringList>

namespace kindrel::output {

/// What reports say of a family and its people, so that all of them say it alike. Nothing here prints an empty line or
/// the caption of an empty value.

/// The parts that are not empty, one after another.
[[nodiscard]] QString joined(QStringView separator, std::initializer_list<QString> parts);
[[nodiscard]] QString names_of(const people::DisclosedFamily& family, std::span<const people::Person* const> people,
                               QStringView separator);
/// "Ann & Ben Naismith" of the adults; of a family without adults on the list its children.
[[nodiscard]] QString addressee_of(const ListedFamily& listed);

/// Whether post could go there: a street or a suburb stands in it. A state or a country alone is no address.
[[nodiscard]] bool has_address(const people::DisclosedFamily& family, people::SuburbType type);
/// Streets, the suburb with state and postcode, country. Where a family lives always has a suburb, be it an unknown
/// one, unless it is hidden; a postal address that is hidden or not there has no lines.
[[nodiscard]] QStringList address_lines(const people::DisclosedFamily& family, people::SuburbType type);
/// The address that post goes to: the postal one, or the residential one when there is no other; without unknown
/// suburbs.
[[nodiscard]] QStringList mailing_lines(const people::DisclosedFamily& family);
/// Suburb, state and postcode of where the family lives on one line; says when the suburb is not known.
[[nodiscard]] QString residential_suburb_line(const people::DisclosedFamily& family);
/// The same of either address as it stands on an envelope.
[[nodiscard]] QString mailing_suburb_line(const people::DisclosedFamily& family, people::SuburbType type);

/// "12/05/1960", "12/05/XXXX" for an unknown year, empty without a date.
[[nodiscard]] QString shown(const people::DisclosedFamily& family, const std::optional<core::Date>& date);

/// The family's contacts under their captions: phone, fax, e-mail, mobile, map and its reference. Lines that belong
/// together stand together.
using CaptionLines = std::vector<std::vector<pages::CaptionValue>>;
[[nodiscard]] CaptionLines family_contacts(const people::DisclosedFamily& family);
/// The person's birth date, other names, e-mails, phones and school year.
[[nodiscard]] CaptionLines personal_contacts(const people::DisclosedFamily& family, const people::Person& person);
/// The same beneath the person's listed name, which has their own surname already.
[[nodiscard]] CaptionLines personal_contacts(const ListedMember& listed);

/// A text on lines of its own; nothing when it is empty.
void write_line(pages::Writer& place, const QString& text, const pages::TextStyle& style);
void write_lines(pages::Writer& place, const QStringList& lines, const pages::TextStyle& style);
/// Contacts that would not fit beside each other stand beneath each other, so that no caption parts from its value.
void write_contacts(pages::Writer& place, const CaptionLines& lines);

} // namespace kindrel::output
