#pragma once

#include "core/mender.h"
#include "core/startup.h"

#include <QTextStream>

namespace kindrel::apps {

struct MenderContext;
/// True when the church is sound, or what was asked for is done.
using MenderCommand = bool (*)(const MenderContext&);

/// What the command line asks for.
struct MenderOrder
{
    MenderCommand command = nullptr;
    core::StartRequest request = {};
    QString target;  ///< The new or recovered church file.
    QString damaged; ///< Empty: the church's own file.
    bool json = false;
    bool ask = true;
    bool remove_locks = false; ///< Before mending.
};

struct MenderContext
{
    const MenderOrder& order;
    core::MenderPlace& place;
    core::Dialogue& dialogue;
    QTextStream& out;
};

/// Null for a word that is no command.
[[nodiscard]] MenderCommand mender_command(const QString& word);
/// Whether the command is followed by the name of a church file.
[[nodiscard]] bool takes_file(MenderCommand command);

} // namespace kindrel::apps
