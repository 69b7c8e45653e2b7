#pragma once

#include "InputError.h"
#include "JsonPlaces.h"

#include <QByteArray>
#include <QHash>
#include <QJsonObject>
#include <QJsonValue>
#include <QString>

#include <initializer_list>
#include <optional>

namespace kareport
{

/// A JSON file that is being read, and the first thing that was found wrong with it.
class JsonSource
{
public:
    /// Reads a file. A text that is no JSON, or whose root is no object, is an error.
    static Expected<JsonSource> read(const QString &path);
    /// A job that stands in no file; its file names are relative to the current folder.
    static JsonSource fromObject(const QJsonObject &object);
    static Expected<JsonSource> fromBytes(const QString &path, const QByteArray &bytes);

    /// Puts a value where the dots of `key` lead, as "settings.lengthUnit". The text is taken as JSON where it is some
    /// and as a text where a text is expected.
    /// @return what is wrong with the key; nothing when it was set
    std::optional<QString> set(const QString &key, const QString &text);

    const QString &path() const { return path_; }
    const QJsonValue &root() const { return root_; }

    void fail(const JsonPath &path, const QString &text, bool atKey = false);
    bool failed() const { return error_.has_value(); }
    const std::optional<InputError> &error() const { return error_; }

    /// The text that was set at a path, if any.
    std::optional<QString> setText(const JsonPath &path) const;

private:
    QString path_;
    QByteArray bytes_;
    QJsonValue root_;
    QHash<QString, QString> setTexts_; ///< by the path with dots
    std::optional<InputError> error_;
};

/// A value of a JSON file with the way to it. Reading one in another type than it has fails the source; what comes back
/// then is the fallback.
class JsonNode
{
public:
    explicit JsonNode(JsonSource &source) : source_(source), value_(source.root()) {}

    bool exists() const { return !value_.isUndefined(); }
    const QJsonValue &value() const { return value_; }
    const JsonPath &path() const { return path_; }

    JsonNode operator[](const QString &key) const;
    JsonNode operator[](qsizetype index) const;
    qsizetype size() const;
    QStringList keys() const;

    bool isText() const;
    /// The text that was set on the command line in the value's place, if any.
    std::optional<QString> givenText() const { return source_.setText(path_); }
    bool isObject() const { return value_.isObject(); }
    QString text(const QString &fallback = QString()) const;
    bool boolean(bool fallback) const;
    int whole(int fallback, int least, int most) const;
    bool expectObject() const;
    bool expectArray() const;
    /// Fails at every key that is not one of these.
    void allowOnly(std::initializer_list<const char *> keys) const;
    void fail(const QString &text) const { source_.fail(path_, text); }

private:
    JsonNode(JsonSource &source, QJsonValue value, JsonPath path)
        : source_(source), value_(std::move(value)), path_(std::move(path))
    {}

    JsonSource &source_;
    QJsonValue value_;
    JsonPath path_;
};

} // namespace kareport
