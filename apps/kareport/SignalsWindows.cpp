#include "Signals.h"

#include "Interrupt.h"
#include "TerminalProgress.h"
#include "UnfinishedFile.h"

#include <QMetaObject>
#include <QObject>
#include <QPointer>

#include <windows.h>

#include <atomic>
#include <cstdio>
#include <mutex>
#include <utility>

namespace kareport
{

namespace
{

constexpr DWORD patience = 200; ///< milliseconds that work has for coming to a safe point

/// What the system gives a program that the keyboard has ended.
constexpr UINT endedByControl = 0xC000013A;
/// As that of an output that could not be written.
constexpr UINT endedByClosedReader = 3;

std::atomic<bool> isAsked{false};
std::atomic<bool> isEnding{false}; ///< the program ends by itself, and is not to be ended in the middle of that

std::mutex callMutex; // of what follows
QPointer<QObject> callContext;
std::function<void()> call;

void endAtOnce()
{
    UnfinishedFile::remove();
    std::fputs(isProgressShown() ? "\nkareport: stopped; no output is half written\n"
                                 : "kareport: stopped; no output is half written\n",
               stderr);
    TerminateProcess(GetCurrentProcess(), endedByControl);
}

void callInLoop()
{
    const std::lock_guard lock(callMutex);
    if (callContext) {
        QMetaObject::invokeMethod(callContext.data(), call, Qt::QueuedConnection);
    }
}

/// The system calls it in a thread of its own. Where a console closes or a user leaves, the process ends with its return.
BOOL WINAPI noteInterrupt(DWORD /*event*/)
{
    if (isAsked.exchange(true)) {
        endAtOnce();
    }
    setInterrupted(true);
    callInLoop();
    Sleep(patience);
    if (!isEnding) {
        endAtOnce();
    }
    Sleep(INFINITE);
    return TRUE;
}

} // namespace

void catchInterrupts()
{
    static const BOOL isCaught = SetConsoleCtrlHandler(noteInterrupt, TRUE);
    Q_UNUSED(isCaught)
}

bool callOnInterrupt(QObject *context, std::function<void()> called)
{
    {
        const std::lock_guard lock(callMutex);
        callContext = context;
        call = std::move(called);
    }
    if (isAsked) {
        callInLoop();
    }
    return true;
}

void endByInterrupt()
{
    if (isAsked) {
        isEnding = true;
        std::fflush(stdout);
        TerminateProcess(GetCurrentProcess(), endedByControl);
    }
}

void endByClosedReader()
{
    UnfinishedFile::remove();
    TerminateProcess(GetCurrentProcess(), kareport::endedByClosedReader);
}

} // namespace kareport
