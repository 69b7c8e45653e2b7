#include "JobReader.h"

#include <cstddef>
#include <cstdint>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    const QByteArray bytes(reinterpret_cast<const char *>(data), static_cast<qsizetype>(size));
    const auto source = kareport::JsonSource::fromBytes(QStringLiteral("fuzz.json"), bytes);
    // What the command line sets may be anything as well.
    kareport::JsonSource empty = kareport::JsonSource::fromObject({});
    const QString text = QString::fromUtf8(bytes);
    const qsizetype equals = text.indexOf(u'=');
    empty.set(text.left(equals), text.sliced(equals + 1));
    kareport::readJob(empty);
    if (const auto *read = std::get_if<kareport::JsonSource>(&source)) {
        const auto job = kareport::readJob(*read);
        if (const kareport::InputError *error = kareport::errorOf(job)) {
            error->message();
        }
    }
    return 0;
}
