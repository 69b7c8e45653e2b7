#pragma once

#include <QStringView>

#include <string>

namespace kareport
{

/// Appends a text to a page in UTF-8 so that it shows as it is: nothing in it is a tag, an entity or the end of an attribute.
/// Control characters, which no page may have, become U+FFFD.
void appendHtmlText(std::string &out, QStringView text);

} // namespace kareport
