#include "desktop/output/run_strip.h"

#include "desktop/shell/look.h"

#include <QApplication>
#include <QHBoxLayout>
#include <QLabel>
#include <QProgressBar>
#include <QPushButton>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int refresh_ms = 40;
constexpr int bar_width = 220;

} // namespace

RunStrip::RunStrip(core::Dialogue& dialogue, QWidget* parent)
    : QWidget(parent), m_dialogue(dialogue), m_what(new QLabel), m_bar(new QProgressBar),
      m_cancel(new QPushButton(u"Cancel"_s))
{
    m_what->setTextFormat(Qt::PlainText);
    m_bar->setFixedWidth(bar_width);
    m_bar->setTextVisible(false);
    m_cancel->setObjectName(u"cancel"_s);
    connect(m_cancel, &QPushButton::clicked, this, &RunStrip::ask_to_cancel);
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(space::margin, space::field / 2, space::margin, space::field / 2);
    row->setSpacing(space::margin);
    row->addWidget(m_what, 1);
    row->addWidget(m_bar);
    row->addWidget(m_cancel);
    hide();
}

void RunStrip::begin(const QString& what, int steps, const QString& cancel_question)
{
    m_question = cancel_question;
    m_asked = false;
    m_done = 0;
    m_what->setText(what);
    m_bar->setRange(0, steps);
    m_bar->setValue(0);
    m_cancel->setVisible(!cancel_question.isEmpty());
    show();
    m_shown.start();
}

bool RunStrip::step(const QString& what)
{
    ++m_done;
    if (m_shown.elapsed() >= refresh_ms) {
        if (!what.isEmpty())
            m_what->setText(what);
        m_bar->setValue(m_done);
        yield();
    }
    if (!m_asked || m_question.isEmpty())
        return true;
    m_asked = false;
    return !m_dialogue.confirm({.text = m_question, .icon = core::Icon::question}, core::Answer::no);
}

void RunStrip::yield()
{
    QApplication::processEvents();
    m_shown.restart();
}

void RunStrip::end()
{
    hide();
}

} // namespace kindrel::desktop
