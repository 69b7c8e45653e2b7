#include "JobReader.h"

#include <cstddef>
#include <cstdint>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    const QByteArray bytes(reinterpret_cast<const char *>(data), static_cast<qsizetype>(size));
    auto source = kareport::JsonSource::fromBytes(QStringLiteral("fuzz.json"), bytes);
    if (auto *read = std::get_if<kareport::JsonSource>(&source)) {
        kareport::readJob(*read);
        if (read->error()) {
            read->error()->message();
        }
    }
    return 0;
}
