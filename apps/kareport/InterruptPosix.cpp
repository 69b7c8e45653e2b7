#include "Interrupt.h"

#include <csignal>

#ifdef __unix__
#include <unistd.h>

#include <cstring>
#endif

namespace kareport
{

namespace
{

volatile std::sig_atomic_t interrupted = 0;

extern "C" void noteInterrupt(int /*signal*/)
{
    interrupted = 1;
}

#ifdef __unix__

/// A mapped file that somebody cuts short cannot be read any more.
extern "C" void endForLostFile(int /*signal*/)
{
    constexpr char message[] =
        "kareport: error: a data file was cut short while it was read; its report was not written\n";
    constexpr int exitInput = 2;
    const auto written = write(STDERR_FILENO, message, sizeof message - 1);
    _exit(written < 0 ? exitInput + 1 : exitInput);
}

/// The first signal is noted and lets blocked calls end; the second one of its kind ends the program at once.
void handleOnce(int signal, void (*handler)(int))
{
    struct sigaction action;
    std::memset(&action, 0, sizeof action);
    action.sa_handler = handler;
    action.sa_flags = static_cast<int>(SA_RESETHAND);
    sigaction(signal, &action, nullptr);
}

#endif

} // namespace

void catchInterrupts()
{
#ifdef __unix__
    handleOnce(SIGINT, noteInterrupt);
    handleOnce(SIGTERM, noteInterrupt);
    handleOnce(SIGBUS, endForLostFile);
#else
    std::signal(SIGINT, noteInterrupt);
    std::signal(SIGTERM, noteInterrupt);
#endif
}

bool isInterrupted()
{
    return interrupted != 0;
}

void setInterrupted(bool isSet)
{
    interrupted = isSet ? 1 : 0;
}

} // namespace kareport
