#include "JsonPlaces.h"
#include "JsonWalker.h"

#include <algorithm>
#include <tuple>
#include <utility>

// Keys that occur twice in one object.

namespace kareport
{

namespace
{

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
    return bytes.contains('\\') ? textOfJsonString(bytes).toUtf8()
                                : QByteArray::fromRawData(bytes.data(), bytes.size());
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

} // namespace kareport
