#pragma once

#include "JsonSource.h"

#include <QJsonValue>
#include <QString>

#include <initializer_list>
#include <optional>

namespace kareport
{

/// A value of a JSON file with the way to it. Reading one in another type than it has is an error, which is kept for the code that
/// reads the whole; what comes back then is the fallback.
class JsonNode
{
public:
    /// The root of a source. @param error  receives the first thing that is found wrong, in this value or inside it. Source
    /// and error must outlive the nodes
    JsonNode(const JsonSource &source, std::optional<InputError> &error)
        : source_(&source), error_(&error), value_(source.root())
    {}

    bool exists() const { return !value_.isUndefined(); }
    const QJsonValue &value() const { return value_; }
    const JsonPath &path() const { return path_; }

    JsonNode operator[](const QString &key) const;
    JsonNode operator[](qsizetype index) const;
    qsizetype size() const;
    QStringList keys() const;

    bool isText() const;
    /// The text that was set on the command line in the value's place, if any.
    std::optional<QString> givenText() const { return source_->setText(path_); }
    bool isObject() const { return value_.isObject(); }
    /// The value in a type; `fallback` when it is missing or has another one.
    QString text(const QString &fallback = QString()) const;
    bool boolean(bool fallback) const;
    int whole(int fallback, int least, int most) const;
    /// Whether it is an object, or a list. Anything else that is there is an error.
    bool expectObject() const;
    bool expectArray() const;
    /// Fails at every key that is not one of these.
    void allowOnly(std::initializer_list<const char *> keys) const;
    void allowOnly(const QStringList &keys) const;
    /// Says what was expected instead of the value.
    void fail(const QString &text) const { failAt(path_, text, false); }

private:
    JsonNode(const JsonSource &source, std::optional<InputError> &error, QJsonValue value, JsonPath path)
        : source_(&source), error_(&error), value_(std::move(value)), path_(std::move(path))
    {}

    /// The first error is the one that counts.
    void failAt(const JsonPath &path, const QString &text, bool atKey) const
    {
        if (!*error_) {
            *error_ = source_->errorAt(path, text, atKey);
        }
    }

    const JsonSource *source_;
    std::optional<InputError> *error_;
    QJsonValue value_;
    JsonPath path_;
};

} // namespace kareport
