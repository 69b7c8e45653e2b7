#include "SpooledBytes.h"

#include "Xlate.h"

namespace kareport
{

bool SpooledBytes::flush()
{
    if (!file_) {
        file_ = std::make_unique<QTemporaryFile>();
    }
    const auto size = static_cast<qint64>(buffer_.size());
    const bool isWritten =
        (file_->isOpen() || file_->open()) && file_->write(buffer_.data(), size) == size && file_->flush();
    written_ += buffer_.size();
    buffer_.clear();
    return isWritten;
}

bool SpooledBytes::finish()
{
    if (!file_) {
        view_ = buffer_;
        return true;
    }
    if (!flush()) {
        return false;
    }
    mapped_ = std::make_unique<MappedFile>();
    if (mapped_->map(file_->handle(), written_)) {
        view_ = mapped_->view();
        return true;
    }
    const auto *bytes = reinterpret_cast<const char *>(file_->map(0, static_cast<qint64>(written_)));
    view_ = {bytes, bytes != nullptr ? written_ : 0};
    return bytes != nullptr;
}

void SpooledBytes::release(std::size_t begin, std::size_t end) const
{
    if (mapped_) {
        mapped_->release(begin, end);
    }
}

QString SpooledBytes::wrong() const
{
    return Xlate("the data cannot be kept in a temporary file: %1").arg(file_ ? file_->errorString() : QString());
}

} // namespace kareport
