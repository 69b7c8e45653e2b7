#include "JsonPlaces.h"

#include <QJsonArray>
#include <QJsonDocument>

#include <algorithm>

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

    QString takeString()
    {
        peek();
        const qsizetype begin = at_;
        ++at_;
        while (at_ < json_.size() && json_[at_] != '"') {
            at_ += json_[at_] == '\\' ? 2 : 1;
        }
        ++at_;
        const QByteArray literal = '[' + json_.mid(begin, at_ - begin) + ']';
        return QJsonDocument::fromJson(literal).array().first().toString();
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
                while (at_ < json_.size() && !QByteArrayView(",:]} \t\r\n").contains(json_[at_])) {
                    ++at_;
                }
            }
        } while (depth > 0);
    }

private:
    const QByteArray &json_;
    qsizetype at_ = 0;
};

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
        const bool matches = walker.takeString() == name;
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

} // namespace

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
