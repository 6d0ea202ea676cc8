#pragma once

class QTableView;

namespace kindrel::desktop {

/// Whole rows of one height, chosen one at a time, with no grid; Ctrl+C copies.
void make_row_list(QTableView& view);

} // namespace kindrel::desktop
