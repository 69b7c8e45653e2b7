#pragma once

#include "FileBytes.h"
#include "FilePlaces.h"
#include "InputError.h"
#include "XmlVocabulary.h"

#include <QString>

#include <bitset>
#include <exception>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

struct XML_ParserStruct;

namespace kareport
{

/// The attributes of an element, valid until `startElement` returns.
class XmlAttributes
{
public:
    /// @param pairs  names and values in order, with a null at the end
    explicit XmlAttributes(const char *const *pairs) : pairs_(pairs) {}

    /// The value of an attribute; nothing where the element has none of the name. Names with a prefix are found with it.
    /// @param name  not empty
    std::optional<std::string_view> find(std::string_view name) const;
    /// The value, or an empty text.
    std::string_view text(std::string_view name) const { return find(name).value_or(std::string_view()); }
    const char *const *pairs() const { return pairs_; }

private:
    const char *const *pairs_;
};

/// What an `XmlStream` tells of a file.
class XmlHandler
{
public:
    enum class Interest
    {
        None,    ///< nothing of what is in the element
        LeftOut, ///< the names of all elements in it, by `leftOutElements`
        Parts,   ///< the elements in it
        Text     ///< the text in it as well
    };

    virtual ~XmlHandler() = default;
    /// @param name  without its prefix. @return what is to be told of the inside. An element of which nothing is wanted is
    ///              not ended either
    virtual Interest startElement(std::string_view name, const XmlAttributes &attributes) = 0;
    virtual void endElement() = 0;
    /// A piece of text in the innermost element. There may be elements between two pieces.
    virtual void text(std::string_view piece) = 0;
    /// An element of another vocabulary, which is left out with all in it. @param name  with its prefix
    virtual void foreignElement(std::string_view name) = 0;
    /// Elements of one name that follow each other in one that is left out, however deep.
    /// @param name  with the prefix of another vocabulary
    virtual void leftOutElements(std::string_view name, std::size_t count) = 0;
};

/// Reads an XML file from start to end in one pass, without a document in memory. What belongs to the vocabulary of the
/// outermost element is reported, whatever its prefix is.
///
/// No other file is ever opened. A file that declares entities, or whose document type is in another file, is refused: files
/// that programs exchange need neither, and entities can make a small file endless. Depth and the size of a tag are bounded.
class XmlStream
{
public:
    static constexpr int deepest = 100;
    static constexpr std::size_t longestTag = std::size_t(1) << 22; ///< bytes; a comment counts as one

    XmlStream(std::shared_ptr<const FileBytes> file, XmlHandler &handler);
    ~XmlStream();
    XmlStream(const XmlStream &) = delete;
    XmlStream &operator=(const XmlStream &) = delete;

    /// Reads the next piece of the file, and tells what is in it. @return false at the end, when something is wrong, and
    /// after `stop`. What the handler throws is thrown on
    bool readSome();
    /// Bytes that were read.
    std::size_t position() const { return position_; }
    const std::optional<InputError> &error() const { return error_; }

    // For the handler:
    /// The place of the tag or the text that is being reported.
    std::size_t currentByte() const;
    /// Ends the reading.
    void stop();
    /// Ends the reading because something is wrong.
    void fail(std::size_t byte, const QString &text);

private:
    struct Callbacks;

    void started(const char *name, const char *const *attributes);
    void ended();
    void leaveOut(bool isTold, bool isForeign);
    void countLeftOut(const char *name);
    void tellLeftOut();
    void wantText(bool isWanted);
    void failParsing();

    std::shared_ptr<const FileBytes> file_;
    XmlHandler &handler_;
    XML_ParserStruct *parser_;
    XmlVocabulary vocabulary_;
    std::size_t position_ = 0;
    int depth_ = 0;
    int leftOutFrom_ = 0;           ///< depth of the element that is left out; 0 when there is none
    bool isLeftOutTold_ = false;    ///< the elements in that are told
    bool isLeftOutForeign_ = false; ///< it is of another vocabulary
    std::string leftOutName_;       ///< of the elements in it that are counted
    std::size_t leftOutCount_ = 0;
    bool wantsText_ = false;              ///< of the innermost element
    std::bitset<deepest + 1> textWanted_; ///< of the elements that are open, by their depth
    bool isStopped_ = false;
    std::optional<InputError> error_;
    std::exception_ptr thrown_;
};

} // namespace kareport
