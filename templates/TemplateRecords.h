#pragma once

#include "TemplateElements.h"
#include "sXmlReportField.h"

#include <QString>

namespace kareport
{

/// The width and the decimals of a field's "Format", such as 12 or 12.3; decimals below 0 count as 0.
struct FieldFormat
{
    qint32 width = 0;
    qint32 decimals = 0;
};
FieldFormat parseFieldFormat(QStringView format);

/// The field of a table: at least as wide as its label, aligned left, centred or right.
/// @param label  shown instead of the element's
sXmlReportField tableField(const FieldElement &element, const QString &label);
sXmlReportField tableField(const FieldElement &element);
/// The field of a block: as wide as its format says, aligned left or right.
sXmlReportField blockField(const FieldElement &element);

/// The separator that a template's option gives: the character of a code 0 to 255, else the option's first character;
/// a blank for a number outside. An empty option gives the character 0.
char ParseSeparatorOption(QStringView option);

} // namespace kareport
