#pragma once

namespace kareport
{

/// Has the C library write the numbers of this thread as in the "C" locale while it lives: other libraries write numbers with it.
/// The locale of the process, which belongs to the program, stays. One at a time on a thread.
class PlainNumbers
{
public:
    PlainNumbers();
    ~PlainNumbers();
    PlainNumbers(const PlainNumbers &) = delete;
    PlainNumbers &operator=(const PlainNumbers &) = delete;

private:
    void *before_;              ///< what the thread had before
    [[maybe_unused]] int mode_; ///< the same of a system that asks for it
};

} // namespace kareport
