#pragma once

#include "KaReportExport.h"
#include "TemplateFile.h"
#include "sXmlReportTemplateInfo.h"

#include <QStringList>

#include <vector>

namespace kareport
{

/// All templates of a file, in file order, without one being chosen.
/// @throws std::bad_alloc: some of them would be taken for all
KAREPORT_EXPORT std::vector<sXmlReportTemplateInfo> templateInfos(const TemplateFile &file);
/// The names of all templates of a file, in file order.
KAREPORT_EXPORT QStringList templateNames(const TemplateFile &file);

} // namespace kareport
