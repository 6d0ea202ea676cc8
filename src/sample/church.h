#pragma once

#include "core/session.h"

#include <QDate>

namespace kindrel::sample {

struct ChurchPlan
{
    int families = 0;
    quint32 seed = 0;
    bool training = false; ///< With the vision statement and the titles on reports.
    QDate today;           ///< Ages and dates are told from this day.
};

/// Fills a church that holds nothing but its schema with setup lists, families and registers, all in one transaction.
/// The same plan gives the same rows and pictures every time. An empty folder stands for no photographs or no notebook
/// pages. Throws core::DatabaseError and core::FileError.
void fill_church(core::Session& session, const ChurchPlan& plan, const QString& portrait_folder,
                 const QString& notebook_folder);

} // namespace kindrel::sample
