#include "JsonFileRows.h"

#include "NumberText.h"
#include "Xlate.h"

#include <algorithm>

// What is made of the keys and values of an object.

namespace kareport
{

namespace
{

QString textOf(std::string_view text)
{
    return QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size()));
}

} // namespace

bool JsonFileRows::onKey(std::string_view key, std::size_t end)
{
    valueStart_ = end;
    keyStart_ = startOfKey(end);
    const auto found = keys_.take(key, rowNumber_);
    fields_ = found.fields;
    if (found.isNew && columns_.size() < JsonKeys::most) {
        columns_.push_back({textOf(key), placeOf(keyStart_), !found.fields->empty()});
    }
    for (const JsonKeys::Field &field : *fields_) {
        if (sought_ && field.variable == *sought_) {
            soughtValue_ = startOfValue();
        }
    }
    if (found.isRepeated) {
        return fail(keyStart_, Xlate("the key \"%1\" occurs twice in an object").arg(textOf(key)));
    }
    return !found.isVariableRepeated ||
           fail(keyStart_, Xlate("the variable \"%1\" occurs twice: each variable was expected once").arg(textOf(key)));
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
        const unsigned id = field.parser.id();
        const auto storeField = [&] { return store(field.parser); };
        const auto place = [this] { return std::optional(placeOf(startOfValue())); };
        if (isWanted(id) && !storeOver(keys_.hasSharedIds(), id, field.name, *object_, storeField, place)) {
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

bool JsonFileRows::onUnsigned(quint64 value)
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
    fail(at > row_.start ? at - 1 : at, Xlate("this is not JSON: %1").arg(text));
}

/// Where the value of the key begins.
std::size_t JsonFileRows::startOfValue() const
{
    std::size_t at = valueStart_;
    while (at < text_.size() && std::string_view(" \t\r\n:").find(text_[at]) != std::string_view::npos) {
        ++at;
    }
    return at;
}

bool JsonFileRows::failInValue(const JsonKeys::Field &field)
{
    return fail(startOfValue(),
                Xlate("the value of \"%1\" does not fit: %2 was expected").arg(field.name, field.parser.expected()));
}

} // namespace kareport
