#pragma once

#include "pages/page.h"

#include <memory>
#include <vector>

namespace kindrel::pages {

enum class Glue : quint8 { none, to_next };
enum class BlockKind : quint8 { content, space };

struct Block;
using Blocks = std::vector<Block>;

/// What is never divided: a line, a table row, a picture. Items count from its upper left corner.
struct Block
{
    qreal height = 0;
    std::vector<Item> items = {};
    BlockKind kind = BlockKind::content;        ///< A space is dropped at the top of a column and may run off its end.
    Glue glue = Glue::none;                     ///< Stays in one column with the block after it.
    std::shared_ptr<const Blocks> heading = {}; ///< Put above it again where it begins a column.
};

[[nodiscard]] qreal height_of(const Blocks& blocks);

} // namespace kindrel::pages
