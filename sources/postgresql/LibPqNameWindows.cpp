#include "LibPqName.h"

#include <QCoreApplication>
#include <QLibrary>

namespace kareport
{

void setLibPqName(QLibrary &library)
{
    // The one that comes with the program: one by its name alone could lie in the folder that the program works in.
    library.setFileName(QCoreApplication::applicationDirPath() + QStringLiteral("/libpq.dll"));
}

} // namespace kareport
