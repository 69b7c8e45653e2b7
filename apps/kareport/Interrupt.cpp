#include "Interrupt.h"

#include <csignal>

namespace kareport
{

namespace
{

volatile std::sig_atomic_t interrupted = 0;

extern "C" void noteInterrupt(int /*signal*/)
{
    interrupted = 1;
}

} // namespace

void catchInterrupts()
{
    std::signal(SIGINT, noteInterrupt);
    std::signal(SIGTERM, noteInterrupt);
}

bool isInterrupted()
{
    return interrupted != 0;
}

} // namespace kareport
