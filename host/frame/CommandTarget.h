#pragma once

#include "KaReportExport.h"

#include <functional>
#include <vector>

namespace kareport
{

/// What an update handler says about its command, shown on every menu entry and button of it.
struct CommandState
{
    bool enabled = true;  ///< can be chosen
    bool checked = false; ///< shows a mark
};

/// A command that a class handles.
struct Command
{
    unsigned id = 0;                                 ///< its number
    std::function<void()> handler;                   ///< may be empty: then the command is only updated here
    std::function<void(CommandState &state)> update; ///< may be empty: the command is then always enabled
};

/// A class that handles commands: one table says which, and how.
class KAREPORT_EXPORT CommandTarget
{
public:
    virtual ~CommandTarget();

    /// The commands, in order; a handler and an update handler of one id may be in different rows.
    virtual const std::vector<Command> &commands() const = 0;

    /// Runs a command. @return false when this class has no handler for it
    bool runCommand(unsigned id);
    /// Asks for the state of a command. @return false when this class knows nothing of it
    bool updateCommand(unsigned id, CommandState &state) const;
};

} // namespace kareport
