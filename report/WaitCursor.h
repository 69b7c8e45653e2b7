#pragma once

namespace kareport
{

/// Shows the wait cursor while it lives, in a program with windows.
class WaitCursor
{
public:
    WaitCursor();
    ~WaitCursor();
    WaitCursor(const WaitCursor &) = delete;
    WaitCursor &operator=(const WaitCursor &) = delete;

private:
    bool shown_;
};

} // namespace kareport
