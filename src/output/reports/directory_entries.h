#pragma once

#include "output/list_reader.h"

namespace kindrel::output {

/// The entries of the church directories, one family each. An entry stays in one column unless it is higher than one.

/// Names, address and contacts beside each other.
void write_side_by_side(pages::Flow& flow, const ListedFamily& listed);
/// The same beneath each other.
void write_stacked(pages::Flow& flow, const ListedFamily& listed);
/// Names and address, beside them the phones and mobiles of the family and of its people.
void write_with_phones(pages::Flow& flow, const ListedFamily& listed);
/// Address and contacts of the family, beside them its people with theirs.
void write_with_details(pages::Flow& flow, const ListedFamily& listed);
/// The same beneath each other.
void write_details_stacked(pages::Flow& flow, const ListedFamily& listed);

} // namespace kindrel::output
