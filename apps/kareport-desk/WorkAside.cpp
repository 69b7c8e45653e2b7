#include "WorkAside.h"

#include "UXTPMDIFrameWnd.h"
#include "WorkDialog.h"

#include <QEventLoop>
#include <QMetaObject>
#include <QPointer>
#include <QTimer>

#include <chrono>
#include <condition_variable>
#include <mutex>
#include <system_error>
#include <thread>
#include <utility>
#include <vector>

namespace kareport
{

namespace
{

/// Work, and the loop that waits for it.
class Waited : public AsideState
{
public:
    explicit Waited(QEventLoop &loop) : loop_(&loop) {}

    /// The work is done: its thread says so.
    void finish()
    {
        const std::lock_guard lock(mutex_);
        isDone_ = true;
        if (loop_ != nullptr) {
            QMetaObject::invokeMethod(loop_, &QEventLoop::quit, Qt::QueuedConnection);
        }
    }
    bool isDone()
    {
        const std::lock_guard lock(mutex_);
        return isDone_;
    }
    /// Nothing waits for it any more.
    void leave()
    {
        const std::lock_guard lock(mutex_);
        loop_ = nullptr;
    }

private:
    std::mutex mutex_;
    QEventLoop *loop_;
    bool isDone_ = false;
};

/// The work that is waited for now; what was begun last comes last.
std::vector<std::shared_ptr<Waited>> &waited()
{
    static std::vector<std::shared_ptr<Waited>> all;
    return all;
}

/// What is done once nothing waits.
struct Later
{
    QPointer<QObject> context;
    std::function<void()> act;
};

Later &later()
{
    static Later kept;
    return kept;
}

/// The threads that have not ended.
class Threads
{
public:
    void begin()
    {
        const std::lock_guard lock(mutex_);
        ++count_;
    }
    void end()
    {
        const std::lock_guard lock(mutex_);
        --count_;
        ended_.notify_all();
    }
    void wait(std::chrono::milliseconds most)
    {
        std::unique_lock lock(mutex_);
        ended_.wait_for(lock, most, [this] { return count_ == 0; });
    }

private:
    std::mutex mutex_;
    std::condition_variable ended_;
    int count_ = 0;
};

Threads &threads()
{
    static auto *const all = new Threads; // for as long as any of them runs
    return *all;
}

void start(const std::shared_ptr<Waited> &state, std::function<void(AsideState &)> work)
{
    threads().begin();
    auto whole = [state, work = std::move(work)]() mutable {
        work(*state);
        work = {}; // and with it what only the work holds
        state->finish();
        threads().end();
    };
    try {
        // A disk that does not answer any more keeps a thread indefinitely, and nothing waits for that.
        std::thread(whole).detach();
    } catch (const std::system_error &) {
        whole();
    }
}

void waitFor(Waited &state, QEventLoop &loop, const QString &what, UserInput input)
{
    WorkDialog dialog(UXTPMDIFrameWnd::Get(), [&state] { state.stop(); });
    QTimer dueTimer; // shows the dialog in time, and sees that the work was stopped
    QObject::connect(&dueTimer, &QTimer::timeout, &loop, [&] {
        if (state.isStopped() || (input == UserInput::Kept && dialog.isDue())) {
            loop.quit();
        } else if (dialog.isDue()) {
            dialog.show(what, state.percent());
        }
    });
    constexpr int dueInterval = 50; // milliseconds
    dueTimer.start(dueInterval);
    if (input == UserInput::Kept) {
        loop.exec(QEventLoop::ExcludeUserInputEvents);
        input = UserInput::Taken; // from now on by the dialog alone
        if (!state.isDone() && !state.isStopped()) {
            dialog.show(what, state.percent());
        }
    }
    while (!state.isDone() && !state.isStopped()) {
        loop.exec();
    }
}

} // namespace

bool doAside(const QString &what, UserInput input, const std::function<void(AsideState &)> &work)
{
    QEventLoop loop;
    const auto state = std::make_shared<Waited>(loop);
    waited().push_back(state);
    start(state, work);
    waitFor(*state, loop, what, input);
    state->leave();
    std::erase(waited(), state);
    if (waited().empty() && later().act) {
        const Later then = std::exchange(later(), {});
        if (then.context) {
            QMetaObject::invokeMethod(then.context.data(), then.act, Qt::QueuedConnection);
        }
    }
    return !state->isStopped();
}

bool stopWorkAside(QObject *context, const std::function<void()> &then)
{
    for (const auto &state : waited()) {
        state->stop();
    }
    if (waited().empty()) {
        return false;
    }
    later() = {context, then};
    return true;
}

void waitForStoppedWork()
{
    constexpr std::chrono::seconds longest(2);
    threads().wait(longest);
}

} // namespace kareport
