#pragma once

#include <cstddef>
#include <vector>

/// Takes steps out of a sequence while what it shows still shows, larger pieces first, until every step that is left is
/// needed.
/// @param shows  whether a sequence shows it; the one given does
template <typename Step, typename Shows>
std::vector<Step> shortened(std::vector<Step> steps, Shows shows)
{
    for (std::size_t piece = (steps.size() + 1) / 2; piece > 0;) {
        bool isShorter = false;
        for (std::size_t begin = 0; begin < steps.size();) {
            std::vector<Step> fewer;
            for (std::size_t i = 0; i < steps.size(); ++i) {
                if (i < begin || i >= begin + piece) {
                    fewer.push_back(steps[i]);
                }
            }
            if (shows(fewer)) {
                steps = fewer;
                isShorter = true;
            } else {
                begin += piece;
            }
        }
        if (!isShorter || piece > 1) {
            piece = piece == 1 ? 0 : piece / 2;
        }
    }
    return steps;
}

/// Puts simpler values into the steps of a sequence while what it shows still shows.
/// @param simpler  gives the simpler forms of a step, the simplest first
template <typename Step, typename Shows, typename Simpler>
std::vector<Step> simplified(std::vector<Step> steps, Shows shows, Simpler simpler)
{
    for (std::size_t i = 0; i < steps.size(); ++i) {
        for (const Step &form : simpler(steps[i])) {
            const Step before = steps[i];
            steps[i] = form;
            if (shows(steps)) {
                break;
            }
            steps[i] = before;
        }
    }
    return steps;
}
