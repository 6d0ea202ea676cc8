#include "desktop/output/preview_bar.h"

#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"

#include <QAction>
#include <QComboBox>
#include <QKeyEvent>
#include <QLineEdit>
#include <QSpinBox>
#include <QToolButton>

#include <limits>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

struct ZoomChoice
{
    const char* text;
    Zoom zoom;
};

constexpr std::array zoom_choices{
    ZoomChoice{"Fit width", {Zoom::Fit::width, 100}}, ZoomChoice{"Fit page", {Zoom::Fit::page, 100}},
    ZoomChoice{"50 %", {Zoom::Fit::none, 50}},        ZoomChoice{"75 %", {Zoom::Fit::none, 75}},
    ZoomChoice{"100 %", {Zoom::Fit::none, 100}},      ZoomChoice{"125 %", {Zoom::Fit::none, 125}},
    ZoomChoice{"150 %", {Zoom::Fit::none, 150}},      ZoomChoice{"200 %", {Zoom::Fit::none, 200}},
    ZoomChoice{"300 %", {Zoom::Fit::none, 300}},      ZoomChoice{"400 %", {Zoom::Fit::none, 400}},
};

constexpr int find_width = 170;

} // namespace

PreviewBar::PreviewBar(QWidget* parent)
    : QToolBar(u"Preview"_s, parent), m_page(new QSpinBox), m_zoom(new QComboBox), m_find(new QLineEdit)
{
    setMovable(false);
    setContextMenuPolicy(Qt::PreventContextMenu);
    setIconSize({22, 22});
    setContentsMargins(space::field, space::field / 2, space::field, space::field / 2);
    add_page_tools();
    addSeparator();
    add_zoom_tools();
    addSeparator();
    add_find();
    auto* gap = new QWidget;
    gap->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Preferred);
    addWidget(gap);
    add_output_tools();
}

QAction* PreviewBar::add_tool(const QString& icon_name, const QString& text, const QString& tip)
{
    QAction* action = addAction(icon(icon_name), text);
    action->setToolTip(tip);
    action->setStatusTip(tip);
    return action;
}

void PreviewBar::add_page_tools()
{
    const auto tool = [this](const QString& icon_name, const QString& text, const QString& tip, auto act) {
        connect(add_tool(icon_name, text, tip), &QAction::triggered, this, act);
    };
    tool(u"go-first"_s, u"First page"_s, u"First page (Home)"_s, [this] { Q_EMIT page_wanted(1); });
    tool(u"go-previous"_s, u"Previous page"_s, u"Previous page (PgUp)"_s, [this] { Q_EMIT turn_wanted(-1); });
    m_page->setObjectName(u"page"_s);
    m_page->setAccessibleName(u"Page"_s);
    m_page->setButtonSymbols(QAbstractSpinBox::NoButtons);
    m_page->setKeyboardTracking(false);
    m_page->setRange(1, 1);
    m_page->setMinimumWidth(88);
    m_page->setAlignment(Qt::AlignCenter);
    connect(m_page, &QSpinBox::valueChanged, this, &PreviewBar::page_wanted);
    addWidget(m_page);
    tool(u"go-next"_s, u"Next page"_s, u"Next page (PgDn)"_s, [this] { Q_EMIT turn_wanted(1); });
    tool(u"go-last"_s, u"Last page"_s, u"Last page (End)"_s,
         [this] { Q_EMIT page_wanted(std::numeric_limits<int>::max()); });
}

