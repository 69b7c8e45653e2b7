#include "JsonPlaces.h"

#include "JsonWalker.h"

#include <QJsonArray>
#include <QJsonDocument>

#include <algorithm>

namespace kareport
{

namespace
{

/// Places of this many bytes are kept.
constexpr qsizetype bytesBetween = 4096;

constexpr qsizetype byteOrderMark = 3;

/// Goes over bytes of UTF-8. @return the place after them
TextPlace placeAfter(TextPlace place, QByteArrayView bytes)
{
    for (const char byte : bytes) {
        if (byte == '\n') {
            place = {place.line + 1, 1};
        } else if ((static_cast<unsigned char>(byte) & 0xC0U) != 0x80U) {
            ++place.column;
        }
    }
    return place;
}

} // namespace

/// The text of a string's bytes.
QString textOfJsonString(QByteArrayView bytes)
{
    if (!bytes.contains('\\')) {
        return QString::fromUtf8(bytes);
    }
    const QByteArray literal = "[\"" + bytes.toByteArray() + "\"]";
    return QJsonDocument::fromJson(literal).array().first().toString();
}

TextPlace placeOfByte(const QByteArray &text, qsizetype byte)
{
    const QString before = QString::fromUtf8(text.first(std::clamp<qsizetype>(byte, 0, text.size())));
    return TextPlaces(before).of(before.size());
}

/// Goes over what is in a list or an object.
/// @param visit  is told the name of each member, or the index of each element, and where it is; its false ends it
template <typename Visit>
void JsonPlaces::visitChildren(qsizetype at, const Visit &visit) const
{
    JsonWalker walker(json_);
    walker.setAt(at);
    const char kind = walker.peek();
    if (kind != '{' && kind != '[') {
        return;
    }
    walker.take();
    char next = walker.peek();
    for (qsizetype index = 0; next != '}' && next != ']' && next != '\0'; ++index, next = walker.peek()) {
        const qsizetype key = walker.at();
        Step step = index;
        if (kind == '{') {
            step = textOfJsonString(walker.takeString());
            walker.peek();
            walker.take(); // the colon
            walker.peek();
        }
        if (!visit(step, Found{key, walker.at()})) {
            return;
        }
        walker.skipValue();
        if (walker.peek() == ',') {
            walker.take();
        }
    }
}

/// What is in a list or an object, to be kept.
JsonPlaces::Children JsonPlaces::childrenAt(qsizetype at) const
{
    Children children;
    visitChildren(at, [&children](const Step &step, const Found &found) {
        if (const auto *name = std::get_if<QString>(&step)) {
            children.members.insert(*name, found);
        } else {
            children.elements.push_back(found);
        }
        return true;
    });
    return children;
}

/// One of them, where they are not kept: a list of rows may be long.
std::optional<JsonPlaces::Found> JsonPlaces::childAt(qsizetype at, const Step &step) const
{
    std::optional<Found> found;
    visitChildren(at, [&](const Step &other, const Found &child) {
        if (other == step) {
            found = child;
        }
        return !found || std::holds_alternative<QString>(step); // the last member of a name counts
    });
    return found;
}

std::optional<JsonPlaces::Found> JsonPlaces::childIn(const Children &children, const Step &step)
{
    if (const auto *name = std::get_if<QString>(&step)) {
        const auto found = children.members.constFind(*name);
        return found != children.members.constEnd() ? std::optional(*found) : std::nullopt;
    }
    const auto index = static_cast<std::size_t>(std::get<qsizetype>(step));
    return index < children.elements.size() ? std::optional(children.elements[index]) : std::nullopt;
}

const JsonPlaces::Children &JsonPlaces::childrenOf(const QString &name, qsizetype at)
{
    auto known = inRoot_.find(name);
    if (known == inRoot_.end()) {
        known = inRoot_.insert(name, childrenAt(at));
    }
    return *known;
}

/// What a step of a path leads to. @param parent  what the steps before it lead to
std::optional<JsonPlaces::Found> JsonPlaces::find(const JsonPath &path, std::size_t step, const Found &parent)
{
    if (step == 0) {
        if (!root_) {
            root_ = std::make_unique<Children>(childrenAt(parent.value));
        }
        return childIn(*root_, path[0]);
    }
    const auto *name = std::get_if<QString>(&path[0]);
    return step == 1 && name != nullptr ? childIn(childrenOf(*name, parent.value), path[1])
                                        : childAt(parent.value, path[step]);
}

std::optional<TextPlace> JsonPlaces::of(const JsonPath &path, bool ofKey)
{
    JsonWalker walker(json_);
    walker.peek();
    Found place = {walker.at(), walker.at()};
    for (std::size_t step = 0; step < path.size(); ++step) {
        const auto found = find(path, step, place);
        if (!found) {
            return std::nullopt;
        }
        place = *found;
    }
    return placeOf(ofKey ? place.key : place.value);
}

/// The place of a byte, from the last one before it that is known.
TextPlace JsonPlaces::placeOf(qsizetype byte)
{
    byte = std::clamp<qsizetype>(byte, 0, json_.size());
    if (marks_.empty()) {
        marks_.emplace_back(); // of the first byte; a byte-order mark has no column
    }
    const qsizetype start = json_.startsWith("\xEF\xBB\xBF") ? byteOrderMark : 0;
    const auto between = [this, start](qsizetype from, qsizetype to) {
        from = std::max(from, start);
        return QByteArrayView(json_).sliced(from, std::max<qsizetype>(to - from, 0));
    };
    const auto wanted = static_cast<std::size_t>(byte / bytesBetween);
    while (marks_.size() <= wanted) {
        const qsizetype from = static_cast<qsizetype>(marks_.size() - 1) * bytesBetween;
        marks_.push_back(placeAfter(marks_.back(), between(from, from + bytesBetween)));
    }
    return placeAfter(marks_[wanted], between(static_cast<qsizetype>(wanted) * bytesBetween, byte));
}

std::optional<TextPlace> placeInJson(const QByteArray &json, const JsonPath &path, bool ofKey)
{
    return JsonPlaces(json).of(path, ofKey);
}

} // namespace kareport
