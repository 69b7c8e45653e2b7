#pragma once

#include "Progress.h"

namespace kareport
{

/// Removes any progress line from standard error, so that something else can be printed.
void eraseProgress();
/// Whether there is a progress line to remove. A signal handler may call it.
bool isProgressShown();

/// Shows how far long work has come in a line on standard error.
class TerminalProgress : public Progress
{
public:
    explicit TerminalProgress(bool shown) : Progress(shown) {}
    ~TerminalProgress() override { TerminalProgress::finish(); }

    /// Removes the line, unless the work is one of many.
    void finish() override;

protected:
    void show(std::size_t done) override;
};

} // namespace kareport