void PreviewBar::add_zoom_tools()
{
    connect(add_tool(u"zoom-out"_s, u"Smaller"_s, u"Smaller (Ctrl+-)"_s), &QAction::triggered, this,
            [this] { Q_EMIT zoom_step_wanted(-1); });
    for (const ZoomChoice& choice : zoom_choices)
        m_zoom->addItem(QString::fromLatin1(choice.text));
    m_zoom->setObjectName(u"zoom"_s);
    m_zoom->setAccessibleName(u"Zoom"_s);
    m_zoom->setSizeAdjustPolicy(QComboBox::AdjustToContents);
    m_zoom->setPlaceholderText(u"100 %"_s);
    connect(m_zoom, &QComboBox::activated, this,
            [this](int row) { Q_EMIT zoom_wanted(zoom_choices[std::size_t(row)].zoom); });
    addWidget(m_zoom);
    connect(add_tool(u"zoom-in"_s, u"Larger"_s, u"Larger (Ctrl++)"_s), &QAction::triggered, this,
            [this] { Q_EMIT zoom_step_wanted(1); });
}

void PreviewBar::add_find()
{
    m_find->setObjectName(u"find"_s);
    m_find->setAccessibleName(u"Find in the document"_s);
    m_find->setPlaceholderText(u"Find (Ctrl+F)"_s);
    m_find->setClearButtonEnabled(true);
    m_find->setFixedWidth(find_width);
    m_find->addAction(icon(u"edit-find"_s), QLineEdit::LeadingPosition);
    m_find->setToolTip(u"Enter finds the next place, Shift+Enter the one before"_s);
    m_find->installEventFilter(this);
    connect(m_find, &QLineEdit::textChanged, this, [this](const QString& text) {
        if (text.isEmpty())
            Q_EMIT find_wanted({}, false);
    });
    addWidget(m_find);
}

void PreviewBar::add_output_tools()
{
    m_print = add_tool(u"document-print"_s, u"Print"_s, u"Print (Ctrl+P)"_s);
    connect(m_print, &QAction::triggered, this, &PreviewBar::print_wanted);
    m_pdf = add_tool(u"application-pdf"_s, u"Save as PDF"_s, u"Save as PDF (Ctrl+S)"_s);
    connect(m_pdf, &QAction::triggered, this, &PreviewBar::pdf_wanted);
    for (QAction* action : {m_print, m_pdf})
        if (auto* button = qobject_cast<QToolButton*>(widgetForAction(action)))
            button->setToolButtonStyle(Qt::ToolButtonTextBesideIcon);
}

void PreviewBar::show_page(int number, int count, bool finished)
{
    const QSignalBlocker quiet(m_page);
    m_page->setRange(1, std::max(1, count));
    m_page->setValue(number);
    m_page->setSuffix(u" of %1%2"_s.arg(count).arg(finished ? QString() : u"\u2026"_s));
}

void PreviewBar::show_zoom(const PageView& view)
{
    const auto same = [&view](const ZoomChoice& choice) {
        const bool fitted = choice.zoom.fit != Zoom::Fit::none;
        return fitted ? choice.zoom.fit == view.zoom().fit : choice.zoom == view.zoom();
    };
    const auto* found = std::find_if(zoom_choices.begin(), zoom_choices.end(), same);
    m_zoom->setCurrentIndex(found == zoom_choices.end() ? -1 : int(found - zoom_choices.begin()));
    m_zoom->setToolTip(u"%1 %"_s.arg(view.shown_percent()));
}

void PreviewBar::focus_find()
{
    m_find->setFocus(Qt::ShortcutFocusReason);
    m_find->selectAll();
}

void PreviewBar::focus_page()
{
    m_page->setFocus(Qt::ShortcutFocusReason);
    m_page->selectAll();
}

void PreviewBar::set_complete(bool complete)
{
    m_print->setEnabled(complete);
    m_pdf->setEnabled(complete);
}

bool PreviewBar::eventFilter(QObject* target, QEvent* event)
{
    if (target != m_find || event->type() != QEvent::KeyPress)
        return QToolBar::eventFilter(target, event);
    auto* key = static_cast<QKeyEvent*>(event);
    if (key->key() != Qt::Key_Return && key->key() != Qt::Key_Enter)
        return false;
    Q_EMIT find_wanted(m_find->text(), key->modifiers() & Qt::ShiftModifier);
    return true;
}

} // namespace kindrel::desktop
