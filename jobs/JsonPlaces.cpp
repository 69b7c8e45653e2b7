#include "JsonPlaces.h"

#include <QJsonArray>
#include <QJsonDocument>

#include <algorithm>
#include <tuple>
#include <utility>

namespace kareport
{

namespace
{

/// Walks over a JSON text that is known to be one.
class JsonWalker
{
public:
    explicit JsonWalker(const QByteArray &json) : json_(json) {}

    qsizetype at() const { return at_; }
    void setAt(qsizetype at) { at_ = at; }

    char peek()
    {
        while (at_ < json_.size() && (json_[at_] == ' ' || json_[at_] == '\t' || json_[at_] == '\n' ||
                                      json_[at_] == '\r' || static_cast<unsigned char>(json_[at_]) >= 0x80))
        {
            ++at_; // white space, and a byte-order mark in front
        }
        return at_ < json_.size() ? json_[at_] : '\0';
    }
    void take()
    {
        peek();
        ++at_;
    }

    /// The bytes of a string, as they are between its quotes.
    QByteArrayView takeString()
    {
        peek();
        const qsizetype begin = ++at_;
        while (at_ < json_.size() && json_[at_] != '"') {
            at_ += json_[at_] == '\\' ? 2 : 1;
        }
        const qsizetype end = std::min(at_, json_.size());
        ++at_;
        return QByteArrayView(json_).sliced(begin, end - begin);
    }

    void skipWord()
    {
        while (at_ < json_.size() && !QByteArrayView(",:]} \t\r\n").contains(json_[at_])) {
            ++at_;
        }
    }

    void skipValue()
    {
        int depth = 0;
        do {
            const char next = peek();
            if (next == '\0') {
                return;
            }
            if (next == '"') {
                takeString();
            } else if (next == '{' || next == '[') {
                ++depth;
                ++at_;
            } else if (next == '}' || next == ']') {
                --depth;
                ++at_;
            } else if (next == ',' || next == ':') {
                ++at_;
            } else {
                skipWord();
            }
        } while (depth > 0);
    }

private:
    const QByteArray &json_;
    qsizetype at_ = 0;
};

/// The text of a string's bytes.
QString textOf(QByteArrayView bytes)
{
    if (!bytes.contains('\\')) {
        return QString::fromUtf8(bytes);
    }
    const QByteArray literal = "[\"" + bytes.toByteArray() + "\"]";
    return QJsonDocument::fromJson(literal).array().first().toString();
}

struct Found
{
    qsizetype key;
    qsizetype value;
};

std::optional<Found> findMember(JsonWalker &walker, const QString &name)
{
    std::optional<Found> found;
    walker.take();
    while (walker.peek() == '"') {
        const qsizetype key = walker.at();
        const bool matches = textOf(walker.takeString()) == name;
        walker.peek();
        walker.take(); // the colon
        walker.peek();
        if (matches) {
            found = Found{key, walker.at()};
        }
        walker.skipValue();
        if (walker.peek() == ',') {
            walker.take();
        }
    }
    return found;
}

std::optional<Found> findElement(JsonWalker &walker, qsizetype index)
{
    walker.take();
    for (qsizetype i = 0; walker.peek() != ']' && walker.peek() != '\0'; ++i) {
        if (i == index) {
            return Found{walker.at(), walker.at()};
        }
        walker.skipValue();
        if (walker.peek() == ',') {
            walker.take();
        }
    }
    return std::nullopt;
}

struct Key
{
    QByteArray name;
    qsizetype at;

    bool operator<(const Key &other) const { return std::tie(name, at) < std::tie(other.name, other.at); }
};

/// The keys of an object, or those of none when a list is open.
struct OpenGroup
{
    bool isObject = false;
    std::vector<Key> keys;
};

/// The first key of an object that has been there before, and that one.
std::optional<std::pair<Key, Key>> repeatedIn(std::vector<Key> &keys)
{
    std::sort(keys.begin(), keys.end());
    std::optional<std::pair<Key, Key>> found;
    for (std::size_t i = 1; i < keys.size(); ++i) {
        if (keys[i].name == keys[i - 1].name && (!found || keys[i].at < found->second.at)) {
            found = {keys[i - 1], keys[i]};
        }
    }
    return found;
}

/// The name of a key: the bytes as they are, unless escapes hide what they say.
QByteArray nameOf(QByteArrayView bytes)
{
    return bytes.contains('\\') ? textOf(bytes).toUtf8() : QByteArray::fromRawData(bytes.data(), bytes.size());
}

} // namespace

std::optional<RepeatedKey> findRepeatedKey(const QByteArray &json)
{
    JsonWalker walker(json);
    std::vector<OpenGroup> groups; // used again at each depth: objects are many
    std::size_t depth = 0;
    bool isKeyNext = false;
    for (char next = walker.peek(); next != '\0'; next = walker.peek()) {
        const qsizetype at = walker.at();
        if (next == '"') {
            const QByteArrayView bytes = walker.takeString();
            if (isKeyNext) {
                groups[depth - 1].keys.push_back({nameOf(bytes), at});
            }
            isKeyNext = false;
            continue;
        }
        if (next == '{' || next == '[') {
            if (depth == groups.size()) {
                groups.emplace_back();
            }
            groups[depth].isObject = next == '{';
            groups[depth++].keys.clear();
        } else if (next == '}' || next == ']') {
            if (const auto repeated = repeatedIn(groups[--depth].keys)) {
                return RepeatedKey{QString::fromUtf8(repeated->second.name), placeOfByte(json, repeated->second.at),
                                   placeOfByte(json, repeated->first.at).line};
            }
        } else if (next != ',' && next != ':') {
            walker.skipWord();
            continue;
        }
        walker.take();
        isKeyNext = (next == '{' || next == ',') && groups[depth - 1].isObject;
    }
    return std::nullopt;
}

TextPlace placeOfByte(const QByteArray &text, qsizetype byte)
{
    const QString before = QString::fromUtf8(text.first(std::clamp<qsizetype>(byte, 0, text.size())));
    return TextPlaces(before).of(before.size());
}

std::optional<TextPlace> placeInJson(const QByteArray &json, const JsonPath &path, bool ofKey)
{
    JsonWalker walker(json);
    walker.peek();
    Found place = {walker.at(), walker.at()};
    for (const auto &step : path) {
        walker.setAt(place.value);
        const char kind = walker.peek();
        std::optional<Found> found;
        if (const auto *name = std::get_if<QString>(&step)) {
            found = kind == '{' ? findMember(walker, *name) : std::nullopt;
        } else {
            found = kind == '[' ? findElement(walker, std::get<qsizetype>(step)) : std::nullopt;
        }
        if (!found) {
            return std::nullopt;
        }
        place = *found;
    }
    return placeOfByte(json, ofKey ? place.key : place.value);
}

} // namespace kareport
