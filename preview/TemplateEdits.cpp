// Fields, tables, blocks and dictionaries that are inserted into the text of a template.
#include "TemplateEdits.h"

#include "TemplateLines.h"
#include "TextFolding.h"
#include "VariableKeywords.h"
#include "VariableType.h"
#include "Xlate.h"

#include <QSet>
#include <QStringList>

#include <algorithm>
#include <vector>

namespace kareport
{

namespace
{

struct UsualFormat
{
    QString format;
    QString align;
};

/// How values of a type are shown as long as the author has not said it.
UsualFormat usualFormat(QStringView keyword, bool isTable)
{
    switch (const auto type = variableTypeFromKeyword(keyword);
            type ? static_cast<int>(*type) : static_cast<int>(VARIABLE_TEXT))
    {
    case VARIABLE_TEXT:
    case VARIABLE_NAME: return {QStringLiteral("20"), QStringLiteral("LEFT")};
    case VARIABLE_NUMBER: return {QStringLiteral("8"), QStringLiteral("LEFT")};
    case VARIABLE_BOOLEAN:
    case VARIABLE_FLAG: return {QStringLiteral("5"), isTable ? QStringLiteral("CENTER") : QStringLiteral("LEFT")};
    case VARIABLE_INTEGER: return {QStringLiteral("8"), QStringLiteral("RIGHT")};
    case VARIABLE_BEARING: return {QStringLiteral("16"), QStringLiteral("RIGHT")};
    default: return {QStringLiteral("12.3"), QStringLiteral("RIGHT")};
    }
}

QString fieldText(const OutlineVariable &variable, bool isTable)
{
    const UsualFormat usual = usualFormat(variable.type.text, isTable);
    return element("Field", element("VariableName", variable.name.text) + element("Label", variable.name.text) +
                                element("Format", usual.format) + element("Align", usual.align));
}

/// The field that a new one is written like, with the values of the new one.
QString fieldLike(const QString &text, const OutlineField &other, const OutlineVariable &variable, bool isTable)
{
    const UsualFormat usual = usualFormat(variable.type.text, isTable);
    struct Part
    {
        TextRange range;
        QString value;
    };
    std::vector<Part> parts = {{other.variable.range, variable.name.text},
                               {other.label.range, variable.name.text},
                               {other.format.range, usual.format},
                               {other.align.range, usual.align}};
    std::erase_if(parts, [](const Part &part) { return !part.range.exists(); });
    std::sort(parts.begin(), parts.end(),
              [](const Part &left, const Part &right) { return left.range.begin > right.range.begin; });
    QString copy = text.mid(other.element.begin, other.element.size());
    for (const Part &part : parts) {
        copy.replace(part.range.begin - other.element.begin, part.range.size(), part.value);
    }
    return copy;
}

const OutlineOutput *outputAt(const TemplateOutline &outline, qsizetype position)
{
    for (const OutlineTemplate &one : outline.templates) {
        for (const OutlineOutput &output : one.outputs) {
            if (output.element.touches(position)) {
                return &output;
            }
        }
    }
    return nullptr;
}

const OutlineDictionary *dictionaryOf(const OutlineTemplate &one, const QString &name)
{
    const auto found =
        std::find_if(one.dictionaryList.begin(), one.dictionaryList.end(),
                     [&name](const OutlineDictionary &each) { return equalFolded(each.name.text, name); });
    return found != one.dictionaryList.end() ? &*found : nullptr;
}

/// The first variable that a table or block does not show, or else the first one.
OutlineVariable nextVariable(const OutlineTemplate &one, const OutlineOutput &output)
{
    OutlineVariable made;
    made.name.text = QStringLiteral("Variable1");
    const OutlineDictionary *dictionary = dictionaryOf(one, output.use.text);
    if (dictionary == nullptr || dictionary->variables.empty()) {
        return made;
    }
    QSet<QString> shown;
    for (const OutlineField &field : output.fields) {
        shown.insert(foldedKey(field.variable.text));
    }
    for (const OutlineVariable &variable : dictionary->variables) {
        if (!shown.contains(foldedKey(variable.name.text))) {
            return variable;
        }
    }
    return dictionary->variables.front();
}

EditedTemplate refused(const QString &text, const QString &problem)
{
    return {text, {}, problem};
}

/// A text that has a template, which is inserted where there is none.
struct WithTemplate
{
    QString text;
    qsizetype position; ///< in the template
};

WithTemplate withTemplate(const QString &text, qsizetype position)
{
    if (!outlineOf(text).templates.empty()) {
        return {text, position};
    }
    QString made = text;
    const qsizetype at = lineStartOf(text, std::clamp<qsizetype>(position, 0, text.size()));
    made.insert(at, QStringLiteral("<ReportTemplate>\n\t<Name>Template1</Name>\n\t<Title>Report</Title>\n"
                                   "\t<Options>\n\t\t<Separator>32</Separator>\n\t</Options>\n"
                                   "</ReportTemplate>\n"));
    return {made, at};
}

/// Puts lines into a list of a template, which is made where the template has none.
void insertIntoList(QString &text, const OutlineTemplate &one, const TextRange &list, const char *name,
                    const TextRange &after, const QStringList &lines)
{
    if (list.exists()) {
        insertInside(text, list, lines);
        return;
    }
    QStringList whole;
    whole.append(u'<' + QString::fromLatin1(name) + u'>');
    for (const QString &line : lines) {
        whole.append(u'\t' + line);
    }
    whole.append(QStringLiteral("</") + QString::fromLatin1(name) + u'>');
    const TextRange head = one.title.range.exists() ? one.title.range : one.name.range;
    if (after.exists()) {
        insertAfter(text, endOfElement(text, after), whole);
    } else if (head.exists()) {
        insertAfter(text, endOfElement(text, head), whole);
    } else {
        const qsizetype open = text.indexOf(u'>', one.element.begin);
        const qsizetype inside = open < 0 ? text.size() : open + 1;
        insertInside(text, {inside, std::max(inside, text.lastIndexOf(u'<', one.element.end - 1))}, whole);
    }
}

/// The value before which a table or block has its fields.
TextRange headOf(const OutlineOutput &output)
{
    return output.use.range.exists() ? output.use.range : output.name.range;
}

} // namespace

QString whyNoField(const TemplateOutline &outline, qsizetype position)
{
    const OutlineOutput *output = outputAt(outline, position);
    if (output == nullptr) {
        return Xlate("A field belongs to a table or a block: put the cursor into one.");
    }
    return output->fields.empty() && !output->outputList.exists() && !headOf(*output).exists()
               ? Xlate("The table or block needs a name first.")
               : QString();
}

EditedTemplate withField(const QString &text, qsizetype position)
{
    const TemplateOutline outline = outlineOf(text);
    if (const QString wrong = whyNoField(outline, position); !wrong.isEmpty()) {
        return refused(text, wrong);
    }
    const OutlineOutput *output = outputAt(outline, position);
    const OutlineVariable variable = nextVariable(*outline.templateAt(position), *output);
    QString made = text;
    if (output->fields.empty()) {
        const QStringList line(fieldText(variable, output->isTable));
        if (output->outputList.exists()) {
            insertInside(made, output->outputList, line);
            return {made, valueAfter(made, output->outputList.begin, "Label"), QString()};
        }
        const TextRange head = headOf(*output);
        insertAfter(made, endOfElement(text, head),
                    {QStringLiteral("<OutputList>"), u'\t' + line.first(), QStringLiteral("</OutputList>")});
        return {made, valueAfter(made, head.end, "Label"), QString()};
    }
    const OutlineField *before = nullptr; // the last one that begins before the cursor
    for (const OutlineField &field : output->fields) {
        before = field.element.begin <= position ? &field : before;
    }
    const OutlineField &like = before != nullptr ? *before : output->fields.front();
    const qsizetype at = before != nullptr ? before->element.end : output->fields.front().element.begin;
    const qsizetype start = lineStartOf(text, like.element.begin);
    const QStringView front = QStringView(text).sliced(start, like.element.begin - start);
    const QString gap = isIndentation(front) ? u'\n' + front.toString() : QString();
    const QString field = fieldLike(text, like, variable, output->isTable);
    made.insert(at, before != nullptr ? gap + field : field + gap);
    return {made, valueAfter(made, at, like.label.range.exists() ? "Label" : "VariableName"), QString()};
}

EditedTemplate withDictionary(const QString &text, qsizetype position)
{
    auto [made, at] = withTemplate(text, position);
    const TemplateOutline outline = outlineOf(made);
    const OutlineTemplate &one = *outline.templateAt(at);
    QStringList names;
    for (const OutlineDictionary &dictionary : one.dictionaryList) {
        names.append(dictionary.name.text);
    }
    const QString name = freeName(QStringLiteral("Dictionary"), names);
    const QString variable =
        element("Variable", element("ID", QStringLiteral("1")) + element("VariableName", QStringLiteral("Variable1")) +
                                element("Type", QStringLiteral("TEXT")));
    const QStringList lines = {QStringLiteral("<Dictionary>"),      u'\t' + element("DictionaryName", name),
                               QStringLiteral("\t<VariableList>"),  QStringLiteral("\t\t") + variable,
                               QStringLiteral("\t</VariableList>"), QStringLiteral("</Dictionary>")};
    insertIntoList(made, one, one.dictionaries, "Dictionaries", one.tables, lines);
    const qsizetype found = made.indexOf(element("DictionaryName", name), std::max<qsizetype>(one.element.begin, 0));
    return {made, valueAfter(made, std::max<qsizetype>(found, 0), "DictionaryName"), QString()};
}

EditedTemplate withOutput(const QString &text, qsizetype position, bool isTable)
{
    auto [made, at] = withTemplate(text, position);
    if (outlineOf(made).templateAt(at)->dictionaryList.empty()) {
        made = withDictionary(made, at).text;
    }
    const TemplateOutline outline = outlineOf(made);
    const OutlineTemplate &one = *outline.templateAt(at);
    if (one.dictionaryList.empty()) {
        return refused(text, Xlate("The template cannot be read: correct what the list of remarks says first."));
    }
    QStringList names;
    for (const OutlineOutput &output : one.outputs) {
        names.append(output.name.text);
    }
    const char *kind = isTable ? "Table" : "Block";
    const QString name = freeName(QString::fromLatin1(kind), names);
    const OutlineDictionary &dictionary = one.dictionaryList.front();
    QStringList lines = {QStringLiteral("<%1>").arg(QLatin1StringView(kind)), u'\t' + element("Name", name),
                         u'\t' + element("Use", dictionary.name.text), QStringLiteral("\t<OutputList>")};
    for (const OutlineVariable &variable : dictionary.variables) {
        lines.append(QStringLiteral("\t\t") + fieldText(variable, isTable));
    }
    lines.append(QStringLiteral("\t</OutputList>"));
    lines.append(QStringLiteral("</%1>").arg(QLatin1StringView(kind)));
    if (isTable) {
        insertIntoList(made, one, one.tables, "Tables", {}, lines);
    } else {
        insertIntoList(made, one, one.blocks, "Blocks", one.dictionaries, lines);
    }
    const qsizetype found = made.indexOf(element("Name", name), std::max<qsizetype>(one.element.begin, 0));
    return {made, valueAfter(made, std::max<qsizetype>(found, 0), "Name"), QString()};
}

} // namespace kareport
