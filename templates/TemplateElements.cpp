#include "TemplateElements.h"

#include "TextFolding.h"

namespace kareport
{

namespace
{

/// The parts of an element are cut out one after the other. Each cut changes what the next one sees, so the order of the
/// cuts belongs to the format; the last one is only looked up, since nothing is read after it.
using FieldReader = FieldElement (*)(ScanElement element, ScanNotes *notes);

FieldElement readTableField(ScanElement element, ScanNotes *notes)
{
    ScanText rest = element.value;
    FieldElement field;
    field.element = std::move(element);
    field.format = ExtractNode(rest, u"FORMAT", true, notes);
    field.label = ExtractNode(rest, u"LABEL", true, notes);
    field.align = ExtractNode(rest, u"ALIGN", true, notes);
    field.variableName = GetNode(rest, u"VARIABLENAME", notes);
    return field;
}

FieldElement readBlockField(ScanElement element, ScanNotes *notes)
{
    ScanText rest = element.value;
    FieldElement field;
    field.element = std::move(element);
    field.variableName = ExtractNode(rest, u"VARIABLENAME", true, notes);
    field.label = ExtractNode(rest, u"LABEL", true, notes);
    field.format = ExtractNode(rest, u"FORMAT", true, notes);
    field.align = GetNode(rest, u"ALIGN", notes);
    return field;
}

std::vector<OutputElement> readOutputs(const ScanText &list, QStringView tag, FieldReader readField, ScanNotes *notes)
{
    std::vector<OutputElement> outputs;
    NodeSequence sequence(list, tag, notes);
    while (auto element = sequence.next()) {
        ScanText rest = element->value;
        OutputElement output;
        output.element = std::move(*element);
        output.name = ExtractNode(rest, u"NAME", true, notes);
        output.use = ExtractNode(rest, u"USE", true, notes);
        const ScanElement outputList = GetNode(rest, u"OUTPUTLIST", notes);
        NodeSequence fields(outputList.value, u"FIELD", notes);
        while (auto field = fields.next()) {
            output.fields.push_back(readField(std::move(*field), notes));
        }
        outputs.push_back(std::move(output));
    }
    return outputs;
}

} // namespace

TemplateSequence::TemplateSequence(const ScanText &file, ScanNotes *notes)
    : elements_(file, u"REPORTTEMPLATE", notes), notes_(notes)
{}

std::optional<TemplateElement> TemplateSequence::next()
{
    auto element = elements_.next();
    if (!element) {
        return std::nullopt;
    }
    ScanText rest = element->value;
    TemplateElement found;
    found.body = std::move(*element);
    found.name = ExtractNode(rest, u"NAME", true, notes_);
    found.title = GetNode(rest, u"TITLE", notes_);
    return found;
}

std::vector<TemplateElement> readTemplateElements(const ScanText &file, ScanNotes *notes)
{
    std::vector<TemplateElement> templates;
    TemplateSequence sequence(file, notes);
    while (auto element = sequence.next()) {
        templates.push_back(std::move(*element));
    }
    return templates;
}

std::optional<TemplateElement> findTemplate(const ScanText &file, QStringView name)
{
    std::optional<TemplateElement> last;
    TemplateSequence sequence(file);
    while (auto element = sequence.next()) {
        if (equalFolded(element->name.value.view(), name)) {
            last.emplace(std::move(*element));
        }
    }
    return last;
}

std::vector<OutputElement> readTableElements(const ScanText &body, ScanNotes *notes)
{
    return readOutputs(GetNode(body, u"TABLES", notes).value, u"TABLE", readTableField, notes);
}

std::vector<OutputElement> readBlockElements(const ScanText &body, ScanNotes *notes)
{
    return readOutputs(GetNode(body, u"BLOCKS", notes).value, u"BLOCK", readBlockField, notes);
}

std::vector<SortElement> readSortElements(const ScanText &body, ScanNotes *notes)
{
    std::vector<SortElement> sorts;
    const ScanElement tables = GetNode(body, u"TABLES");
    NodeSequence sequence(tables.value, u"TABLE");
    while (auto element = sequence.next()) {
        ScanText rest = std::move(element->value);
        SortElement sort;
        sort.name = ExtractNode(rest, u"NAME", true);
        sort.use = ExtractNode(rest, u"USE", true);
        const ScanElement list = GetNode(rest, u"SORT", notes);
        NodeSequence names(list.value, u"VARIABLENAME", notes);
        while (auto name = names.next()) {
            sort.variableNames.push_back(std::move(*name));
        }
        if (!sort.variableNames.empty()) {
            sorts.push_back(std::move(sort));
        }
    }
    return sorts;
}

std::vector<DictionaryElement> readDictionaryElements(const ScanText &body, ScanNotes *notes)
{
    std::vector<DictionaryElement> dictionaries;
    const ScanElement list = GetNode(body, u"DICTIONARIES", notes);
    NodeSequence sequence(list.value, u"DICTIONARY", notes);
    while (auto element = sequence.next()) {
        ScanText rest = element->value;
        DictionaryElement dictionary;
        dictionary.element = std::move(*element);
        dictionary.name = ExtractNode(rest, u"DICTIONARYNAME", true, notes);
        const ScanElement variables = GetNode(rest, u"VARIABLELIST", notes);
        NodeSequence variableSequence(variables.value, u"VARIABLE", notes);
        while (auto variable = variableSequence.next()) {
            // Looked up, not cut out: a short closing tag takes nothing along.
            const ScanText &parts = variable->value;
            VariableElement read;
            read.id = GetNode(parts, u"ID", notes);
            read.variableName = GetNode(parts, u"VARIABLENAME", notes);
            read.type = GetNode(parts, u"TYPE", notes);
            read.element = std::move(*variable);
            dictionary.variables.push_back(std::move(read));
        }
        dictionaries.push_back(std::move(dictionary));
    }
    return dictionaries;
}

OptionElements readOptionElements(const ScanText &body, ScanNotes *notes)
{
    OptionElements elements;
    elements.options = GetNode(body, u"OPTIONS", notes);
    elements.separator = GetNode(elements.options.value, u"SEPARATOR", notes);
    elements.pageBreaks = GetNode(elements.options.value, u"PAGEBREAKS", notes);
    return elements;
}

} // namespace kareport
