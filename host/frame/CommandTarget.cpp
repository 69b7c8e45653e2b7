#include "CommandTarget.h"

namespace kareport
{

CommandTarget::~CommandTarget() = default;

bool CommandTarget::runCommand(unsigned id)
{
    for (const Command &command : commands()) {
        if (command.id == id && command.handler) {
            // The handler may close what the table belongs to.
            const auto handler = command.handler;
            handler();
            return true;
        }
    }
    return false;
}

bool CommandTarget::updateCommand(unsigned id, CommandState &state) const
{
    bool known = false;
    for (const Command &command : commands()) {
        if (command.id == id) {
            known = known || command.handler;
            if (command.update) {
                command.update(state);
                return true;
            }
        }
    }
    return known;
}

} // namespace kareport
