#pragma once

#include <QString>
#include <QTemporaryDir>

#include <optional>

class QPrinter;

namespace kareport
{

/// Where the pages of one job go. A job into a file is written elsewhere first and put into the file's place when it is
/// whole; of a job into a queue it is known whether the queue has taken it.
class PrintTarget
{
public:
    /// Before the painter begins. The printer must outlive the object.
    explicit PrintTarget(QPrinter &printer);
    ~PrintTarget();
    PrintTarget(const PrintTarget &) = delete;
    PrintTarget &operator=(const PrintTarget &) = delete;

    /// After the painter has ended. @return whether the pages are where they belong
    bool commit();
    /// Discards the pages.
    void discard();
    /// Whether the pages go to a printer's queue: not into a file, nor to a preview.
    bool isQueue() const { return isQueue_; }
    /// What the system says about a failure; may be empty.
    const QString &error() const { return error_; }

private:
    bool isIntoFile() const { return folder_.has_value(); }

    QPrinter &printer_;
    QString file_;
    bool isQueue_;
    std::optional<QTemporaryDir> folder_;
    QString error_;
};

} // namespace kareport
