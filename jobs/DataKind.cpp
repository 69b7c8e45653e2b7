#include "DataKind.h"

#include "Xlate.h"

namespace kareport
{

ReadProgress DataRequest::beginReading(const QString &name, std::size_t total) const
{
    progress.begin(Xlate("Reading %1").arg(name), total);
    return [&progress = progress, &isStopped = isStopped](std::size_t done) {
        progress.advance(done);
        return !isStopped();
    };
}

InputError DataRequest::errorAt(const QString &key, const QString &text) const
{
    JsonPath place = path;
    place.emplace_back(key);
    return source.errorAt(place, text);
}

} // namespace kareport
