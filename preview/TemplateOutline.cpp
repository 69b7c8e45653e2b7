#include "TemplateOutline.h"

#include "TemplateElements.h"
#include "TemplateFile.h"
#include "TextFolding.h"

#include <algorithm>

namespace kareport
{

namespace
{

/// Makes ranges of the elements of a text.
class Ranges
{
public:
    explicit Ranges(const QString &text) : text_(text) {}

    /// Between the tags of an element.
    TextRange insideOf(const ScanElement &element) const
    {
        if (!element.exists()) {
            return {};
        }
        const qsizetype open = text_.indexOf(u'>', element.source);
        if (element.value.isEmpty()) {
            const qsizetype begin = open < 0 ? text_.size() : open + 1;
            return {begin, begin};
        }
        return {element.value.sourceOf(0), element.value.sourceOf(element.value.size() - 1) + 1};
    }

    /// With the tags of an element.
    TextRange allOf(const ScanElement &element) const
    {
        TextRange range = insideOf(element);
        if (range.exists()) {
            range.begin = element.source;
            const qsizetype close = text_.indexOf(u'>', range.end);
            range.end = close < 0 ? text_.size() : close + 1;
        }
        return range;
    }

    OutlineValue valueOf(const ScanElement &element) const { return {element.value.text(), insideOf(element)}; }

private:
    const QString &text_;
};

OutlineOutput outputOf(const Ranges &ranges, const OutputElement &element, bool isTable)
{
    OutlineOutput output;
    output.isTable = isTable;
    output.element = ranges.allOf(element.element);
    output.name = ranges.valueOf(element.name);
    output.use = ranges.valueOf(element.use);
    ScanText rest = element.element.value;
    ExtractNode(rest, u"NAME", true);
    ExtractNode(rest, u"USE", true);
    output.outputList = ranges.insideOf(GetNode(rest, u"OUTPUTLIST"));
    for (const FieldElement &field : element.fields) {
        output.fields.push_back({ranges.allOf(field.element), ranges.valueOf(field.variableName),
                                 ranges.valueOf(field.label), ranges.valueOf(field.format),
                                 ranges.valueOf(field.align)});
    }
    if (isTable) {
        const ScanElement sort = GetNode(rest, u"SORT");
        NodeSequence names(sort.value, u"VARIABLENAME");
        while (const auto name = names.next()) {
            output.sortKeys.push_back(ranges.valueOf(*name));
        }
    }
    return output;
}

OutlineDictionary dictionaryOf(const Ranges &ranges, const DictionaryElement &element)
{
    OutlineDictionary dictionary;
    dictionary.element = ranges.allOf(element.element);
    dictionary.name = ranges.valueOf(element.name);
    dictionary.variableList = ranges.insideOf(GetNode(element.element.value, u"VARIABLELIST"));
    for (const VariableElement &variable : element.variables) {
        dictionary.variables.push_back({ranges.allOf(variable.element), ranges.valueOf(variable.id),
                                        ranges.valueOf(variable.variableName), ranges.valueOf(variable.type)});
    }
    return dictionary;
}

OutlineTemplate templateOf(const Ranges &ranges, const TemplateElement &element)
{
    const ScanText &body = element.body.value;
    OutlineTemplate outline;
    outline.element = ranges.allOf(element.body);
    outline.name = ranges.valueOf(element.name);
    outline.title = ranges.valueOf(element.title);
    outline.tables = ranges.insideOf(GetNode(body, u"TABLES"));
    outline.blocks = ranges.insideOf(GetNode(body, u"BLOCKS"));
    outline.dictionaries = ranges.insideOf(GetNode(body, u"DICTIONARIES"));
    for (const OutputElement &table : readTableElements(body)) {
        outline.outputs.push_back(outputOf(ranges, table, true));
    }
    for (const OutputElement &block : readBlockElements(body)) {
        outline.outputs.push_back(outputOf(ranges, block, false));
    }
    for (const DictionaryElement &dictionary : readDictionaryElements(body)) {
        outline.dictionaryList.push_back(dictionaryOf(ranges, dictionary));
    }
    return outline;
}

} // namespace

TemplateOutline outlineOf(const QString &text)
{
    // A zero would hide what follows it, and every place after it would be another one.
    const QByteArray bytes = QString(text).replace(QChar(u'\0'), QChar::ReplacementCharacter).toUtf8();
    const TemplateFile file{QByteArrayView(bytes)};
    if (file.text().size() != text.size()) {
        return {};
    }
    const ScanText scan = scanTextOf(file);
    const Ranges ranges(text);
    TemplateOutline outline;
    for (const TemplateElement &element : readTemplateElements(scan)) {
        outline.templates.push_back(templateOf(ranges, element));
    }
    return outline;
}

const OutlineOutput *OutlineTemplate::output(bool isTable, QStringView wanted) const
{
    const auto found = std::find_if(outputs.begin(), outputs.end(), [&](const OutlineOutput &one) {
        return one.isTable == isTable && equalFolded(one.name.text, wanted);
    });
    return found != outputs.end() ? &*found : nullptr;
}

const OutlineTemplate *TemplateOutline::templateAt(qsizetype position) const
{
    const OutlineTemplate *before = templates.empty() ? nullptr : &templates.front();
    for (const OutlineTemplate &one : templates) {
        if (one.element.begin <= position) {
            before = &one;
        }
    }
    return before;
}

const OutlineTemplate *TemplateOutline::templateOf(QStringView name) const
{
    const OutlineTemplate *found = nullptr;
    for (const OutlineTemplate &one : templates) {
        found = equalFolded(one.name.text, name) ? &one : found;
    }
    return found;
}

const OutlineField *TemplateOutline::fieldAt(qsizetype position) const
{
    for (const OutlineTemplate &one : templates) {
        for (const OutlineOutput &output : one.outputs) {
            for (const OutlineField &field : output.fields) {
                if (field.element.touches(position)) {
                    return &field;
                }
            }
        }
    }
    return nullptr;
}

} // namespace kareport
