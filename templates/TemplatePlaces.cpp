#include "TemplatePlaces.h"

#include "TemplateElements.h"
#include "TextFolding.h"
#include "TextPlaces.h"

namespace kareport
{

namespace
{

/// The body of the last template of a name.
std::optional<ScanText> bodyOf(const ScanText &file, const QString &name)
{
    std::optional<ScanText> body;
    for (const TemplateElement &element : readTemplateElements(file)) {
        if (equalFolded(element.name.value.view(), name)) {
            body = element.body.value;
        }
    }
    return body;
}

/// The elements that name the variables of a record.
std::vector<ScanElement> namesIn(const ScanText &body, TemplatePart part, const QString &record)
{
    if (part == TemplatePart::SortKey) {
        for (const SortElement &sort : readSortElements(body)) {
            if (equalFolded(sort.name.value.view(), record)) {
                return sort.variableNames;
            }
        }
        return {};
    }
    std::vector<ScanElement> names;
    for (const OutputElement &output : part == TemplatePart::Table ? readTableElements(body) : readBlockElements(body))
    {
        if (!equalFolded(output.name.value.view(), record)) {
            continue;
        }
        for (const FieldElement &field : output.fields) {
            names.push_back(field.variableName);
        }
        break;
    }
    return names;
}

} // namespace

std::optional<TextPlace> placeOfVariable(const TemplateFile &file, const QString &templateName, TemplatePart part,
                                         const QString &record, const QString &variable)
{
    const auto body = bodyOf(file.scanText(), templateName);
    if (!body) {
        return std::nullopt;
    }
    for (const ScanElement &name : namesIn(*body, part, record)) {
        if (name.exists() && equalFolded(name.value.view(), variable)) {
            return TextPlaces(file.text()).of(name.source);
        }
    }
    return std::nullopt;
}

} // namespace kareport
