#pragma once

#include "InputError.h"
#include "JsonPlaces.h"

#include <QByteArray>
#include <QHash>
#include <QJsonObject>
#include <QJsonValue>
#include <QString>

#include <memory>
#include <optional>

namespace kareport
{

/// The JSON object of a file, with what the command line sets in it, and the places of its values.
class JsonSource
{
public:
    /// Reads a file; "-" is standard input, and its file names are relative to the current folder. A text that is not JSON, or whose root is not an object, is an error.
    static Expected<JsonSource> read(const QString &path);
    /// An object that is in no file; its file names are relative to the current folder.
    static JsonSource fromObject(const QJsonObject &object);
    static Expected<JsonSource> fromBytes(const QString &path, const QByteArray &bytes);

    /// Puts a value where the dots of `key` lead, as "settings.lengthUnit". The text is taken as JSON where it is some
    /// and as a text where a text is expected.
    /// @return what is wrong with the key; nothing when it was set
    std::optional<QString> set(const QString &key, const QString &text);

    /// Says that the value at a key, with dots as for `set`, comes from an option, so that messages name that.
    void nameOption(const QString &key, const QString &option) { options_.insert(key, option); }

    /// The file; empty for what is in none.
    const QString &path() const { return path_; }
    const QJsonValue &root() const { return root_; }

    /// The text that was set at a path, if any.
    std::optional<QString> setText(const JsonPath &path) const;

    /// Something wrong with a value, with its place in the file. What was set on the command line is named by its option, and
    /// what is missing has the place of its parent.
    /// @param text   a sentence that says what was expected
    /// @param atKey  the name of the member is wrong, and not its value
    InputError errorAt(const JsonPath &path, const QString &text, bool atKey = false) const;

private:
    QString path_;
    std::shared_ptr<JsonPlaces> places_; ///< in the file; null for what is in none
    QJsonValue root_;
    QHash<QString, QString> setTexts_; ///< by the path with dots
    QHash<QString, QString> options_;  ///< of the command line, by the same
};

} // namespace kareport
