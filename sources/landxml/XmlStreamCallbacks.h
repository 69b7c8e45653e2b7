#pragma once

#include "Xlate.h"
#include "XmlEncoding.h"
#include "XmlStream.h"

#include <algorithm>
#include <expat.h>

namespace kareport
{

/// What the parser calls. An exception must not pass through it: it is kept until the parser has come back.
struct XmlStream::Callbacks
{
    /// A name of the file for a message, cut short.
    static QString shortName(std::string_view name)
    {
        constexpr std::size_t longest = 200;
        return QString::fromUtf8(name.data(), static_cast<qsizetype>(std::min(name.size(), longest)));
    }

    template <typename Function>
    static void guarded(void *data, const Function &function)
    {
        auto &stream = *static_cast<XmlStream *>(data);
        if (stream.isStopped_) {
            return; // the parser ends what it has begun
        }
        try {
            function(stream);
        } catch (...) {
            stream.thrown_ = std::current_exception();
            stream.stop();
        }
    }

    static void start(void *data, const char *name, const char **attributes)
    {
        guarded(data, [&](XmlStream &stream) { stream.started(name, attributes); });
    }

    static void end(void *data, const char *)
    {
        guarded(data, [](XmlStream &stream) { stream.ended(); });
    }

    static void text(void *data, const char *characters, int count)
    {
        guarded(data, [&](XmlStream &stream) { stream.handler_.text({characters, static_cast<std::size_t>(count)}); });
    }

    static void documentType(void *data, const char *, const char *file, const char *, int)
    {
        if (file != nullptr) {
            guarded(data, [&](XmlStream &stream) {
                stream.fail(
                    stream.currentByte(),
                    Xlate(
                        "the document type is in another file, \"%1\", which is not read: a file without an external document type was expected")
                        .arg(shortName(file)));
            });
        }
    }

    static void entity(void *data, const char *name, int, const char *, int, const char *, const char *, const char *,
                       const char *)
    {
        guarded(data, [&](XmlStream &stream) {
            stream.fail(stream.currentByte(),
                        Xlate("the file declares the entity \"%1\": a file without entities was expected")
                            .arg(shortName(name)));
        });
    }

    static void skippedEntity(void *data, const char *name, int)
    {
        guarded(data, [&](XmlStream &stream) {
            stream.fail(stream.currentByte(), Xlate("the entity \"%1\" is not known").arg(shortName(name)));
        });
    }

    static int encoding(void *, const char *name, XML_Encoding *encoding)
    {
        encoding->data = nullptr;
        encoding->convert = nullptr;
        encoding->release = nullptr;
        return describeWindows1252(name, encoding->map) ? XML_STATUS_OK : XML_STATUS_ERROR;
    }
};

} // namespace kareport
