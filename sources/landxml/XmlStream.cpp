#include "XmlStream.h"

#include "Windows1252.h"
#include "Xlate.h"

#include <algorithm>
#include <expat.h>
#include <string>

namespace kareport
{

namespace
{

constexpr std::size_t blockSize = std::size_t(1) << 16;

QString utf8(std::string_view text)
{
    constexpr std::size_t longest = 200;
    return QString::fromUtf8(text.data(), static_cast<qsizetype>(std::min(text.size(), longest)));
}

} // namespace

std::optional<std::string_view> XmlAttributes::find(std::string_view name) const
{
    // Most names differ in their first letter.
    for (const char *const *pair = pairs_; *pair != nullptr; pair += 2) {
        if (**pair == name.front() && name == *pair) {
            return pair[1];
        }
    }
    return std::nullopt;
}

/// What the parser calls. An exception must not pass through it: it is kept until the parser has come back.
struct XmlStream::Callbacks
{
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
                stream.fail(stream.currentByte(),
                            Xlate("the document type is in another file, \"%1\", which is not read: "
                                  "a file that needs no other was expected")
                                .arg(utf8(file)));
            });
        }
    }

    static void entity(void *data, const char *name, int, const char *, int, const char *, const char *, const char *,
                       const char *)
    {
        guarded(data, [&](XmlStream &stream) {
            stream.fail(
                stream.currentByte(),
                Xlate("the file declares the entity \"%1\": a file without entities was expected").arg(utf8(name)));
        });
    }

    static void skippedEntity(void *data, const char *name, int)
    {
        guarded(data, [&](XmlStream &stream) {
            stream.fail(stream.currentByte(), Xlate("the entity \"%1\" is not known").arg(utf8(name)));
        });
    }

    static int encoding(void *, const char *name, XML_Encoding *encoding)
    {
        std::string folded(name);
        std::transform(folded.begin(), folded.end(), folded.begin(), [](char letter) {
            return letter >= 'A' && letter <= 'Z' ? static_cast<char>(letter + 32) : letter;
        });
        if (folded != "windows-1252" && folded != "cp1252") {
            return XML_STATUS_ERROR;
        }
        for (int i = 0; i < 256; ++i) {
            encoding->map[i] = i;
        }
        for (std::size_t i = 0; i < windows1252.size(); ++i) {
            encoding->map[0x80 + i] = windows1252[i] != 0 ? windows1252[i] : -1;
        }
        encoding->data = nullptr;
        encoding->convert = nullptr;
        encoding->release = nullptr;
        return XML_STATUS_OK;
    }
};

XmlStream::XmlStream(std::shared_ptr<const FileBytes> file, XmlHandler &handler)
    : file_(std::move(file)), handler_(handler), parser_(XML_ParserCreate(nullptr))
{
    if (parser_ == nullptr) {
        throw std::bad_alloc();
    }
    XML_SetUserData(parser_, this);
    XML_SetElementHandler(parser_, Callbacks::start, Callbacks::end);
    XML_SetStartDoctypeDeclHandler(parser_, Callbacks::documentType);
    XML_SetEntityDeclHandler(parser_, Callbacks::entity);
    XML_SetSkippedEntityHandler(parser_, Callbacks::skippedEntity);
    XML_SetUnknownEncodingHandler(parser_, Callbacks::encoding, nullptr);
}

XmlStream::~XmlStream()
{
    XML_ParserFree(parser_);
}

std::size_t XmlStream::currentByte() const
{
    const XML_Index index = XML_GetCurrentByteIndex(parser_);
    return index < 0 ? 0 : static_cast<std::size_t>(index);
}

void XmlStream::stop()
{
    isStopped_ = true;
    XML_StopParser(parser_, XML_FALSE);
}

void XmlStream::fail(std::size_t byte, const QString &text)
{
    if (!error_) {
        error_ = InputError{file_->path(), FilePlaces(*file_).of(byte), text};
    }
    stop();
}

bool XmlStream::readSome()
{
    const std::string_view bytes = file_->view();
    if (isStopped_ || error_ || (position_ == bytes.size() && position_ > 0)) {
        return false;
    }
    const std::string_view block = bytes.substr(position_, blockSize);
    position_ += block.size();
    const bool isLast = position_ == bytes.size();
    const auto status = XML_Parse(parser_, block.data(), static_cast<int>(block.size()), isLast ? 1 : 0);
    if (thrown_) {
        std::rethrow_exception(thrown_);
    }
    file_->release(position_ - block.size());
    if (status == XML_STATUS_ERROR) {
        failParsing();
        return false;
    }
    // A tag that does not end is looked through again with every block.
    if (!isLast && position_ - currentByte() > longestTag) {
        error_ = InputError{file_->path(), FilePlaces(*file_).of(currentByte()),
                            Xlate("the tag has more than %1 bytes").arg(longestTag)};
    }
    return !isLast && !error_;
}

void XmlStream::failParsing()
{
    if (error_ || isStopped_) {
        return;
    }
    const XML_Error code = XML_GetErrorCode(parser_);
    if (code == XML_ERROR_NO_MEMORY) {
        throw std::bad_alloc();
    }
    QString text = Xlate("the file is not well-formed XML: %1").arg(QString::fromUtf8(XML_ErrorString(code)));
    if (code == XML_ERROR_UNKNOWN_ENCODING) {
        text = Xlate(
            "the encoding of the file is not known: UTF-8, UTF-16, ISO-8859-1, US-ASCII or windows-1252 was expected");
    }
    error_ = InputError{file_->path(), FilePlaces(*file_).of(currentByte()), text};
}

void XmlStream::started(const char *name, const char *const *attributes)
{
    if (++depth_ > deepest) {
        fail(currentByte(), Xlate("the elements are nested more than %1 deep").arg(deepest));
        return;
    }
    if (leftOutFrom_ != 0) {
        return;
    }
    wantText(false);
    const XmlAttributes found(attributes);
    vocabulary_.begin(name, attributes, depth_);
    if (!vocabulary_.has(name)) {
        handler_.foreignElement(name);
        leftOutFrom_ = depth_;
        return;
    }
    const auto interest = handler_.startElement(XmlVocabulary::withoutPrefix(name), found);
    wantText(interest == XmlHandler::Interest::Text);
    textWanted_.set(static_cast<std::size_t>(depth_), wantsText_);
    if (interest == XmlHandler::Interest::None) {
        leftOutFrom_ = depth_;
    }
}

void XmlStream::ended()
{
    if (leftOutFrom_ == 0) {
        handler_.endElement();
    } else if (leftOutFrom_ == depth_) {
        leftOutFrom_ = 0;
    }
    vocabulary_.end(depth_);
    --depth_;
    // The text after an element belongs to the one around it.
    wantText(leftOutFrom_ == 0 && textWanted_.test(static_cast<std::size_t>(depth_)));
}

/// Has the parser tell text or leave it out: most text of a file belongs to elements of which nothing is wanted.
void XmlStream::wantText(bool isWanted)
{
    if (isWanted != wantsText_) {
        wantsText_ = isWanted;
        XML_SetCharacterDataHandler(parser_, isWanted ? Callbacks::text : nullptr);
    }
}

} // namespace kareport
