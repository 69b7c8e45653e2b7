#pragma once

#include <QJsonObject>
#include <QString>

class UXmlReportTpl;

namespace kareport
{

/// A job that shows all blocks and all tables of a template with rows made up to the types of their variables, the same ones
/// each time: texts as wide as their columns, numbers of both signs with decimals, stations, bearings and marks.
/// @param file  the template's file, @param name  by which it was loaded
QJsonObject sampleJob(const UXmlReportTpl &reportTemplate, const QString &file, const QString &name);

} // namespace kareport
