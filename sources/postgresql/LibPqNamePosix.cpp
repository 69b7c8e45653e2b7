#include "LibPqName.h"

#include <QLibrary>

namespace kareport
{

void setLibPqName(QLibrary &library)
{
    constexpr int version = 5;
    library.setFileNameAndVersion(QStringLiteral("pq"), version);
}

} // namespace kareport
