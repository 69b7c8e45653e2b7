#include "TemplateNames.h"

#include "TemplateElements.h"

namespace kareport
{

std::vector<sXmlReportTemplateInfo> templateInfos(const TemplateFile &file)
{
    std::vector<sXmlReportTemplateInfo> infos;
    for (const TemplateElement &element : readTemplateElements(scanTextOf(file))) {
        infos.push_back({element.name.value.text(), element.title.value.text()});
    }
    return infos;
}

QStringList templateNames(const TemplateFile &file)
{
    QStringList names;
    for (const sXmlReportTemplateInfo &info : templateInfos(file)) {
        names.append(info.Name);
    }
    return names;
}

} // namespace kareport
