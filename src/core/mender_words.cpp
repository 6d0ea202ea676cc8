#include "core/mender_words.h"

namespace kindrel::core::mender_words {

using namespace Qt::StringLiterals;

QString mending_question(int church)
{
    return u"Mend church %1? A copy of its database is kept."_s.arg(church);
}

QString unlocking_question(int church)
{
    return u"Remove every lock and marker of church %1? Nobody may be inside or at work on it."_s.arg(church);
}

QString recovering_question(const QString& damaged, const QString& fresh)
{
    return u"Write what can be read of '%1' into '%2'?"_s.arg(damaged, fresh);
}

QString setting_aside_question(int church)
{
    return u"Set the damaged church file of church %1 aside, so that the next start begins an empty church? Nobody may "
           "be inside."_s.arg(church);
}

QString placing_question(int church, const QString& recovered)
{
    return u"Put '%1' in the place of the church file of church %2, which is kept in the folder 'mended', and mend the "
           "church? Nobody may be inside."_s.arg(recovered)
               .arg(church);
}

QString running_here()
{
    return u"%1 is running on this workstation: leave it first."_s.arg(product);
}

QString nothing_changed()
{
    return u"Nothing was changed."_s;
}

QString came_of(const RecoveredTable& table)
{
    QString words = counted(table.rows, u"row"_s, u"rows"_s);
    if (table.refused > 0)
        words += u", %1 refused"_s.arg(table.refused);
    return table.whole ? words : words + u", a part could not be read"_s;
}

bool came_whole(const RecoveredTable& table)
{
    return table.whole && table.refused == 0;
}

QString where_recovered(const QString& damaged, const QString& fresh)
{
    return u"The new church file is '%1'; '%2' was left as it is."_s.arg(fresh, damaged);
}

QString where_set_aside(const QString& aside)
{
    return u"The damaged church file lies in '%1' now."_s.arg(aside);
}

QString after_setting_aside()
{
    return u"Start %1, which begins an empty church, and put back a backup with 'Restore Data'."_s.arg(product);
}

QString after_recovering()
{
    return u"To work with it, put it in the place of the damaged file (kindrel-mender put-in-place)."_s;
}

QString no_place_for_recovered()
{
    return u"A recovered file takes the place only of a church file that is damaged, missing or without any family. To go "
           "back to an earlier state of the church, start %1 and restore a backup."_s.arg(product);
}

QStringList where_put(const Placement& placement, const QString& database)
{
    QStringList lines{u"The recovered records stand in '%1' now."_s.arg(database)};
    if (!placement.aside.isEmpty())
        lines += u"The church's former file lies in '%1' now."_s.arg(placement.aside);
    return lines;
}

} // namespace kindrel::core::mender_words
