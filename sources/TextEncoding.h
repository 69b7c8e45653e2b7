#pragma once

#include "FileBytes.h"
#include "InputError.h"

#include <QStringList>
#include <QStringView>

#include <functional>
#include <memory>
#include <optional>

namespace kareport
{

/// How the characters of a text file are written.
enum class TextEncoding
{
    Utf8,
    Latin1,
    Windows1252,
    Utf16 ///< with a byte-order mark, which says the order of the bytes
};

/// The keys of all encodings, such as "utf-8", the usual one first.
QStringList textEncodingKeys();
/// The encoding of one of these keys; nothing for any other text. Case matters.
std::optional<TextEncoding> textEncodingFromKey(QStringView key);

/// The bytes of a text file as UTF-8; lines and columns are the same. A text that is UTF-8 already is handed back as it is; its
/// characters are not looked at. Any other is read as a whole, into a temporary file when it is large.
/// @param isToStop  is asked now and then; its true ends the reading, and nothing comes back. May be empty
/// @return an error with its place where a character is none of the encoding
Expected<std::shared_ptr<const FileBytes>> toUtf8(std::shared_ptr<const FileBytes> file, TextEncoding encoding,
                                                  const std::function<bool()> &isToStop = {});

} // namespace kareport
