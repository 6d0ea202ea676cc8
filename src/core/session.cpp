#include "core/session.h"

namespace kindrel::core {

using namespace Qt::StringLiterals;

Transaction::Transaction(Session& session) : m_session(session), m_level(session.m_depth)
{
    if (m_level == 0)
        m_session.begin_outermost();
    else
        m_session.run(u"SAVEPOINT level_%1"_s.arg(m_level), {});
    ++m_session.m_depth;
}

Transaction::~Transaction()
{
    if (m_done)
        return;
    m_session.m_depth = m_level;
    try {
        if (m_level == 0) {
            m_session.run(u"ROLLBACK"_s, {});
        } else {
            m_session.run(u"ROLLBACK TO SAVEPOINT level_%1"_s.arg(m_level), {});
            m_session.run(u"RELEASE SAVEPOINT level_%1"_s.arg(m_level), {});
        }
    } catch (const DatabaseError&) {
        // The engine has rolled back by itself (full disk, lost connection): there is nothing left to undo.
    }
}

void Transaction::commit()
{
    Q_ASSERT(!m_done && m_session.m_depth == m_level + 1);
    m_session.run(m_level == 0 ? u"COMMIT"_s : u"RELEASE SAVEPOINT level_%1"_s.arg(m_level), {});
    m_session.m_depth = m_level;
    m_done = true;
}

} // namespace kindrel::core
