#include "desktop/shell/progress.h"

#include "core/office.h"
#include "desktop/shell/session_end.h"

#include <QApplication>
#include <QProgressDialog>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

using namespace std::chrono_literals;

constexpr auto noticed_after = 300ms;
constexpr auto refresh_time = 50ms;

} // namespace

QtProgress::QtProgress(core::Dialogue& dialogue, Stopwatch now) : m_dialogue(dialogue), m_now(std::move(now)) {}

QtProgress::~QtProgress() = default;

void QtProgress::begin(const QString& what, int steps, const QString& cancel_question)
{
    m_question = cancel_question;
    m_done = 0;
    m_hold = std::make_unique<SessionHold>();
    m_box = std::make_unique<QProgressDialog>(what, QString(), 0, steps, QApplication::activeWindow());
    m_box->setWindowTitle(core::product.toString());
    m_box->setWindowModality(Qt::ApplicationModal);
    m_box->setAutoClose(false);
    m_box->setAutoReset(false);
    m_box->setMinimumWidth(420);
    if (!cancel_question.isEmpty())
        m_box->setCancelButtonText(u"Cancel"_s);
    m_begun = m_shown = m_now();
}

bool QtProgress::step(const QString& what)
{
    ++m_done;
    if (!m_box || m_now() - m_begun < noticed_after)
        return true;
    const bool news = !what.isEmpty() && what != m_box->labelText();
    if (!news && m_box->isVisible() && m_now() - m_shown < refresh_time)
        return true;
    show_state();
    if (stopped())
        return false;
    if (news)
        show_text(what);
    return true;
}

void QtProgress::show_state()
{
    m_box->show();
    m_box->setValue(m_done);
    QApplication::processEvents();
    m_shown = m_now();
}

void QtProgress::show_text(const QString& what)
{
    m_box->setLabelText(what);
    m_box->show();
    QApplication::processEvents(QEventLoop::ExcludeUserInputEvents);
}

bool QtProgress::stopped()
{
    if (!m_box->wasCanceled())
        return false;
    m_box->reset();
    return !m_question.isEmpty() &&
           m_dialogue.confirm({.text = m_question, .icon = core::Icon::question}, core::Answer::no);
}

void QtProgress::end()
{
    m_box.reset();
    m_hold.reset();
}

} // namespace kindrel::desktop
