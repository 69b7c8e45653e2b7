#include "ReportText.h"

#include <QString>

#include <algorithm>
#include <functional>
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
    return {reinterpret_cast<const char *>(narrow_.data()), isNarrow_ ? narrow_.size() : 0};
}

bool ReportText::widen() const
{
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
    const char16_t *begin = text.utf16();
    return !isNarrow_ && std::less_equal<>()(wide_.data(), begin) && std::less<>()(begin, wide_.data() + wide_.size());
}

bool ReportText::append(QStringView text)
{
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
    (isNarrow_ ? narrow_.setSize(0) : wide_.setSize(0));
    return append(copy);
}

void ReportText::clear()
{
    // The narrow block comes first, so that there is a block also when no other can be had.
    if (!isNarrow_ && narrow_.reserve(1)) {
        wide_.clear(false);
        isNarrow_ = true;
    }
    (isNarrow_ ? narrow_.clear(true) : wide_.clear(true));
}

} // namespace kareport
