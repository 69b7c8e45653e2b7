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
    /// Says how many pieces of work follow, so that it can be told how much of all the work is done. One, unless said.
    void expectPieces(std::size_t count);
    /// The same for the pieces of work that is one of many. @param number  which of them it is, from 0
    void beginShare(std::size_t number, std::size_t count);
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
    bool isShown() const { return shown_; }
    /// How much of all the work is done when `done` of this piece is, from 0 to 1. It is never less than it was.
    double partOfAll(std::size_t done);
    const QString &prefix() const { return prefix_; }
    const QString &what() const { return what_; }
    std::size_t total() const { return total_; }

private:
    bool shown_;
    QString prefix_;
    QString what_;
    std::size_t total_ = 0;
    std::size_t pieces_ = 1; ///< that are expected
    std::size_t begun_ = 0;  ///< of these
    std::size_t share_ = 0;
    std::size_t shares_ = 1;
    double furthest_ = 0;
    QElapsedTimer sinceShown_;
};

} // namespace kareport
