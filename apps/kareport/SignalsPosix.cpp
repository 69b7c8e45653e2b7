#include "Signals.h"

#include "Interrupt.h"
#include "TerminalProgress.h"
#include "UnfinishedFile.h"

#include <QSocketNotifier>

#include <atomic>
#include <csignal>
#include <ctime>
#include <fcntl.h>
#include <initializer_list>
#include <string_view>
#include <unistd.h>
#include <utility>

namespace kareport
{

namespace
{

constexpr long patience = 200'000'000; ///< nanoseconds that work has for coming to a safe point

std::atomic<int> interruptingSignal{0};
std::atomic<bool> hasPatienceTimer{false};
timer_t patienceTimer;
std::atomic<int> interruptPipe{-1}; ///< the end that is written to

// What a handler uses must be free of locks.
static_assert(std::atomic<bool>::is_always_lock_free && std::atomic<int>::is_always_lock_free);

void endBy(int signal)
{
    std::signal(signal, SIG_DFL);
    sigset_t signals;
    sigemptyset(&signals);
    sigaddset(&signals, signal);
    pthread_sigmask(SIG_UNBLOCK, &signals, nullptr);
    raise(signal);
}

void say(std::string_view text)
{
    [[maybe_unused]] const ssize_t written = write(STDERR_FILENO, text.data(), text.size());
}

void endAtOnce(int signal)
{
    UnfinishedFile::remove();
    say(isProgressShown() ? "\nkareport: stopped; no output is half written\n"
                          : "kareport: stopped; no output is half written\n");
    endBy(signal);
}

extern "C" void noteInterrupt(int signal)
{
    int none = 0;
    if (!interruptingSignal.compare_exchange_strong(none, signal) || !hasPatienceTimer) {
        endAtOnce(signal);
    }
    setInterrupted(true);
    if (interruptPipe >= 0) {
        [[maybe_unused]] const ssize_t written = write(interruptPipe, "", 1);
    }
    const itimerspec once = {{0, 0}, {0, patience}};
    timer_settime(patienceTimer, 0, &once, nullptr);
}

extern "C" void endImpatiently(int /*signal*/)
{
    endAtOnce(interruptingSignal);
}

extern "C" void endForClosedReader(int signal)
{
    UnfinishedFile::remove();
    endBy(signal);
}

/// Without restarting, so that a blocked call ends.
void handle(int signal, void (*handler)(int))
{
    struct sigaction action = {};
    sigaction(signal, nullptr, &action);
    if (action.sa_handler == SIG_IGN) {
        return;
    }
    action = {};
    action.sa_handler = handler;
    sigaction(signal, &action, nullptr);
}

} // namespace

void catchInterrupts()
{
    sigevent event = {};
    event.sigev_notify = SIGEV_SIGNAL;
    event.sigev_signo = SIGALRM;
    std::signal(SIGALRM, endImpatiently);
    hasPatienceTimer = hasPatienceTimer || timer_create(CLOCK_MONOTONIC, &event, &patienceTimer) == 0;
    for (const int signal : {SIGINT, SIGTERM, SIGHUP}) {
        handle(signal, noteInterrupt);
    }
    handle(SIGPIPE, endForClosedReader);
}

bool callOnInterrupt(QObject *context, std::function<void()> called)
{
    int ends[2];
    if (pipe2(ends, O_CLOEXEC | O_NONBLOCK) != 0) {
        return false;
    }
    interruptPipe = ends[1]; // both stay open
    if (interruptingSignal != 0) {
        [[maybe_unused]] const ssize_t written = write(interruptPipe, "", 1);
    }
    auto *const notifier = new QSocketNotifier(ends[0], QSocketNotifier::Read, context);
    QObject::connect(notifier, &QSocketNotifier::activated, notifier, std::move(called));
    return true;
}

void endByInterrupt()
{
    if (interruptingSignal != 0) {
        endBy(interruptingSignal);
    }
}

void endByClosedReader()
{
    struct sigaction action = {};
    sigaction(SIGPIPE, nullptr, &action);
    if (action.sa_handler != SIG_IGN) {
        endForClosedReader(SIGPIPE);
    }
}

} // namespace kareport
