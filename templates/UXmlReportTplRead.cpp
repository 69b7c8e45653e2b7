// How a template is read: its elements become records, and these get their identifiers and types from the dictionaries.
#include "LeadingInteger.h"
#include "ScanText.h"
#include "TemplateElements.h"
#include "TemplateRecords.h"
#include "TextFolding.h"
#include "UXmlReportTpl.h"
#include "VariableKeywords.h"

#include <algorithm>
#include <iterator>
#include <optional>

using kareport::equalFolded;
using kareport::foldedKey;

bool UXmlReportTpl::ReadXmlData()
{
    CleanData(true);
    if (xml_->isEmpty() || !ReadTemplatesAvailable()) {
        return false;
    }
    if (!ReadTables() || !ReadDictionary() || !ReadBlocks() || !ReadOptions()) {
        return false;
    }
    ReadSortData();
    MergeTableWithDictionary();
    MergeBlockWithDictionary();
    MergeSortWithDictionary();
    return true;
}

bool UXmlReportTpl::ReadTemplatesAvailable()
{
    std::optional<kareport::ScanText> chosen; // the last one of the name
    kareport::TemplateSequence sequence(*xml_);
    while (auto element = sequence.next()) {
        templates_.push_back({element->name.value.text(), element->title.value.text()});
        if (equalFolded(element->name.value.view(), name_)) {
            chosen = std::move(element->body.value);
        }
    }
    if (!chosen) {
        return false;
    }
    *xml_ = *std::move(chosen);
    return true;
}

bool UXmlReportTpl::ReadTables()
{
    for (const auto &element : kareport::readTableElements(*xml_)) {
        sXmlReportTable table{element.name.value.text(), element.use.value.text(), {}};
        table.Fields.reserve(element.fields.size());
        std::transform(element.fields.begin(), element.fields.end(), std::back_inserter(table.Fields),
                       [this](const kareport::FieldElement &field) {
                           return kareport::tableField(field, shownLabel(field.label.value.text()));
                       });
        tableNames_.append(table.Name);
        tables_.push_back(std::move(table));
    }
    return true;
}

QString UXmlReportTpl::shownLabel(const QString &label) const
{
    return labelText_ ? labelText_(label, GetTemplateTitle()) : label;
}

bool UXmlReportTpl::ReadBlocks()
{
    for (const auto &element : kareport::readBlockElements(*xml_)) {
        sXmlReportBlock block{element.name.value.text(), element.use.value.text(), {}};
        block.Fields.reserve(element.fields.size());
        std::transform(element.fields.begin(), element.fields.end(), std::back_inserter(block.Fields),
                       kareport::blockField);
        for (sXmlReportField &field : block.Fields) {
            field.Label = shownLabel(field.Label);
        }
        blockNames_.append(block.Name);
        blocks_.push_back(std::move(block));
    }
    return true;
}

bool UXmlReportTpl::ReadDictionary()
{
    for (const auto &element : kareport::readDictionaryElements(*xml_)) {
        sXmlReportDictionary dictionary{element.name.value.text(), {}};
        auto &infos = variables_[foldedKey(dictionary.DictionaryName)];
        for (const auto &variable : element.variables) {
            const auto type = kareport::variableTypeFromKeyword(variable.type.value.view());
            if (!type) {
                continue;
            }
            const qint32 id = kareport::leadingInteger(variable.id.value.view());
            dictionary.Variables.push_back({variable.variableName.value.text(), id, *type});
            infos.insert_or_assign(foldedKey(variable.variableName.value.view()), VariableInfo{id, *type});
        }
        dictionaryNames_.append(dictionary.DictionaryName);
        dictionaries_.push_back(std::move(dictionary));
    }
    return true;
}

bool UXmlReportTpl::ReadOptions()
{
    const auto elements = kareport::readOptionElements(*xml_);
    option_.Separator = kareport::ParseSeparatorOption(elements.separator.value.view());
    option_.PageBreaks = !equalFolded(elements.pageBreaks.value.view(), u"NO");
    return true;
}

void UXmlReportTpl::ReadSortData()
{
    for (const auto &element : kareport::readSortElements(*xml_)) {
        sXmlSortTableReport list{element.name.value.text(), element.use.value.text(), {}};
        for (const auto &name : element.variableNames) {
            list.Entries.push_back({name.value.text(), 0});
        }
        sortLists_.push_back(std::move(list));
    }
}

void UXmlReportTpl::MergeTableWithDictionary()
{
    for (sXmlReportTable &table : tables_) {
        const Variables *variables = variablesOf(table.Use);
        for (sXmlReportField &field : table.Fields) {
            field.ID = 0;
            field.Type = 0;
            GetDicInfo(variables, field.VariableName, field.ID, field.Type);
        }
    }
}

// In blocks and sort lists a variable that the dictionary lacks takes over what the one before it had, through the whole
// merge. Templates in use count on it: a label line without a variable of its own shows with the value before it.
void UXmlReportTpl::MergeBlockWithDictionary()
{
    qint32 id = 0;
    qint32 type = 0;
    for (sXmlReportBlock &block : blocks_) {
        const Variables *variables = variablesOf(block.Use);
        for (sXmlReportField &field : block.Fields) {
            GetDicInfo(variables, field.VariableName, id, type);
            field.ID = id;
            field.Type = type;
        }
    }
}

void UXmlReportTpl::MergeSortWithDictionary()
{
    qint32 id = 0;
    qint32 type = 0;
    for (sXmlSortTableReport &list : sortLists_) {
        const Variables *variables = variablesOf(list.Use);
        for (sXmlSortVariable &entry : list.Entries) {
            GetDicInfo(variables, entry.VariableName, id, type);
            entry.ID = static_cast<quint32>(id);
        }
    }
}
