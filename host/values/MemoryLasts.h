#pragma once

#include <new>

namespace kareport
{

// Not all of Qt 6.4 throws when memory runs out. QHash and QSet end the program, as what grows them may not throw; a
// QList that is made of its members in braces writes through null; fonts and text documents do not look either. The
// module's own data is kept in what does throw: the standard library's containers, QString, QByteArray, and lists that
// are appended to.

/// Does work that needs memory: the one place where a lack of it, which Qt and the standard library throw, becomes an
/// answer. The work must leave what it changes usable wherever it fails.
/// @return what the work answers, or `otherwise` when memory runs out
template <typename Answer, typename Work>
Answer whileMemoryLasts(Answer otherwise, Work work)
{
    try {
        return work();
    } catch (const std::bad_alloc &) {
        return otherwise;
    }
}

/// The same for work without an answer. @return whether it was done
template <typename Work>
bool doneWhileMemoryLasts(Work work)
{
    return whileMemoryLasts(false, [&work] {
        work();
        return true;
    });
}

} // namespace kareport
