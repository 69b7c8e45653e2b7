#include "JsonFileRows.h"

#include "NumberText.h"
#include "Xlate.h"

#include <algorithm>

namespace kareport
{

namespace
{

constexpr std::string_view byteOrderMark = "\xEF\xBB\xBF";

QString textOf(std::string_view text)
{
    return QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size()));
}

QString wanted()
{
    return Xlate("a list of objects, or an object a line, was expected");
}

} // namespace

JsonFileRows::JsonFileRows(std::shared_ptr<const FileBytes> file, const std::vector<ColumnChoice> &columns,
                           const Variables &variables)
    : file_(std::move(file)), text_(file_->view()), keys_(columns, variables)
{
    wrongChoice_ = keys_.wrongChoice();
    if (wrongChoice_) {
        error_ = InputError{file_->path(), std::nullopt, wrongChoice_->text};
        return;
    }
    rewind();
    // What is no such file is said before anything is read.
    if (findObject() || !error_) {
        rewind();
    }
}

void JsonFileRows::rewind()
{
    if (wrongChoice_) {
        return;
    }
    position_ = text_.starts_with(byteOrderMark) ? byteOrderMark.size() : 0;
    line_ = 1;
    before_ = Before::First;
    row_ = {};
    error_.reset();
}

void JsonFileRows::seek(const RowPlace &place)
{
    position_ = place.start;
    line_ = place.line;
    before_ = Before::Object;
    error_.reset();
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
            return fail(position_, Xlate("the end of the line was expected: each object stands in a line of its own"));
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
    isComplete_ = true;
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
    return true;
}

bool JsonFileRows::onKey(std::string_view key, std::size_t end)
{
    valueStart_ = end;
    keyStart_ = startOfKey(end);
    const auto found = keys_.take(key, rowNumber_);
    fields_ = found.fields;
    if (found.isNew && columns_.size() < JsonKeys::most) {
        columns_.push_back({textOf(key), placeOf(keyStart_), !found.fields->empty()});
    }
    if (found.isRepeated) {
        return fail(keyStart_, Xlate("the key \"%1\" stands twice in an object").arg(textOf(key)));
    }
    return !found.isVariableRepeated ||
           fail(keyStart_, Xlate("the variable \"%1\" stands twice: each variable was expected once").arg(textOf(key)));
}

/// Where the key begins that ends at a position, with its opening quote.
std::size_t JsonFileRows::startOfKey(std::size_t end) const
{
    std::size_t at = end - 2;
    const auto isEscaped = [this](std::size_t quote) {
        const std::size_t other = text_.find_last_not_of('\\', quote - 1);
        return (quote - other) % 2 == 0;
    };
    while (text_[at] != '"' || isEscaped(at)) {
        --at;
    }
    return at;
}

bool JsonFileRows::isWanted(unsigned id) const
{
    return onlyIds_ == nullptr || std::find(onlyIds_->begin(), onlyIds_->end(), id) != onlyIds_->end();
}

/// Stores the value of the key for the variables that are read from it.
bool JsonFileRows::storeAll(const std::function<bool(const ValueParser &)> &store)
{
    for (const JsonKeys::Field &field : *fields_) {
        if (isWanted(field.parser.id()) && !store(field.parser)) {
            return failInValue(field);
        }
    }
    return true;
}

bool JsonFileRows::onBoolean(bool value)
{
    return storeAll([&](const ValueParser &parser) { return parser.storeBoolean(value, *object_); });
}

bool JsonFileRows::onInteger(qint64 value)
{
    return storeAll([&](const ValueParser &parser) { return parser.storeInteger(value, *object_); });
}

bool JsonFileRows::onNumber(double value)
{
    return storeAll([&](const ValueParser &parser) { return parser.storeNumber(value, *object_); });
}

bool JsonFileRows::onText(std::string_view text)
{
    return storeAll([&](const ValueParser &parser) { return isPlainText(text) && parser.store(text, *object_); });
}

bool JsonFileRows::onNested()
{
    return storeAll([](const ValueParser &) { return false; });
}

void JsonFileRows::onMistake(const QString &text, std::size_t at)
{
    fail(at > row_.start ? at - 1 : at, Xlate("this is no JSON: %1").arg(text));
}

bool JsonFileRows::failInValue(const JsonKeys::Field &field)
{
    std::size_t at = valueStart_;
    while (at < text_.size() && std::string_view(" \t\r\n:").find(text_[at]) != std::string_view::npos) {
        ++at;
    }
    return fail(at,
                Xlate("the value of \"%1\" does not fit: %2 was expected").arg(field.name, field.parser.expected()));
}

bool JsonFileRows::fail(std::size_t at, const QString &text)
{
    error_ = InputError{file_->path(), placeOf(at), text};
    return false;
}

/// The place of a position that is not before the row.
TextPlace JsonFileRows::placeOf(std::size_t at) const
{
    const std::string_view before = text_.substr(0, at);
    const std::size_t lineEnd = before.rfind('\n');
    std::string_view line = before.substr(lineEnd == std::string_view::npos ? 0 : lineEnd + 1);
    if (line.starts_with(byteOrderMark)) {
        line.remove_prefix(byteOrderMark.size());
    }
    // Lines are known up to where reading has come to, or to where the row begins.
    const std::size_t known = std::min(row_.start, at);
    const auto lines = std::count(before.begin() + static_cast<std::ptrdiff_t>(known), before.end(), '\n');
    const auto characters = std::count_if(line.begin(), line.end(),
                                          [](char byte) { return (static_cast<unsigned char>(byte) & 0xC0) != 0x80; });
    return {row_.line + lines, characters + 1};
}

} // namespace kareport
