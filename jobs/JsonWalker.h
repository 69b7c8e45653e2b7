#pragma once

#include <QByteArray>
#include <QByteArrayView>
#include <QString>

#include <algorithm>

namespace kareport
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

/// The text of a string of JSON. @param bytes  as they are between its quotes
QString textOfJsonString(QByteArrayView bytes);

} // namespace kareport
