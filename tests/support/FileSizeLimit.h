#pragma once

#include <QtGlobal>

#include <memory>

/// Lets writing to any file fail after so many bytes, as a full disk does. For a moment only: it holds for the whole
/// process.
class FileSizeLimit
{
public:
    explicit FileSizeLimit(quint64 bytes);
    ~FileSizeLimit();
    FileSizeLimit(const FileSizeLimit &) = delete;
    FileSizeLimit &operator=(const FileSizeLimit &) = delete;

private:
    struct Usual;

    std::unique_ptr<Usual> usual_;
};
