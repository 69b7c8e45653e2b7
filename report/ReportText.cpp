#include "ReportText.h"

#include <QString>

#include <algorithm>
#include <new>

namespace kareport
{

namespace
{

bool isLatin1(QStringView text)
{
    unsigned all = 0;
    for (const char16_t *at = text.utf16(), *end = at + text.size(); at != end; ++at) {
        all |= *at;
    }
    return all <= 0xFF;
}

} // namespace

ReportText::ReportText(Reallocate reallocate)
    : narrow_(reallocate != nullptr ? reallocate : std::realloc),
      wide_(reallocate != nullptr ? reallocate : std::realloc)
{
    if (!narrow_.reserve(1)) {
        throw std::bad_alloc();
    }
}

const char16_t *ReportText::data() const
{
    return widen() ? wide_.data() : u"";
}

QStringView ReportText::view() const
{
    return widen() ? QStringView(wide_.data(), wide_.size()) : QStringView(u"");
}

QLatin1StringView ReportText::narrowView() const
{
    settle();
    return {reinterpret_cast<const char *>(narrow_.data()), isNarrow_ ? narrow_.size() : 0};
}

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

bool ReportText::widen() const
{
    settle();
    if (!isNarrow_) {
        return true;
    }
    if (!wide_.reserve(std::max<qint64>(narrow_.size(), 1))) {
        return false;
    }
    std::copy_n(narrow_.data(), narrow_.size(), wide_.data());
    wide_.setSize(narrow_.size());
    narrow_.clear(false);
    isNarrow_ = false;
    return true;
}

bool ReportText::owns(QStringView text) const
{
    return !isNarrow_ && wide_.holds(text.utf16());
}

bool ReportText::owns(QLatin1StringView text) const
{
    return isNarrow_ && narrow_.holds(reinterpret_cast<const unsigned char *>(text.data()));
}

bool ReportText::append(QLatin1StringView text)
{
    settle();
    if (size() + text.size() > longest) {
        return false;
    }
    if (owns(text)) {
        return append(QStringView(QString(text)));
    }
    if (!reserve(size() + text.size())) {
        return false;
    }
    const auto *bytes = reinterpret_cast<const unsigned char *>(text.data());
    if (isNarrow_) {
        std::copy_n(bytes, text.size(), narrow_.data() + narrow_.size());
        narrow_.setSize(narrow_.size() + text.size());
    } else {
        std::copy_n(bytes, text.size(), wide_.data() + wide_.size());
        wide_.setSize(wide_.size() + text.size());
    }
    return true;
}

bool ReportText::append(QStringView text)
{
    settle();
    if (size() + text.size() > longest) {
        return false;
    }
    if (owns(text)) {
        return append(text.toString());
    }
    if (isNarrow_ && !isLatin1(text) && !widen()) {
        return false;
    }
    if (!reserve(size() + text.size())) {
        return false;
    }
    if (isNarrow_) {
        std::transform(text.utf16(), text.utf16() + text.size(), narrow_.data() + narrow_.size(),
                       [](char16_t character) { return static_cast<unsigned char>(character); });
        narrow_.setSize(narrow_.size() + text.size());
    } else {
        std::copy_n(text.utf16(), text.size(), wide_.data() + wide_.size());
        wide_.setSize(wide_.size() + text.size());
    }
    return true;
}

bool ReportText::appendLineEnd()
{
    settle();
    const qint64 end = size();
    if (!reserve(end + 3)) {
        return false;
    }
    if (isNarrow_) {
        narrow_.data()[end] = '\r';
        narrow_.data()[end + 1] = '\n';
        narrow_.setSize(end + 2);
    } else {
        wide_.data()[end] = u'\r';
        wide_.data()[end + 1] = u'\n';
        wide_.setSize(end + 2);
    }
    return true;
}

bool ReportText::assign(QStringView text)
{
    const QString copy = text.toString(); // it may be a piece of this very text
    drain();
    return append(copy);
}

bool ReportText::replace(qint64 at, qint64 removed, QStringView inserted)
{
    if (at < 0 || removed < 0 || at > size() || removed > size() - at) {
        return false;
    }
    if (owns(inserted)) {
        return replace(at, removed, inserted.toString());
    }
    if (isNarrow_ && !isLatin1(inserted) && !widen()) {
        return false;
    }
    // The room is got now: carrying the edits out later cannot fail.
    const qint64 kept = size() - pending_.growth();
    if (inserted.size() <= longestPending && reserve(kept + pending_.inserted() + inserted.size())) {
        pending_.replace(at, removed, inserted);
        if (pending_.edits().size() > mostPending) {
            settle();
        }
        return true;
    }
    settle();
    return replaceNow(at, removed, inserted);
}

QString ReportText::piece(qint64 at, qint64 length) const
{
    QString copy;
    if (at < 0 || length <= 0 || at > size() || length > size() - at) {
        return copy;
    }
    copy.reserve(length);
    const qint64 end = at + length;
    const auto addKept = [&](qint64 from, qint64 to) {
        if (isNarrow_) {
            copy += QLatin1StringView(reinterpret_cast<const char *>(narrow_.data()) + from, to - from);
        } else {
            copy += QStringView(wide_.data() + from, to - from);
        }
    };
    // The text is what is kept, up to each edit that has not been carried out, and what that edit has inserted.
    qint64 kept = 0;
    qint64 place = 0;
    const auto addPart = [&](qint64 partLength, auto add) {
        const qint64 from = std::max(at, place);
        const qint64 to = std::min(end, place + partLength);
        if (from < to) {
            add(from - place, to - place);
        }
        place += partLength;
    };
    const auto addKeptUpTo = [&](qint64 stop) {
        addPart(stop - kept, [&](qint64 from, qint64 to) { addKept(kept + from, kept + to); });
        kept = stop;
    };
    for (const PendingEdits::Edit &edit : pending_.edits()) {
        addKeptUpTo(edit.at);
        addPart(edit.inserted.size(),
                [&](qint64 from, qint64 to) { copy += QStringView(edit.inserted).sliced(from, to - from); });
        kept = edit.at + edit.removed;
    }
    addKeptUpTo(size() - pending_.growth());
    return copy;
}

void ReportText::drain()
{
    pending_.clear();
    (isNarrow_ ? narrow_.setSize(0) : wide_.setSize(0));
}

void ReportText::clear()
{
    pending_.clear();
    // The narrow block comes first, so that there is a block also when no other can be had.
    if (!isNarrow_ && narrow_.reserve(1)) {
        wide_.clear(false);
        isNarrow_ = true;
    }
    (isNarrow_ ? narrow_.clear(true) : wide_.clear(true));
}

} // namespace kareport
