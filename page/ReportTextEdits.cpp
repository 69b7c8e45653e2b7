#include "ReportText.h"

#include "Characters.h"
#include "MemoryLasts.h"

#include <QString>

namespace kareport
{

bool ReportText::replaceNow(qint64 at, qint64 removed, QStringView inserted) const
{
    return isNarrow_ ? narrow_.replace(at, removed, inserted.utf16(), inserted.size())
                     : wide_.replace(at, removed, inserted.utf16(), inserted.size());
}

void ReportText::carryOutPending() const
{
    // In the order of their places, so that the text is moved once for all of them.
    qint64 shift = 0;
    for (const PendingEdits::Edit &edit : pending_.edits()) {
        replaceNow(edit.at + shift, edit.removed, edit.inserted);
        shift += edit.inserted.size() - edit.removed;
    }
    pending_.clear();
}

void ReportText::truncate(qint64 size)
{
    settle();
    if (isNarrow_) {
        narrow_.data(); // in one piece
        narrow_.setSize(size);
    } else {
        wide_.data();
        wide_.setSize(size);
    }
}

bool ReportText::assign(QStringView text)
{
    if (owns(text)) {
        const qint64 begin = text.utf16() - wide_.data();
        truncate(begin + text.size());
        return replaceNow(0, begin, {});
    }
    drain();
    return append(text);
}

bool ReportText::replace(qint64 at, qint64 removed, QStringView inserted)
{
    if (at < 0 || removed < 0 || at > size() || removed > size() - at) {
        return false;
    }
    if (owns(inserted)) {
        const QString copy = whileMemoryLasts(QString(), [inserted] { return inserted.toString(); });
        return copy.size() == inserted.size() && replace(at, removed, copy);
    }
    if (isNarrow_ && !isLatin1(inserted) && !widen()) {
        return false;
    }
    if (replaceLater(at, removed, inserted)) {
        return true;
    }
    settle();
    return replaceNow(at, removed, inserted);
}

/// Keeps a replacement among those that are carried out when the text is next read. @return false, changing nothing, when
/// it is too long for that or there is no memory
bool ReportText::replaceLater(qint64 at, qint64 removed, QStringView inserted)
{
    // The memory is reserved now: carrying the edits out later cannot fail.
    const qint64 kept = size() - pending_.growth();
    if (inserted.size() > longestPending || !reserve(kept + pending_.inserted() + inserted.size()) ||
        !doneWhileMemoryLasts([&] { pending_.replace(at, removed, inserted); }))
    {
        return false;
    }
    if (pending_.edits().size() > mostPending) {
        settle();
    }
    return true;
}

} // namespace kareport
