#pragma once

#include <string>

namespace kareport
{

/// What every web page of results begins with, up to its title: the rules of its look. It needs nothing from elsewhere.
/// @param language  a tag such as "de"; empty where it is not known
std::string htmlHead(const std::string &language);
/// What it ends with: the script that sorts tables.
std::string htmlEnd();

} // namespace kareport
