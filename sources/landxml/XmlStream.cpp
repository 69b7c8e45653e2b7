#include "XmlStream.h"

#include "Xlate.h"
#include "XmlStreamCallbacks.h"

#include <algorithm>
#include <expat.h>
#include <string>

namespace kareport
{

namespace
{

constexpr std::size_t blockSize = std::size_t(1) << 16;

/// Whether names of a few letters are the same, faster than by their lengths.
bool isSame(const std::string &known, const char *name)
{
    const char *character = known.c_str();
    while (*character != '\0' && *character == *name) {
        ++character;
        ++name;
    }
    return *character == *name;
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
    // A tag that does not end is searched again with every block.
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
        if (isLeftOutTold_) {
            countLeftOut(name);
        }
        return;
    }
    wantText(false);
    const XmlAttributes found(attributes);
    vocabulary_.begin(name, attributes, depth_);
    if (!vocabulary_.has(name)) {
        handler_.foreignElement(name);
        leaveOut(true, true);
        return;
    }
    const auto interest = handler_.startElement(XmlVocabulary::withoutPrefix(name), found);
    wantText(interest == XmlHandler::Interest::Text);
    textWanted_.set(static_cast<std::size_t>(depth_), wantsText_);
    if (interest <= XmlHandler::Interest::LeftOut) {
        leaveOut(interest == XmlHandler::Interest::LeftOut, false);
    }
}

/// Leaves out all that is in the current element. @param isTold  but for the names of its elements
void XmlStream::leaveOut(bool isTold, bool isForeign)
{
    leftOutFrom_ = depth_;
    isLeftOutTold_ = isTold;
    isLeftOutForeign_ = isForeign;
}

void XmlStream::ended()
{
    if (leftOutFrom_ != 0 && depth_ > leftOutFrom_) {
        --depth_; // nothing was begun with it
        return;
    }
    if (leftOutFrom_ == 0) {
        handler_.endElement();
    } else {
        leftOutFrom_ = 0;
        tellLeftOut();
    }
    vocabulary_.end(depth_);
    --depth_;
    // The text after an element belongs to the one around it.
    wantText(leftOutFrom_ == 0 && textWanted_.test(static_cast<std::size_t>(depth_)));
}

/// Counts an element in one that is left out. Millions of one name follow each other in a large file.
void XmlStream::countLeftOut(const char *name)
{
    if (!isSame(leftOutName_, name)) {
        tellLeftOut();
        leftOutName_ = name;
    }
    ++leftOutCount_;
}

void XmlStream::tellLeftOut()
{
    if (leftOutCount_ > 0) {
        const std::string_view name = leftOutName_;
        handler_.leftOutElements(isLeftOutForeign_ ? name : XmlVocabulary::withoutPrefix(name), leftOutCount_);
        leftOutCount_ = 0;
    }
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
