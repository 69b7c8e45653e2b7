#pragma once

#include <QString>

#include <random>
#include <vector>

namespace monkey
{

/// One thing that the user does: an action by its name, and the seed of all that the action leaves to chance.
struct Step
{
    QString action;
    quint64 seed = 0;
};

using Steps = std::vector<Step>;

/// What an action leaves to chance.
class Chance
{
public:
    explicit Chance(quint64 seed) : engine_(seed) {}

    /// A number from 0 to below `count`, which is 1 or more.
    int below(qsizetype count)
    {
        return static_cast<int>(engine_() % static_cast<quint64>(count)); // the bias is too small to matter
    }
    bool oneIn(int count) { return below(count) == 0; }
    template <typename List>
    auto &of(List &list)
    {
        return list[static_cast<decltype(list.size())>(below(static_cast<qsizetype>(list.size())))];
    }

private:
    std::mt19937_64 engine_;
};

/// The steps of a seed. @param faults  also lets files, printers and editors fail
Steps makeSteps(quint64 seed, int count, bool faults);

/// One line a step: its action and its seed.
bool writeSteps(const QString &file, const Steps &steps);
/// @return nothing when the file cannot be read
Steps readSteps(const QString &file);

} // namespace monkey
