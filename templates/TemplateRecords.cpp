#include "TemplateRecords.h"

#include "LeadingInteger.h"
#include "TextFolding.h"

#include <algorithm>

namespace kareport
{

namespace
{

sXmlReportField fieldOf(const FieldElement &element)
{
    const FieldFormat format = parseFieldFormat(element.format.value.view());
    sXmlReportField field;
    field.VariableName = element.variableName.value.text();
    field.Label = element.label.value.text();
    field.Width = format.width;
    field.Decimals = format.decimals;
    field.Align = equalFolded(element.align.value.view(), u"RIGHT") ? QStringLiteral("R") : QStringLiteral("L");
    field.ID = -1;
    field.Type = -1;
    return field;
}

} // namespace

FieldFormat parseFieldFormat(QStringView format)
{
    const qsizetype point = format.indexOf(u'.');
    if (point < 0) {
        return {leadingInteger(format), 0};
    }
    return {leadingInteger(format.first(point)), std::max(leadingInteger(format.sliced(point + 1)), 0)};
}

sXmlReportField tableField(const FieldElement &element)
{
    return tableField(element, element.label.value.text());
}

sXmlReportField tableField(const FieldElement &element, const QString &label)
{
    sXmlReportField field = fieldOf(element);
    field.Label = label;
    if (element.format.value.isEmpty() && equalFolded(field.VariableName, u"FLAG")) {
        field.Width = 1;
    }
    field.Width = std::max(field.Width, static_cast<qint32>(field.Label.size()));
    if (equalFolded(element.align.value.view(), u"CENTER")) {
        field.Align = QStringLiteral("C");
    }
    return field;
}

// A block's values follow their labels, so the label does not widen the field and nothing is centred.
sXmlReportField blockField(const FieldElement &element)
{
    return fieldOf(element);
}

char ParseSeparatorOption(QStringView option)
{
    const qint32 code = leadingInteger(option);
    if (code < 0 || code > 255) {
        return ' ';
    }
    if (option == QString::number(code)) {
        return static_cast<char>(code);
    }
    return option.isEmpty() ? '\0' : static_cast<char>(option.front().unicode() & 0xFF);
}

} // namespace kareport
