#include "StandardText.h"

#include "Xlate.h"

namespace kareport
{

QString standardText(unsigned number)
{
    switch (number) {
    case allFilesTitle: return Xlate("All Files (*.*)");
    case fileTooLarge: return Xlate("The file is too large to open.");
    default: return QString();
    }
}

} // namespace kareport
