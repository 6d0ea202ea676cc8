#include "desktop/mender/account_view.h"

#include "desktop/shell/look.h"

#include <QEvent>
#include <QTextBlock>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int indent = 24;
constexpr int bullet = 14; ///< And what stands between it and the words.

/// Writes paragraph after paragraph at the end of a text.
class Pen
{
public:
    Pen(QTextDocument& text, const QPalette& palette)
        : m_cursor(&text), m_ink(palette.color(QPalette::Text)), m_quiet(quiet_colour(shade_of(palette)))
    {
    }
    void write(const QString& words, TextSize size, int above, int left = 0, int first_line = 0)
    {
        if (words.isEmpty())
            return;
        QTextBlockFormat place;
        place.setTopMargin(m_begun ? above : 0);
        place.setLeftMargin(left);
        place.setTextIndent(first_line);
        QTextCharFormat look;
        look.setFont(font_for(size));
        look.setForeground(size == TextSize::secondary ? m_quiet : m_ink);
        if (m_begun)
            m_cursor.insertBlock();
        m_begun = true;
        m_cursor.setBlockFormat(place);
        m_cursor.setBlockCharFormat(look);
        m_cursor.insertText(words, look);
    }

private:
    QTextCursor m_cursor;
    QColor m_ink, m_quiet;
    bool m_begun = false;
};

void write_group(Pen& pen, const AccountGroup& group)
{
    pen.write(group.heading, TextSize::group, 2 * space::group);
    pen.write(group.explanation, TextSize::secondary, space::field / 2);
    for (const auto& line : group.lines) {
        pen.write(u"•  "_s + line.words, TextSize::body, space::field, indent, -bullet);
        pen.write(line.beneath, TextSize::secondary, 2, indent);
    }
}

} // namespace

AccountView::AccountView()
{
    setObjectName(u"account"_s);
    setAccessibleName(u"What the Mender tells"_s);
    setOpenLinks(false);
    setTabChangesFocus(true);
    setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
    document()->setDocumentMargin(space::group);
}

void AccountView::show_account(const Account& account)
{
    m_account = account;
    draw();
}

void AccountView::draw()
{
    clear();
    Pen pen(*document(), palette());
    pen.write(m_account.title, TextSize::title, 0);
    for (const auto& line : m_account.lines) {
        pen.write(line.words, TextSize::body, space::field);
        pen.write(line.beneath, TextSize::secondary, 2);
    }
    for (const auto& group : m_account.groups)
        write_group(pen, group);
    moveCursor(QTextCursor::Start);
}

void AccountView::changeEvent(QEvent* event)
{
    QTextBrowser::changeEvent(event);
    if (event->type() == QEvent::PaletteChange || event->type() == QEvent::FontChange)
        draw();
}

} // namespace kindrel::desktop
