#include "JsonFileRows.h"

#include "Xlate.h"

#include <algorithm>

namespace kareport
{

namespace
{

constexpr std::string_view byteOrderMark = "\xEF\xBB\xBF";

/// The place of a byte, counted on from one whose place is known.
TextPlace countedTo(std::string_view text, std::size_t from, TextPlace place, std::size_t to)
{
    for (; from < to; ++from) {
        const auto byte = static_cast<unsigned char>(text[from]);
        if (byte == '\n') {
            place = {place.line + 1, 1};
        } else if ((byte & 0xC0U) != 0x80U) {
            ++place.column;
        }
    }
    return place;
}

QString wanted()
{
    return Xlate("a list of objects, or an object a line, was expected");
}

} // namespace

JsonFileRows::JsonFileRows(std::shared_ptr<const FileBytes> file, const std::vector<ColumnChoice> &columns,
                           const Variables &variables)
    : file_(std::move(file)),
      text_(file_->view()),
      keys_(columns, variables),
      known_{{start(), TextPlace()}},
      lastPlace_(known_.front())
{
    wrongChoice_ = keys_.wrongChoice();
    if (wrongChoice_) {
        error_ = InputError{file_->path(), std::nullopt, wrongChoice_->text};
        return;
    }
    rewind();
    // A file that is not JSON is reported before anything is read.
    if (findObject() || !error_) {
        rewind();
    }
}

/// Where the text begins, after a byte-order mark.
std::size_t JsonFileRows::start() const
{
    return text_.starts_with(byteOrderMark) ? byteOrderMark.size() : 0;
}

void JsonFileRows::rewind()
{
    if (wrongChoice_) {
        return;
    }
    position_ = start();
    line_ = 1;
    released_ = 0;
    before_ = Before::First;
    row_ = {};
    error_.reset();
}

void JsonFileRows::seek(const RowPlace &place)
{
    position_ = place.start;
    line_ = place.line;
    row_ = place;
    before_ = Before::Object;
    error_.reset();
    released_ = text_.size(); // rows in another order come back to what was read
}

std::optional<TextPlace> JsonFileRows::placeOfNext(const QString &variable)
{
    const qsizetype number = keys_.variables().indexOf(variable);
    sought_ = number >= 0 ? std::optional(static_cast<std::size_t>(number)) : std::nullopt;
    soughtValue_.reset();
    static const std::vector<unsigned> nothing;
    UDataObject object;
    const bool isRead = next(object, &nothing);
    sought_.reset();
    return isRead ? std::optional(placeOf(soughtValue_.value_or(row_.start))) : std::nullopt;
}

/// Goes over blanks. @return whether there was a line end
bool JsonFileRows::skipBlanks()
{
    const qsizetype before = line_;
    for (; position_ < text_.size(); ++position_) {
        const char character = text_[position_];
        line_ += character == '\n' ? 1 : 0;
        if (character != ' ' && character != '\t' && character != '\r' && character != '\n') {
            break;
        }
    }
    return line_ > before;
}

/// Goes to the next object. @return whether there is one
bool JsonFileRows::findObject()
{
    const bool isNewLine = skipBlanks();
    const bool atEnd = position_ == text_.size();
    const char character = atEnd ? '\0' : text_[position_];
    switch (before_) {
    case Before::First:
        isList_ = character == '[';
        if (isList_) {
            ++position_;
            skipBlanks();
            if (position_ < text_.size() && text_[position_] == ']') {
                return endList();
            }
        }
        break;
    case Before::Object: break;
    case Before::Rest:
        if (isList_ && character == ']') {
            return endList();
        }
        if (isList_ && character != ',') {
            return fail(position_, Xlate("a comma or the end of the list was expected"));
        }
        if (!isList_ && atEnd) {
            return endRows();
        }
        if (!isList_ && !isNewLine) {
            return fail(position_, Xlate("the end of the line was expected: each object has a line of its own"));
        }
        if (isList_) {
            ++position_;
            skipBlanks();
        }
        break;
    }
    const bool isObject = position_ < text_.size() && text_[position_] == '{';
    return isObject || fail(position_, isList_ || before_ == Before::Rest ? Xlate("an object was expected") : wanted());
}

bool JsonFileRows::endList()
{
    ++position_;
    skipBlanks();
    return position_ == text_.size() ? endRows() : fail(position_, Xlate("nothing was expected after the list"));
}

/// Looks at the end whether what was asked for was there. @return false
bool JsonFileRows::endRows()
{
    isComplete_ = rowNumber_ > 0; // without an object the keys are not known
    const auto wrong = rowNumber_ > 0 ? keys_.whatIsMissing(columns_) : std::nullopt;
    if (wrong) {
        error_ = InputError{file_->path(), std::nullopt, *wrong};
    }
    return false;
}

bool JsonFileRows::next(UDataObject &object, const std::vector<unsigned> *onlyIds)
{
    if (error_ || !findObject()) {
        return false;
    }
    row_ = {position_, line_};
    ++rowNumber_;
    object.Clear();
    object_ = &object;
    onlyIds_ = onlyIds;
    const std::size_t limit = std::min(text_.size(), row_.start + longestRow);
    if (!parseJsonRow(text_, position_, limit, *this)) {
        if (position_ >= limit && limit < text_.size()) {
            fail(row_.start, Xlate("the object is longer than %1 bytes: a list of rows was expected").arg(longestRow));
        }
        return false;
    }
    const std::string_view row = text_.substr(row_.start, position_ - row_.start);
    line_ += std::count(row.begin(), row.end(), '\n');
    before_ = Before::Rest;
    file_->releaseBefore(row_.start, released_);
    return true;
}

bool JsonFileRows::fail(std::size_t at, const QString &text)
{
    error_ = InputError{file_->path(), placeOf(at), text};
    return false;
}

/// The place of a byte.
TextPlace JsonFileRows::placeOf(std::size_t at)
{
    lastPlace_ = {at, findPlace(at)};
    return lastPlace_.place;
}

TextPlace JsonFileRows::findPlace(std::size_t at)
{
    if (lastPlace_.at >= row_.start && lastPlace_.at <= at) {
        return countedTo(text_, lastPlace_.at, lastPlace_.place, at); // a row may have thousands of keys
    }
    if (const auto place = placeInLine(at)) {
        return *place;
    }
    const auto after = std::upper_bound(known_.begin(), known_.end(), at,
                                        [](std::size_t byte, const KnownPlace &known) { return byte < known.at; });
    if (after == known_.end()) {
        countOn(at);
        return known_.back().place;
    }
    return countedTo(text_, (after - 1)->at, (after - 1)->place, at);
}

/// The same by the line that the row is in; nothing where that begins far before it, as in a file of one line.
std::optional<TextPlace> JsonFileRows::placeInLine(std::size_t at) const
{
    constexpr std::size_t nearBytes = std::size_t(1) << 16;
    const std::size_t from = row_.start - std::min(row_.start, nearBytes);
    const std::string_view before = text_.substr(from, row_.start - from);
    const std::size_t lineEnd = before.rfind('\n');
    if (at < row_.start || (lineEnd == std::string_view::npos && from > 0)) {
        return std::nullopt;
    }
    const std::size_t lineStart = lineEnd == std::string_view::npos ? start() : from + lineEnd + 1;
    return countedTo(text_, lineStart, {row_.line, 1}, at);
}

/// Counts on from the last place that is known, and keeps places on the way: whatever is asked for in a file of one line, its
/// bytes are counted once. They are not kept in memory.
void JsonFileRows::countOn(std::size_t end)
{
    constexpr std::size_t piece = std::size_t(1) << 18;
    std::size_t released = known_.back().at;
    while (known_.back().at < end) {
        const KnownPlace last = known_.back();
        const std::size_t next = std::min(end, last.at + piece);
        known_.push_back({next, countedTo(text_, last.at, last.place, next)});
        file_->releaseBefore(next, released);
    }
}

} // namespace kareport
