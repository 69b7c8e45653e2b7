#pragma once

#include <QString>

#include <algorithm>
#include <cstddef>
#include <functional>
#include <random>
#include <vector>

/// Shortens a sequence of steps that fails: as many steps as can be are left out as long as it still fails.
/// @param fails  carries a sequence out from the beginning. Every step must make sense in every state
template <typename Step>
std::vector<Step> shortenedSequence(std::vector<Step> steps,
                                    const std::function<bool(const std::vector<Step> &)> &fails)
{
    for (std::size_t piece = std::max<std::size_t>(1, steps.size() / 2);; piece = std::max<std::size_t>(1, piece / 2)) {
        bool isShorter = false;
        for (std::size_t end = steps.size(); end > 0;) {
            const std::size_t begin = end > piece ? end - piece : 0;
            std::vector<Step> without(steps.begin(), steps.begin() + static_cast<std::ptrdiff_t>(begin));
            without.insert(without.end(), steps.begin() + static_cast<std::ptrdiff_t>(end), steps.end());
            if (fails(without)) {
                steps = without;
                isShorter = true;
            }
            end = begin;
        }
        if (piece == 1 && !isShorter) {
            return steps;
        }
    }
}

/// Random numbers that are the same on every machine.
class RandomNumbers
{
public:
    explicit RandomNumbers(quint64 seed) : engine_(seed) {}
    /// From 0 to below a number.
    int below(int limit) { return static_cast<int>(engine_() % static_cast<quint64>(limit)); }

private:
    std::mt19937_64 engine_;
};
