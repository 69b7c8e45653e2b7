#pragma once

#include "Progress.h"

namespace kareport
{

/// Removes any progress line from standard error, so that something else can be printed.
void eraseProgress();
/// Whether there is a progress line to remove. A signal handler may call it.
bool isProgressShown();

/// A line that says how far work has come.
/// @param what     what is done now; its middle is left out where the line would be too wide
/// @param percent  of all the work; below 0 when it is not known
/// @param columns  of the terminal: a line that took all of them would go on in the next one. 0 for any number
QString progressLine(const QString &what, int percent, int columns);

/// Shows how far long work has come in a line on standard error. The line goes on from piece to piece and is removed when
/// work fails or is stopped. It ends at 100 %, once.
class TerminalProgress : public Progress
{
public:
    explicit TerminalProgress(bool shown) : Progress(shown) {}
    ~TerminalProgress() override { TerminalProgress::finish(); }

    /// Removes the line, unless the work is one of many.
    void finish() override;
    /// All the work is done: the line says so and stays. Nothing is shown after that.
    void complete();

protected:
    void show(std::size_t done) override;

private:
    bool isComplete_ = false;
};

} // namespace kareport
