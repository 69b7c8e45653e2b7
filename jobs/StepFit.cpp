#include "StepFit.h"

#include "FieldMarker.h"
#include "TemplateElements.h"
#include "TemplateFile.h"
#include "TemplateRecords.h"
#include "TextFolding.h"

#include <algorithm>

namespace kareport
{

namespace
{

std::optional<qint32> formatWidth(const FieldElement &field)
{
    const QStringView format = field.format.value.view();
    return format.isEmpty() ? std::nullopt : std::optional(std::max(parseFieldFormat(format).width, 0));
}

} // namespace

FormatWidths::FormatWidths(const QString &path, const QString &name)
{
    const auto file = TemplateFile::read(path);
    if (!file) {
        return;
    }
    const ScanText text = scanTextOf(*file);
    const auto chosen = findTemplate(text, name);
    if (!chosen) {
        return;
    }
    const auto add = [](const std::vector<OutputElement> &outputs, std::unordered_map<QString, Widths> &all) {
        for (const OutputElement &output : outputs) {
            Widths widths;
            for (const FieldElement &field : output.fields) {
                widths.emplace_back(foldedKey(field.variableName.value.view()), formatWidth(field));
            }
            all.try_emplace(foldedKey(output.name.value.view()), std::move(widths)); // the first one of a name counts
        }
    };
    add(readTableElements(chosen->body.value), tables_);
    add(readBlockElements(chosen->body.value), blocks_);
}

std::optional<qint32> FormatWidths::widthOf(bool isTable, const QString &output, const QString &variable,
                                            std::size_t occurrence) const
{
    const auto &all = isTable ? tables_ : blocks_;
    const auto found = all.find(foldedKey(output));
    if (found == all.end()) {
        return std::nullopt;
    }
    const QString key = foldedKey(variable);
    for (const auto &[name, width] : found->second) {
        if (name == key && occurrence-- == 0) {
            return width;
        }
    }
    return std::nullopt;
}

std::vector<FieldFit> fieldFits(bool isTable, const QString &name, const sXmlReportFields &fields,
                                const DataRemarks &remarks, const FormatWidths &widths)
{
    std::vector<FieldFit> fits;
    std::unordered_map<QString, std::size_t> seen;
    const std::size_t count = std::min(fields.size(), remarks.columns.size());
    for (std::size_t i = 0; i < count; ++i) {
        const sXmlReportField &field = fields[i];
        if (fieldMarker(field.VariableName) != FieldMarker::None) {
            continue;
        }
        const ColumnRemarks &column = remarks.columns[i];
        FieldFit fit;
        fit.variable = field.VariableName;
        fit.label = field.Label;
        fit.type = field.Type;
        fit.width = field.Width;
        const auto width = widths.widthOf(isTable, name, field.VariableName, seen[foldedKey(field.VariableName)]++);
        // The label of a block is printed in front of its value, as wide as it is.
        fit.isLabelWide = isTable && width && field.Label.size() > *width;
        fit.widest = column.widest;
        fit.row = column.widestRow;
        fit.line = column.widestLine;
        fit.tooWide = column.tooWide.count + column.wideZeros;
        fits.push_back(std::move(fit));
    }
    return fits;
}

} // namespace kareport
