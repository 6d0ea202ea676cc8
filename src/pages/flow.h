#pragma once

#include "pages/page_setup.h"
#include "pages/spool.h"
#include "pages/writer.h"

#include <functional>
#include <memory>

namespace kindrel::pages {

class Composer;

/// Writes what stands at the head or foot of page `number`. The number of pages is page_total_mark.
using BandWriter = std::function<void(Writer& band, int number)>;

/// The bare capital letter under which a key is filed; "#" for what does not begin with a letter.
[[nodiscard]] QString filing_letter(const QString& key);

/// What a report writes into: content runs down the columns and on to the next page, and each finished page goes to
/// the spool at once. Set header and footer before the first content; set anew, they hold from the next page on.
class Flow final : public Writer
{
public:
    Flow(PageSpool& spool, const PageSetup& setup, const TypeScale& type = TypeScale::around({}));
    ~Flow() override;

    void set_header(BandWriter write);
    void set_footer(BandWriter write);
    [[nodiscard]] const PageSetup& setup() const;

    /// A band with the letter under which `key` is filed, when it differs from the last one's.
    void separator(const QString& key);
    void next_column();
    void next_page();
    /// Writes the last page and closes the spool; an empty document has one page. A flow that is dropped without it
    /// leaves the spool open.
    void finish();

private:
    friend class Keep;

    void put(Block block) override;
    qreal place_height() override;

    std::unique_ptr<Composer> m_composer;
    QString m_letter;
};

/// What is written during its life stays in one column; when no column can hold it, it is divided between its lines.
/// Keeps inside a keep count for nothing.
class Keep
{
public:
    explicit Keep(Flow& flow);
    ~Keep();
    Keep(const Keep&) = delete;
    Keep& operator=(const Keep&) = delete;

private:
    Flow& m_flow;
};

} // namespace kindrel::pages
