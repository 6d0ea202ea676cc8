#include "core/schema.h"

#include "core/schema_text.h"

namespace kindrel::core {

void create_schema(Session& session)
{
    Transaction transaction(session);
    for (const char* script : schema_scripts())
        session.run_script(QString::fromUtf8(script));
    transaction.commit();
}

} // namespace kindrel::core
