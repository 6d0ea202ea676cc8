#include "desktop/shell/progress.h"

#include "core/office.h"

#include <QApplication>
#include <QProgressDialog>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int noticed_after_ms = 300;
constexpr int refresh_ms = 50;

}

QtProgress::QtProgress(core::Dialogue& dialogue) : m_dialogue(dialogue) {}

QtProgress::~QtProgress() = default;

void QtProgress::begin(const QString& what, int steps, const QString& cancel_question)
{
    m_question = cancel_question;
    m_done = 0;
    m_box = std::make_unique<QProgressDialog>(what, QString(), 0, steps, QApplication::activeWindow());
    m_box->setWindowTitle(core::product.toString());
    m_box->setWindowModality(Qt::ApplicationModal);
    m_box->setAutoClose(false);
    m_box->setAutoReset(false);
    m_box->setMinimumDuration(noticed_after_ms);
    m_box->setMinimumWidth(420);
    if (!cancel_question.isEmpty())
        m_box->setCancelButtonText(u"Cancel"_s);
    m_running.start();
    m_shown.start();
}

bool QtProgress::step(const QString& what)
{
    ++m_done;
    if (!m_box || m_running.elapsed() < noticed_after_ms || (m_box->isVisible() && m_shown.elapsed() < refresh_ms))
        return true;
    show_state(what);
    return !m_box->wasCanceled() || !cancel_confirmed();
}

void QtProgress::show_state(const QString& what)
{
    if (!what.isEmpty())
        m_box->setLabelText(what);
    m_box->show();
    m_box->setValue(m_done);
    QApplication::processEvents();
    m_shown.restart();
}

bool QtProgress::cancel_confirmed()
{
    m_box->reset();
    return !m_question.isEmpty() &&
           m_dialogue.confirm({.text = m_question, .icon = core::Icon::question}, core::Answer::no);
}

void QtProgress::end()
{
    m_box.reset();
}

}
