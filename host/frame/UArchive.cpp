#include "UArchive.h"

UArchive::UArchive(QIODevice &device, Mode mode, QString path) : device_(device), mode_(mode), path_(std::move(path)) {}

void UArchive::Write(QByteArrayView bytes)
{
    good_ = good_ && device_.write(bytes.data(), bytes.size()) == bytes.size();
}
