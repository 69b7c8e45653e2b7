#pragma once

#include <vector>

namespace monkey
{

class Chance;
class World;

/// Something that a user does at the desk.
struct Action
{
    const char *name;
    int weight;   ///< how often it comes among the others
    bool isFault; ///< makes something fail, where the run asks for that
    /// Does it. It may find nothing to do.
    void (*run)(World &world, Chance &chance);
};

const std::vector<Action> &allActions();
/// @return null when there is no such action
const Action *actionOf(const char *name);

} // namespace monkey
