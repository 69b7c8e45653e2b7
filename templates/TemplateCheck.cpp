#include "TemplateCheck.h"

#include "FieldMarker.h"
#include "LeadingInteger.h"
#include "MemoryLasts.h"
#include "ScanNoteText.h"
#include "StandardText.h"
#include "TagLint.h"
#include "TemplateElements.h"
#include "TemplateRecords.h"
#include "TextFolding.h"
#include "TextPlaces.h"
#include "VariableKeywords.h"
#include "Xlate.h"

#include <QHashFunctions>

#include <algorithm>
#include <unordered_map>
#include <unordered_set>

namespace kareport
{

namespace
{

using Names = std::unordered_set<QString>; ///< folded

class Checker
{
public:
    explicit Checker(const TemplateFile &file) : places_(file.text()), scan_(file.scanText()) {}

    std::vector<TemplateRemark> check();

private:
    void error(qsizetype source, const QString &text) { remarks_.push_back({places_.of(source), true, text}); }
    void warning(qsizetype source, const QString &text) { remarks_.push_back({places_.of(source), false, text}); }

    void checkTags();
    void checkNames(const std::vector<TemplateElement> &templates);
    void checkTemplate(const TemplateElement &element);
    void checkDictionaries(const std::vector<DictionaryElement> &dictionaries);
    void checkVariables(const DictionaryElement &dictionary);
    void checkOutput(const OutputElement &output, bool isTable);
    void checkField(const FieldElement &field, const Names *variables, bool isTable);
    void checkText(const ScanElement &element);
    void addNotes();

