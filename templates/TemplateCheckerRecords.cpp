// The check of what a template holds: dictionaries, tables, blocks and their fields.
#include "FieldMarker.h"
#include "LeadingInteger.h"
#include "ScanNoteText.h"
#include "TemplateChecker.h"
#include "TemplateRecords.h"
#include "VariableKeywords.h"
#include "Xlate.h"

#include <algorithm>

namespace kareport
{

namespace
{

/// A width, or width and decimals, as a person writes them.
bool isFormat(QStringView format)
{
    const QStringView text = format.trimmed();
    const auto isNumber = [](QStringView digits) {
        return !digits.isEmpty() &&
               std::all_of(digits.begin(), digits.end(), [](QChar digit) { return digit >= u'0' && digit <= u'9'; });
    };
    const QStringView whole = text.startsWith(u'-') ? text.sliced(1) : text;
    const qsizetype point = whole.indexOf(u'.');
    return point < 0 ? isNumber(whole) : isNumber(whole.first(point)) && isNumber(whole.sliced(point + 1));
}

QStringList typeKeywords()
{
    QStringList keywords;
    for (int type = 0; type <= VARIABLE_THICKNESS; ++type) {
        if (const QStringView keyword = keywordOf(type); !keyword.isEmpty()) {
            keywords.append(keyword.toString());
        }
    }
    return keywords;
}

} // namespace

void TemplateChecker::checkDictionaries(const std::vector<DictionaryElement> &dictionaries)
{
    variables_.clear();
    dictionaries_.clear();
    for (const DictionaryElement &dictionary : dictionaries) {
        if (dictionary.name.value.isEmpty()) {
            error(dictionary.element.source, Xlate("the dictionary has no <DictionaryName>"));
        } else if (dictionaries_.contains(dictionary.name.value.text(), Qt::CaseInsensitive)) {
            warning(dictionary.name.source,
                    Xlate("a dictionary named %1 comes before this one: the variables of both count together")
                        .arg(quotedValue(dictionary.name)));
        } else {
            dictionaries_.append(dictionary.name.value.text());
        }
        checkVariables(dictionary);
    }
}

void TemplateChecker::checkVariables(const DictionaryElement &dictionary)
{
    Names &known = variables_[foldedKey(dictionary.name.value.view())];
    std::unordered_map<qint32, QString> ids;
    for (const VariableElement &variable : dictionary.variables) {
        if (!variableTypeFromKeyword(variable.type.value.view())) {
            const QString sentence = Xlate("unknown type %1: the variable %2 is left out")
                                         .arg(quotedValue(variable.type), quotedValue(variable.variableName));
            error(variable.type.exists() ? variable.type.source : variable.element.source,
                  asking(sentence, variable.type.value.view(), typeKeywords()));
            continue;
        }
        const qint32 id = leadingInteger(variable.id.value.view());
        if (variable.id.value.text() != QString::number(id)) {
            warning(variable.id.exists() ? variable.id.source : variable.element.source,
                    Xlate("the identifier %1 counts as %2: a whole number was expected")
                        .arg(quotedValue(variable.id), QString::number(id)));
        }
        if (known.contains(variable.variableName.value.view())) {
            warning(variable.variableName.source,
                    Xlate("the variable %1 is in the dictionary twice: the last one counts")
                        .arg(quotedValue(variable.variableName)));
        } else if (ids.contains(id)) {
            warning(variable.element.source,
                    Xlate("the variables %1 and %2 share the identifier %3")
                        .arg(ids.at(id), quotedValue(variable.variableName), QString::number(id)));
        }
        known.insert(variable.variableName.value.text());
        ids.insert_or_assign(id, quotedValue(variable.variableName));
    }
}

void TemplateChecker::checkOutput(const OutputElement &output, bool isTable)
{
    if (output.name.value.isEmpty()) {
        error(output.element.source, isTable ? Xlate("the table has no <Name>") : Xlate("the block has no <Name>"));
    }
    const bool hasDictionary = variables_.contains(foldedKey(output.use.value.view())) && !output.use.value.isEmpty();
    if (!hasDictionary) {
        const qsizetype source = output.use.exists() ? output.use.source : output.element.source;
        const QString sentence = Xlate("there is no dictionary named %1: %2 cannot be written")
                                     .arg(quotedValue(output.use), quotedValue(output.name));
        error(source, asking(sentence, output.use.value.view(), dictionaries_));
    }
    if (output.fields.empty()) {
        warning(output.element.source, Xlate("%1 has no fields").arg(quotedValue(output.name)));
    }
    const Names *variables = hasDictionary ? &variables_.at(foldedKey(output.use.value.view())) : nullptr;
    for (const FieldElement &field : output.fields) {
        checkField(field, variables, isTable);
    }
}

/// Of several tables, or blocks, of one name the first one is written.
void TemplateChecker::checkTwice(const std::vector<OutputElement> &outputs, bool isTable)
{
    Names names;
    for (const OutputElement &output : outputs) {
        if (output.name.value.isEmpty()) {
            continue;
        }
        if (names.contains(output.name.value.view())) {
            const QString sentence =
                isTable ? Xlate("a table named %1 comes before this one: the first one of a name is written")
                        : Xlate("a block named %1 comes before this one: the first one of a name is written");
            warning(output.name.source, sentence.arg(quotedValue(output.name)));
        }
        names.insert(output.name.value.text());
    }
}

void TemplateChecker::checkFormat(const FieldElement &field)
{
    const FieldFormat format = parseFieldFormat(field.format.value.view());
    const qsizetype source = field.format.exists() ? field.format.source : field.element.source;
    if (format.width > widestColumn || format.width < -widestColumn || format.decimals > widestColumn) {
        error(source, Xlate("the format %1 is beyond %2 characters")
                          .arg(quotedValue(field.format), QString::number(widestColumn)));
    } else if (!field.format.value.isEmpty() && !isFormat(field.format.value.view())) {
        warning(
            source,
            Xlate(
                "the format %1 counts as %2.%3: a width such as 12, or a width and decimals such as 12.3, was expected")
                .arg(quotedValue(field.format), QString::number(format.width), QString::number(format.decimals)));
    }
}

void TemplateChecker::checkField(const FieldElement &field, const Names *variables, bool isTable)
{
    const ScanElement &name = field.variableName;
    const qsizetype source = name.exists() ? name.source : field.element.source;
    const FieldMarker marker = fieldMarker(name.value.view());
    if (marker == FieldMarker::None && variables != nullptr && !variables->contains(name.value.view())) {
        const QString sentence =
            isTable ? Xlate("the dictionary has no variable %1: the column cannot be filled").arg(quotedValue(name))
                    : Xlate("the dictionary has no variable %1: the line repeats the value before it")
                          .arg(quotedValue(name));
        error(source, asking(sentence, name.value.view(), variables->all()));
    }
    checkFormat(field);
    const FieldFormat format = parseFieldFormat(field.format.value.view());
    const bool isShownAsItLooks = !scope_.hasPlaceholders || !field.label.value.view().contains(u'{');
    const qsizetype labelSize = field.label.value.size();
    if (isTable && isShownAsItLooks && field.format.exists() && labelSize > std::max(format.width, 0)) {
        warning(field.label.source, Xlate("the label %1 is wider than its column of %2: the column takes its width")
                                        .arg(quotedValue(field.label), QString::number(format.width)));
    }
    const QStringView align = field.align.value.view();
    if (!align.isEmpty() && !equalFolded(align, u"LEFT") && !equalFolded(align, u"RIGHT") &&
        !(isTable && equalFolded(align, u"CENTER")))
    {
        QStringList known = QStringLiteral("LEFT, RIGHT").split(QStringLiteral(", "));
        known += isTable ? QStringList(QStringLiteral("CENTER")) : QStringList();
        const QString sentence = Xlate("the alignment %1 counts as LEFT").arg(quotedValue(field.align));
        warning(field.align.source, asking(sentence, align, known));
    }
    checkText(field.label);
}

void TemplateChecker::checkText(const ScanElement &element)
{
    for (const auto *entity : {u"&amp;", u"&lt;", u"&gt;", u"&quot;", u"&apos;", u"&#", u"<![CDATA["}) {
        const qsizetype at = element.value.view().indexOf(entity);
        if (at >= 0) {
            warning(element.value.sourceOf(at), Xlate("%1 is printed unchanged").arg(entity));
        }
    }
}

} // namespace kareport
