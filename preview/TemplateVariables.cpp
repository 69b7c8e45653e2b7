// The variables of a template, and their names wherever they are used.
#include "FieldMarker.h"
#include "TemplateEdits.h"
#include "TextFolding.h"
#include "Xlate.h"

#include <algorithm>
#include <vector>

namespace kareport
{

namespace
{

/// The places where the variable of a dictionary is named in a template.
std::vector<TextRange> usesOf(const OutlineTemplate &one, const VariableUse &use)
{
    std::vector<TextRange> ranges;
    const auto add = [&](const OutlineValue &value) {
        if (value.range.exists() && equalFolded(value.text, use.name)) {
            ranges.push_back(value.range);
        }
    };
    for (const OutlineDictionary &dictionary : one.dictionaryList) {
        for (const OutlineVariable &variable : dictionary.variables) {
            if (equalFolded(dictionary.name.text, use.dictionary)) {
                add(variable.name);
            }
        }
    }
    for (const OutlineOutput &output : one.outputs) {
        if (!equalFolded(output.use.text, use.dictionary)) {
            continue;
        }
        for (const OutlineField &field : output.fields) {
            add(field.variable);
        }
        for (const OutlineValue &key : output.sortKeys) {
            add(key);
        }
    }
    return ranges;
}

std::optional<VariableUse> useAt(const OutlineTemplate &one, qsizetype position)
{
    for (const OutlineDictionary &dictionary : one.dictionaryList) {
        for (const OutlineVariable &variable : dictionary.variables) {
            if (variable.element.touches(position)) {
                return VariableUse{dictionary.name.text, variable.name.text};
            }
        }
    }
    for (const OutlineOutput &output : one.outputs) {
        for (const OutlineField &field : output.fields) {
            if (field.element.touches(position)) {
                return VariableUse{output.use.text, field.variable.text};
            }
        }
        for (const OutlineValue &key : output.sortKeys) {
            if (key.range.touches(position)) {
                return VariableUse{output.use.text, key.text};
            }
        }
    }
    return std::nullopt;
}

/// What is wrong with a new name of a variable.
QString wrongName(const OutlineTemplate &one, const VariableUse &use, const QString &name)
{
    if (name.trimmed().isEmpty() || name != name.trimmed()) {
        return Xlate("A name without blanks at its ends was expected.");
    }
    if (name.contains(u'<') || name.contains(u'>') || name.contains(u'\n') || name.contains(u'\t')) {
        return Xlate("A name without < and > was expected.");
    }
    if (fieldMarker(name) != FieldMarker::None) {
        return Xlate("\"%1\" cannot be the name of a variable: it has a meaning of its own.").arg(name);
    }
    const bool isTaken = !equalFolded(name, use.name) && !usesOf(one, {use.dictionary, name}).empty();
    return isTaken ? Xlate("There is already a variable \"%1\".").arg(name) : QString();
}

} // namespace

std::optional<VariableUse> variableAt(const TemplateOutline &outline, qsizetype position)
{
    const OutlineTemplate *one = outline.templateAt(position);
    const auto use = one != nullptr ? useAt(*one, position) : std::nullopt;
    return use && !use->name.isEmpty() && fieldMarker(use->name) == FieldMarker::None ? use : std::nullopt;
}

QString whyNoVariable(const TemplateOutline &outline, qsizetype position)
{
    return variableAt(outline, position)
               ? QString()
               : Xlate("Put the cursor on a variable first: in a field, a sort key or a dictionary.");
}

EditedTemplate withRenamedVariable(const QString &text, qsizetype position, const QString &name)
{
    const TemplateOutline outline = outlineOf(text);
    const auto use = variableAt(outline, position);
    if (!use) {
        return {text, {}, whyNoVariable(outline, position)};
    }
    const OutlineTemplate &one = *outline.templateAt(position);
    if (const QString wrong = wrongName(one, *use, name); !wrong.isEmpty()) {
        return {text, {}, wrong};
    }
    std::vector<TextRange> ranges = usesOf(one, *use);
    std::sort(ranges.begin(), ranges.end(),
              [](const TextRange &left, const TextRange &right) { return left.begin > right.begin; });
    EditedTemplate edited{text, {}, QString()};
    for (const TextRange &range : ranges) {
        const bool isHere = range.begin <= position;
        edited.text.replace(range.begin, range.size(), name);
        if (isHere && !edited.selection.exists()) {
            edited.selection = {range.begin, range.begin + name.size()};
        } else if (edited.selection.exists()) {
            edited.selection.begin += name.size() - range.size();
            edited.selection.end += name.size() - range.size();
        }
    }
    return edited;
}

} // namespace kareport
