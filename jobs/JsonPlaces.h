#pragma once

#include "TextPlaces.h"

#include <QByteArray>
#include <QString>

#include <optional>
#include <variant>
#include <vector>

namespace kareport
{

/// The way from a JSON document's root to a value: names of members and indices of elements.
using JsonPath = std::vector<std::variant<QString, qsizetype>>;

/// Where a value (or, with `ofKey`, the name of the member that holds it) is in a JSON text that has been parsed
/// already. Of members of one name the last counts. Nothing when the path does not exist.
std::optional<TextPlace> placeInJson(const QByteArray &json, const JsonPath &path, bool ofKey = false);

/// A key that occurs twice in one object: parsers take the last one and say nothing.
struct RepeatedKey
{
    QString key;
    TextPlace place; ///< of the second one
    qsizetype firstLine;
};
/// The first object of a JSON text, which has been parsed already, that has a key twice; nothing when there is none.
std::optional<RepeatedKey> findRepeatedKey(const QByteArray &json);

/// The place of a byte in a UTF-8 text.
TextPlace placeOfByte(const QByteArray &text, qsizetype byte);

} // namespace kareport
