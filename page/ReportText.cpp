#include "ReportText.h"

#include "Characters.h"

#include <QString>

#include <algorithm>
#include <new>

namespace kareport
{

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

void ReportText::swap(ReportText &other) noexcept
{
    narrow_.swap(other.narrow_);
    wide_.swap(other.wide_);
    std::swap(isNarrow_, other.isNarrow_);
    std::swap(pending_, other.pending_);
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
    const auto *bytes = reinterpret_cast<const unsigned char *>(text.data());
    // Growing may move the text that the piece is a piece of.
    const qint64 own = owns(text) ? bytes - narrow_.data() : -1;
    if (size() + text.size() > longest || !reserve(size() + text.size())) {
        return false;
    }
    if (isNarrow_) {
        unsigned char *end = narrow_.data() + narrow_.size();
        std::copy_n(own >= 0 ? narrow_.data() + own : bytes, text.size(), end);
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
    if (size() + text.size() > longest || (isNarrow_ && !isLatin1(text) && !widen())) {
        return false;
    }
    const qint64 own = owns(text) ? text.utf16() - wide_.data() : -1;
    if (!reserve(size() + text.size())) {
        return false;
    }
    if (isNarrow_) {
        std::transform(text.utf16(), text.utf16() + text.size(), narrow_.data() + narrow_.size(),
                       [](char16_t character) { return static_cast<unsigned char>(character); });
        narrow_.setSize(narrow_.size() + text.size());
    } else {
        char16_t *end = wide_.data() + wide_.size();
        std::copy_n(own >= 0 ? wide_.data() + own : text.utf16(), text.size(), end);
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

QString ReportText::piece(qint64 at, qint64 length) const
{
    QString copy;
    if (at < 0 || length <= 0 || at > size() || length > size() - at) {
        return copy;
    }
    copy.reserve(length);
    qint64 begin = 0;
    forEachPiece([&](auto part) {
        const qint64 from = std::max(at, begin);
        const qint64 to = std::min(at + length, begin + part.size());
        if (from < to) {
            copy += part.sliced(from - begin, to - from);
        }
        begin += part.size();
    });
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
    // The narrow block comes first, so that there is a block even if no other can be allocated.
    if (!isNarrow_ && narrow_.reserve(1)) {
        wide_.clear(false);
        isNarrow_ = true;
    }
    (isNarrow_ ? narrow_.clear(true) : wide_.clear(true));
}

} // namespace kareport
