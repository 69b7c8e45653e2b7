#include "XmlEncoding.h"

#include "Windows1252.h"

#include <algorithm>
#include <string>

namespace kareport
{

bool describeWindows1252(std::string_view name, int (&map)[256])
{
    std::string folded(name);
    std::transform(folded.begin(), folded.end(), folded.begin(), [](char letter) {
        return letter >= 'A' && letter <= 'Z' ? static_cast<char>(letter + 32) : letter;
    });
    if (folded != "windows-1252" && folded != "cp1252") {
        return false;
    }
    for (int i = 0; i < 256; ++i) {
        map[i] = i;
    }
    for (std::size_t i = 0; i < windows1252.size(); ++i) {
        map[0x80 + i] = windows1252[i] != 0 ? windows1252[i] : -1;
    }
    return true;
}

} // namespace kareport
