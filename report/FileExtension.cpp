#include "FileExtension.h"

namespace kareport
{

bool endsWithExtension(QStringView name, QStringView extension)
{
    const qsizetype at = name.indexOf(extension, 0, Qt::CaseInsensitive);
    return at >= 0 && at == name.size() - extension.size();
}

} // namespace kareport
