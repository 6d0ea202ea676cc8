#pragma once

#include "output/custom/custom_reports.h"
#include "output/output_fixture.h"

#include <random>

namespace kindrel::test {

/// Reports and receipts from layouts that lie in the church's custom folder.
class CustomTest : public ReportTest
{
protected:
    /// Puts the layout into the custom folder.
    output::CustomReport lay(const QString& name, const QString& text);
    /// What an undecorated report of the layout prints, a line for each; what stands apart on a line is parted by
    /// " | ".
    [[nodiscard]] std::vector<QStringList> pages_of(const QString& layout,
                                                    const QString& name = QStringLiteral("own.rpt"));
    [[nodiscard]] QStringList printed(const QString& layout, const QString& name = QStringLiteral("own.rpt"));
    [[nodiscard]] static std::vector<QStringList> read_back(const pages::PageSpool& spool);
};

/// The layout with some stretches of it lost, doubled or overwritten.
[[nodiscard]] QString damaged(QString text, std::mt19937& chance);
/// For the tales of failing tests.
[[nodiscard]] inline std::string told(const QStringList& lines)
{
    return lines.join(u'\n').toStdString();
}

} // namespace kindrel::test
