#include "StandardText.h"

#include "MemoryLasts.h"
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

QString noMemoryText()
{
    return whileMemoryLasts(QString(), [] { return Xlate("there is not enough memory for it"); });
}

} // namespace kareport
