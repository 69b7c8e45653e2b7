#pragma once

#include <QString>

#include <atomic>
#include <functional>
#include <memory>

class QObject;

namespace kareport
{

/// What work on another thread and the code that waits for it share.
class AsideState
{
public:
    /// Whether the work is to end, because nothing waits for it any more.
    bool isStopped() const { return isStopped_; }
    void stop() { isStopped_ = true; }
    /// How far the work has come.
    int percent() const { return percent_; }
    void setPercent(int percent) { percent_ = percent; }

private:
    std::atomic<bool> isStopped_ = false;
    std::atomic<int> percent_ = 0;
};

/// Whether the user may use the windows while the work is not shown yet.
enum class UserInput
{
    Taken,
    Kept ///< for later
};

/// Does work on another thread while the windows answer. When it takes longer than a moment it is shown, and the user can
/// stop it. If no other thread can be started, the work is done on this one.
/// @param what  the text that is shown for the work
/// @param work  must own all that it touches, and let no exception out: when it is stopped, nothing waits for its end
/// @return false when it was stopped
bool doAside(const QString &what, UserInput input, const std::function<void(AsideState &)> &work);

/// Stops all work that is being waited for. @param then  is done from the event loop, once nothing waits any more; not when
/// the context has been destroyed by then
/// @return false, with `then` forgotten, when there is no work
bool stopWorkAside(QObject *context, const std::function<void()> &then);

/// Waits for the end of what was stopped, so that the program does not end under it. Work that waits for a disk which
/// does not answer is left alone.
void waitForStoppedWork();

} // namespace kareport
