#include "JobFileName.h"

#include "Xlate.h"

namespace kareport
{

QString readFileName(const JsonNode &node)
{
    const QString name = node.text();
    if (name.contains(QChar::Null)) {
        node.fail(Xlate("a file name without a character 0 was expected"));
    }
    return name;
}

QString readDataFileName(const JsonNode &node, const QDir &folder)
{
    const QString name = readFileName(node);
    return name == u"-" ? name : folder.filePath(name);
}

} // namespace kareport
