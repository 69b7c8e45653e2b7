#include "EditorKind.h"

#include <algorithm>

namespace kareport
{

namespace
{

bool isNamed(QStringView path, QStringView name)
{
    return editorStem(path).compare(name, Qt::CaseInsensitive) == 0;
}

} // namespace

QStringView editorStem(QStringView path)
{
    const QStringView name = path.sliced(std::max(path.lastIndexOf(u'\\'), path.lastIndexOf(u'/')) + 1);
    const qsizetype dot = name.lastIndexOf(u'.');
    return dot >= 0 ? name.first(dot) : name;
}

bool isExcelEditor(QStringView path)
{
    return isNamed(path, u"excel");
}

EditorKind editorKind(QStringView path, bool excelOption)
{
    const bool takesRichText =
        isNamed(path, u"winword") || isNamed(path, u"wordpad") || (excelOption && isExcelEditor(path));
    return takesRichText ? EditorKind::WordProcessor : EditorKind::Plain;
}

} // namespace kareport
