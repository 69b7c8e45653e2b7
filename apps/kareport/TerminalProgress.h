#pragma once

#include "Progress.h"

namespace kareport
{

/// Takes what is shown of any progress off standard error, so that something else can be printed.
void eraseProgress();
/// Whether there is something to take off. A signal's handler may ask.
bool isProgressShown();

/// Shows how far long work has come in a line on standard error.
class TerminalProgress : public Progress
{
public:
    explicit TerminalProgress(bool shown) : Progress(shown) {}
    ~TerminalProgress() override { TerminalProgress::finish(); }

    /// The line goes, unless the work is one of many.
    void finish() override;

protected:
    void show(std::size_t done) override;
};

} // namespace kareport