    TextPlaces places_;
    ScanText scan_;
    ScanNotes notes_;
    std::unordered_map<QString, Names> variables_; ///< of the current template, by the dictionary's folded name
    std::vector<TemplateRemark> remarks_;
};

std::vector<TemplateRemark> Checker::check()
{
    checkTags();
    const auto templates = readTemplateElements(scan_, &notes_);
    if (templates.empty() && notes_.empty()) {
        error(0, Xlate("no template was read: a <ReportTemplate> element was expected"));
    }
    checkNames(templates);
    for (const TemplateElement &element : templates) {
        checkTemplate(element);
    }
    addNotes();
    std::stable_sort(remarks_.begin(), remarks_.end(), [](const TemplateRemark &left, const TemplateRemark &right) {
        return std::pair(left.place.line, left.place.column) < std::pair(right.place.line, right.place.column);
    });
    return std::move(remarks_);
}

void Checker::checkTags()
{
    for (const TagRemark &remark : findIgnoredTags(scan_)) {
        if (remark.kind == TagRemark::Kind::InComment) {
            warning(remark.source, Xlate("%1 is read although it is in a comment").arg(remark.text));
        } else {
            error(remark.source, Xlate("%1 is not a tag: a tag has no blanks and no attributes").arg(remark.text));
        }
    }
}

void Checker::checkNames(const std::vector<TemplateElement> &templates)
{
    Names names;
    for (const TemplateElement &element : templates) {
        if (element.name.value.isEmpty()) {
            error(element.body.source, Xlate("the template has no <Name>, so it cannot be chosen"));
            continue;
        }
        const QString key = foldedKey(element.name.value.view());
        if (names.contains(key)) {
            warning(element.name.source,
                    Xlate("a template named %1 comes before this one: the last one of a name is read")
                        .arg(quotedValue(element.name)));
        }
        names.insert(key);
    }
}

void Checker::checkTemplate(const TemplateElement &element)
{
    const ScanText &body = element.body.value;
    for (const auto *tag : {u"TABLES", u"BLOCKS"}) {
        const ScanElement list = GetNode(body, tag);
        if (list.exists() && element.name.source > list.source) {
            error(element.name.source, Xlate("the template's own <Name> must come before %1: this one was taken for it")
                                           .arg(bracketedTag(tag)));
            break;
        }
    }
    checkText(element.title);

    checkDictionaries(readDictionaryElements(body, &notes_));
    const auto tables = readTableElements(body, &notes_);
    const auto blocks = readBlockElements(body, &notes_);
    const auto sorts = readSortElements(body, &notes_);
    for (const OutputElement &table : tables) {
        checkOutput(table, true);
    }
    for (const OutputElement &block : blocks) {
        checkOutput(block, false);
    }
    for (const SortElement &sort : sorts) {
        const auto known = variables_.find(foldedKey(sort.use.value.view()));
        for (const ScanElement &name : sort.variableNames) {
            if (known != variables_.end() && !known->second.contains(foldedKey(name.value.view()))) {
                error(
                    name.source,
                    Xlate("the sort key %1 is not in the dictionary %2").arg(quotedValue(name), quotedValue(sort.use)));
            }
        }
    }

    const OptionElements options = readOptionElements(body, &notes_);
    if (!options.separator.exists() || options.separator.value.isEmpty()) {
        warning(options.options.exists() ? options.options.source : element.body.source,
                Xlate("no <Separator>: the columns are separated by the character 0"));
    }
}

void Checker::checkDictionaries(const std::vector<DictionaryElement> &dictionaries)
{
    variables_.clear();
    for (const DictionaryElement &dictionary : dictionaries) {
        if (dictionary.name.value.isEmpty()) {
            error(dictionary.element.source, Xlate("the dictionary has no <DictionaryName>"));
        }
        checkVariables(dictionary);
    }
}

void Checker::checkVariables(const DictionaryElement &dictionary)
{
    Names &known = variables_[foldedKey(dictionary.name.value.view())];
    std::unordered_map<qint32, QString> ids;
    for (const VariableElement &variable : dictionary.variables) {
        if (!variableTypeFromKeyword(variable.type.value.view())) {
            error(variable.type.exists() ? variable.type.source : variable.element.source,
                  Xlate("unknown type %1: the variable %2 is left out")
                      .arg(quotedValue(variable.type), quotedValue(variable.variableName)));
            continue;
        }
        const qint32 id = leadingInteger(variable.id.value.view());
        if (variable.id.value.text() != QString::number(id)) {
            warning(variable.id.exists() ? variable.id.source : variable.element.source,
                    Xlate("the identifier %1 counts as %2: a whole number was expected")
                        .arg(quotedValue(variable.id), QString::number(id)));
        }
        const QString key = foldedKey(variable.variableName.value.view());
        if (known.contains(key)) {
            warning(variable.variableName.source,
                    Xlate("the variable %1 is in the dictionary twice: the last one counts")
                        .arg(quotedValue(variable.variableName)));
        } else if (ids.contains(id)) {
            warning(variable.element.source,
                    Xlate("the variables %1 and %2 share the identifier %3")
                        .arg(ids.at(id), quotedValue(variable.variableName), QString::number(id)));
        }
        known.insert(key);
        ids.insert_or_assign(id, quotedValue(variable.variableName));
    }
}

void Checker::checkOutput(const OutputElement &output, bool isTable)
{
    if (output.name.value.isEmpty()) {
        error(output.element.source, isTable ? Xlate("the table has no <Name>") : Xlate("the block has no <Name>"));
    }
    const bool hasDictionary = variables_.contains(foldedKey(output.use.value.view())) && !output.use.value.isEmpty();
    if (!hasDictionary) {
        const qsizetype source = output.use.exists() ? output.use.source : output.element.source;
        error(source, Xlate("there is no dictionary named %1: %2 cannot be written")
                          .arg(quotedValue(output.use), quotedValue(output.name)));
    }
    if (output.fields.empty()) {
        warning(output.element.source, Xlate("%1 has no fields").arg(quotedValue(output.name)));
    }
    const Names *variables = hasDictionary ? &variables_.at(foldedKey(output.use.value.view())) : nullptr;
    for (const FieldElement &field : output.fields) {
        checkField(field, variables, isTable);
    }
}

void Checker::checkField(const FieldElement &field, const Names *variables, bool isTable)
{
    const ScanElement &name = field.variableName;
    const qsizetype source = name.exists() ? name.source : field.element.source;
    const FieldMarker marker = fieldMarker(name.value.view());
    if (marker == FieldMarker::None && variables != nullptr && !variables->contains(foldedKey(name.value.view()))) {
        error(source,
              isTable ? Xlate("the dictionary has no variable %1: the column cannot be filled").arg(quotedValue(name))
                      : Xlate("the dictionary has no variable %1: the line repeats the value before it")
                            .arg(quotedValue(name)));
    }
    const FieldFormat format = parseFieldFormat(field.format.value.view());
    const qsizetype formatSource = field.format.exists() ? field.format.source : field.element.source;
    if (format.width > widestColumn || format.width < -widestColumn || format.decimals > widestColumn) {
        error(formatSource, Xlate("the format %1 is beyond %2 characters")
                                .arg(quotedValue(field.format), QString::number(widestColumn)));
    }
    const qsizetype labelSize = field.label.value.size();
    if (isTable && field.format.exists() && labelSize > std::max(format.width, 0)) {
        warning(field.label.source, Xlate("the label %1 is wider than its column of %2: the column takes its width")
                                        .arg(quotedValue(field.label), QString::number(format.width)));
    }
    const QStringView align = field.align.value.view();
    if (!align.isEmpty() && !equalFolded(align, u"LEFT") && !equalFolded(align, u"RIGHT") &&
        !(isTable && equalFolded(align, u"CENTER")))
    {
        warning(field.align.source, Xlate("the alignment %1 counts as LEFT").arg(quotedValue(field.align)));
    }
    checkText(field.label);
}

void Checker::checkText(const ScanElement &element)
{
    for (const auto *entity : {u"&amp;", u"&lt;", u"&gt;", u"&quot;", u"&apos;", u"&#", u"<![CDATA["}) {
        const qsizetype at = element.value.view().indexOf(entity);
        if (at >= 0) {
            warning(element.value.sourceOf(at), Xlate("%1 is printed unchanged").arg(entity));
        }
    }
}

void Checker::addNotes()
{
    for (const ScanNote &note : notes_) {
        remarks_.push_back({places_.of(note.source), isScanError(note), scanNoteText(note)});
    }
}

std::optional<TemplateRemark> firstUnread(const TemplateFile &file)
{
    ScanNotes notes;
    readTemplateElements(file.scanText(), &notes);
    for (const ScanNote &note : notes) {
        if (note.tag == u"REPORTTEMPLATE" && isScanError(note)) {
            return TemplateRemark{TextPlaces(file.text()).of(note.source), true, scanNoteText(note)};
        }
    }
    return std::nullopt;
}

TemplateRemark noMemory()
{
    return {TextPlace(), true, noMemoryText()};
}

} // namespace

std::vector<TemplateRemark> checkTemplates(const TemplateFile &file)
{
    std::vector<TemplateRemark> remarks;
    if (!doneWhileMemoryLasts([&] { remarks = Checker(file).check(); })) {
        remarks.push_back(noMemory());
    }
    return remarks;
}

std::optional<TemplateRemark> firstUnreadTemplate(const TemplateFile &file)
{
    std::optional<TemplateRemark> remark;
    if (!doneWhileMemoryLasts([&] { remark = firstUnread(file); })) {
        remark = noMemory();
    }
    return remark;
}

} // namespace kareport
