#pragma once

#include <QElapsedTimer>
#include <QString>

#include <cstddef>

namespace kareport
{

/// Is notified how far long work has come. A derived class decides how to show that; this one shows nothing.
class Progress
{
public:
    explicit Progress(bool shown) : shown_(shown) {}
    virtual ~Progress() = default;
    Progress(const Progress &) = delete;
    Progress &operator=(const Progress &) = delete;

    /// A text before all that is shown, for work that is one of many. Many short works do not flicker then: what each
    /// begins with is shown a few times a second as well.
    void setPrefix(const QString &prefix) { prefix_ = prefix; }
    /// Begins a piece of work. @param total  what `advance` counts to; 0 when that is not known
    void begin(const QString &what, std::size_t total);
    /// Shows how much is done, a few times a second at most.
    void advance(std::size_t done);
    /// The same for work whose amount shows only on the way.
    void advance(std::size_t done, std::size_t total);
    /// Ends a piece of work.
    virtual void finish() {}

protected:
    virtual void show(std::size_t /*done*/) {}
    const QString &prefix() const { return prefix_; }
    const QString &what() const { return what_; }
    std::size_t total() const { return total_; }

private:
    bool shown_;
    QString prefix_;
    QString what_;
    std::size_t total_ = 0;
    QElapsedTimer sinceShown_;
};

} // namespace kareport
