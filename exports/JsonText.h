#pragma once

#include <QStringView>

#include <string>

namespace kareport
{

/// Appends a text as a JSON string with its quotes, in UTF-8.
void appendJsonText(std::string &out, QStringView text);

} // namespace kareport
