#pragma once

#include "pages/flow.h"
#include "pages/spool.h"
#include "pages/text_metrics.h"

#include <QStringList>
#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace kindrel::pages {

/// A text as a reader of the page finds it.
struct Placed
{
    QString text;
    int page = 0;
    QPointF at;
    qreal right = 0;
};

/// A report under test: an A4 page of one column unless the test divides it.
class Report : public ::testing::Test
{
protected:
    /// All lines are 9 points high in columns of 100 points that hold ten such lines, without header and footer.
    static PageSetup ten_lines(int columns);
    [[nodiscard]] std::vector<Placed> placed() const;
    [[nodiscard]] QStringList texts(int page) const { return texts_of(spool.page(page), spool.page_count()); }
    /// The texts of each column in turn, parted by " ", the columns by " | ", the pages by " || ".
    [[nodiscard]] std::string columns_of(const PageSetup& setup) const;

    PageSpool spool;
};

/// Lines "from" to "to" of the body look.
void write_lines(Writer& writer, int from, int to);

} // namespace kindrel::pages
