#include "ReportText.h"

#include <algorithm>
#include <cstdlib>
#include <new>

namespace kareport
{

ReportText::ReportText(Reallocate reallocate) : reallocate_(reallocate != nullptr ? reallocate : std::realloc)
{
    if (!grow(1)) {
        throw std::bad_alloc();
    }
}

ReportText::~ReportText()
{
    std::free(data_);
}

bool ReportText::allocate(qint64 characters)
{
    const auto bytes = static_cast<std::size_t>(characters + 1) * sizeof(char16_t);
    void *memory = reallocate_(data_, bytes);
    if (memory == nullptr) {
        return false;
    }
    data_ = static_cast<char16_t *>(memory);
    allocated_ = characters;
    return true;
}

bool ReportText::grow(qint64 characters)
{
    if (characters > longest) {
        return false;
    }
    const qint64 counted = (characters + blockSize - 1) / blockSize * blockSize;
    // With little memory left, what is asked for is enough.
    if (counted > allocated_ && !allocate(std::max(counted, allocated_ * 2)) && !allocate(counted)) {
        return false;
    }
    const qint64 firstNew = data_ == nullptr || usable_ == 0 ? 0 : usable_ + 1;
    std::fill(data_ + firstNew, data_ + counted + 1, u'\0');
    usable_ = counted;
    return true;
}

bool ReportText::append(QStringView text)
{
    if (!reserve(size_ + text.size())) {
        return false;
    }
    std::copy_n(text.utf16(), text.size(), data_ + size_);
    size_ += text.size();
    data_[size_] = u'\0';
    return true;
}

bool ReportText::appendLineEnd()
{
    if (!reserve(size_ + 3)) {
        return false;
    }
    data_[size_++] = u'\r';
    data_[size_++] = u'\n';
    data_[size_] = u'\0';
    return true;
}

bool ReportText::assign(QStringView text)
{
    size_ = 0;
    data_[0] = u'\0';
    return append(text);
}

void ReportText::clear()
{
    size_ = 0;
    usable_ = 0;
    // A smaller block always fits; where the system would not shrink it, the larger one stays.
    if (allocated_ > blockSize) {
        allocate(blockSize);
    }
    grow(1);
}

} // namespace kareport
