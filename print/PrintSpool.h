#pragma once

#include <QString>

namespace kareport
{

/// What the system's print queue has to say about a job, where the system has one that can be asked: QPrinter hands a job
/// on without looking at the answer.
class PrintSpool
{
public:
    /// Why the last job of this thread was not taken; empty when it was, or when nothing is known.
    static QString lastError();
    /// Keeps what is handed on while the object lives from arriving: a job that has been given up would otherwise be sent
    /// as far as it has come.
    class Closed
    {
    public:
        Closed();
        ~Closed();
        Closed(const Closed &) = delete;
        Closed &operator=(const Closed &) = delete;
    };
};

} // namespace kareport
