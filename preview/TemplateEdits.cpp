#include "TemplateEdits.h"

#include "FieldMarker.h"
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

bool isIndentation(QStringView text)
{
    return std::all_of(text.begin(), text.end(), [](QChar one) { return one == u' ' || one == u'\t'; });
}

qsizetype lineStartOf(const QString &text, qsizetype position)
{
    return position <= 0 ? 0 : text.lastIndexOf(u'\n', position - 1) + 1;
}

/// The blanks and tabs that the line of a position begins with.
QString indentationAt(const QString &text, qsizetype position)
{
    const qsizetype start = lineStartOf(text, position);
    qsizetype end = start;
    while (end < text.size() && (text[end] == u' ' || text[end] == u'\t')) {
        ++end;
    }
    return text.mid(start, end - start);
}

/// What a line is indented by in an element.
QString indentationUnit(const QString &text)
{
    for (qsizetype at = text.indexOf(u'\n'); at >= 0 && at + 1 < text.size(); at = text.indexOf(u'\n', at + 1)) {
        if (text[at + 1] == u'\t') {
            break;
        }
        if (text[at + 1] == u' ') {
            return indentationAt(text, at + 1);
        }
    }
    return QStringLiteral("\t");
}

QString element(const char *name, const QString &value)
{
    const QString tag = QString::fromLatin1(name);
    return u'<' + tag + u'>' + value + QStringLiteral("</") + tag + u'>';
}

/// Lines of text, each with its depth as tabs.
QString indented(const QStringList &lines, const QString &indentation, const QString &unit)
{
    QString text;
    for (QString line : lines) {
        QString front = indentation;
        while (line.startsWith(u'\t')) {
            line.remove(0, 1);
            front += unit;
        }
        text += front + line + u'\n';
    }
    return text;
}

/// Puts lines at the end of what an element holds, before its closing tag.
void insertInside(QString &text, const TextRange &inside, const QStringList &lines)
{
    const QString unit = indentationUnit(text);
    const qsizetype close = text.indexOf(u'<', inside.end);
    const qsizetype closeAt = close < 0 ? text.size() : close;
    const qsizetype start = lineStartOf(text, closeAt);
    const QString outer = indentationAt(text, closeAt);
    if (isIndentation(QStringView(text).sliced(start, closeAt - start))) {
        text.insert(start, indented(lines, outer + unit, unit));
    } else {
        text.insert(closeAt, u'\n' + indented(lines, outer + unit, unit) + outer);
    }
}

/// Puts lines after an element. @param end  of the element
void insertAfter(QString &text, qsizetype end, const QStringList &lines)
{
    const QString unit = indentationUnit(text);
    QString added = u'\n' + indented(lines, indentationAt(text, end), unit);
    added.chop(1); // the line goes on as it did
    text.insert(end, added);
}

/// The end of an element with its closing tag.
qsizetype endOfElement(const QString &text, const TextRange &inside)
{
    const qsizetype close = text.indexOf(u'>', inside.end);
    return close < 0 ? text.size() : close + 1;
}

/// A name with a number that none of the others has.
QString freeName(const QString &front, const QStringList &others)
{
    for (int number = 1;; ++number) {
        const QString name = front + QString::number(number);
        if (!others.contains(name, Qt::CaseInsensitive)) {
            return name;
        }
    }
}

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

/// Selects the value of an element at or after a position.
TextRange valueAfter(const QString &text, qsizetype position, const char *name)
{
    const QString tag = u'<' + QString::fromLatin1(name) + u'>';
    const qsizetype at = text.indexOf(tag, position, Qt::CaseInsensitive);
    const qsizetype begin = at < 0 ? position : at + tag.size();
    const qsizetype end = at < 0 ? position : text.indexOf(u'<', begin);
    return {begin, end < 0 ? text.size() : end};
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

EditedTemplate withField(const QString &text, qsizetype position)
{
    const TemplateOutline outline = outlineOf(text);
    const OutlineOutput *output = outputAt(outline, position);
    if (output == nullptr) {
        return refused(text, Xlate("A field belongs to a table or a block: put the cursor into one."));
    }
    const OutlineVariable variable = nextVariable(*outline.templateAt(position), *output);
    QString made = text;
    if (output->fields.empty()) {
        const QStringList line(fieldText(variable, output->isTable));
        if (output->outputList.exists()) {
            insertInside(made, output->outputList, line);
            return {made, valueAfter(made, output->outputList.begin, "Label"), QString()};
        }
        const TextRange head = output->use.range.exists() ? output->use.range : output->name.range;
        if (!head.exists()) {
            return refused(text, Xlate("The table or block needs a name first."));
        }
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

std::optional<VariableUse> variableAt(const QString &text, qsizetype position)
{
    const TemplateOutline outline = outlineOf(text);
    const OutlineTemplate *one = outline.templateAt(position);
    const auto use = one != nullptr ? useAt(*one, position) : std::nullopt;
    return use && !use->name.isEmpty() && fieldMarker(use->name) == FieldMarker::None ? use : std::nullopt;
}

EditedTemplate withRenamedVariable(const QString &text, qsizetype position, const QString &name)
{
    const auto use = variableAt(text, position);
    if (!use) {
        return refused(text, Xlate("Put the cursor on a variable first: in a field, a sort key or a dictionary."));
    }
    const TemplateOutline outline = outlineOf(text);
    const OutlineTemplate &one = *outline.templateAt(position);
    if (const QString wrong = wrongName(one, *use, name); !wrong.isEmpty()) {
        return refused(text, wrong);
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

TextDifference differenceOf(const QString &before, const QString &after)
{
    const qsizetype most = std::min(before.size(), after.size());
    qsizetype front = 0;
    while (front < most && before[front] == after[front]) {
        ++front;
    }
    qsizetype back = 0;
    while (back < most - front && before[before.size() - 1 - back] == after[after.size() - 1 - back]) {
        ++back;
    }
    // A pair of characters that make one is not taken apart.
    front -= front > 0 && before[front - 1].isHighSurrogate() ? 1 : 0;
    back -= back > 0 && after[after.size() - back].isLowSurrogate() ? 1 : 0;
    return {front, before.size() - front - back, after.mid(front, after.size() - front - back)};
}

} // namespace kareport
