#include "UXmlReportTpl.h"

#include "LeadingInteger.h"
#include "MemoryLasts.h"
#include "ScanText.h"
#include "TemplateElements.h"
#include "TemplateFile.h"
#include "TemplateRecords.h"
#include "TextFolding.h"
#include "VariableKeywords.h"

#include <algorithm>
#include <optional>

using kareport::equalFolded;
using kareport::foldedKey;

namespace
{

template <typename Records, typename Member>
auto findByName(const Records &records, Member member, const QString &name) -> decltype(records.data())
{
    if (name.isEmpty()) {
        return nullptr;
    }
    const auto found = std::find_if(records.begin(), records.end(),
                                    [&](const auto &record) { return equalFolded(record.*member, name); });
    return found == records.end() ? nullptr : &*found;
}

/// Lists what all templates have; nothing where memory ends, as some of it would be taken for all.
void listTemplates(const std::vector<sXmlReportTemplateInfo> &templates, QString sXmlReportTemplateInfo::*member,
                   QStringList &texts)
{
    texts.clear();
    const bool isWhole = kareport::doneWhileMemoryLasts([&] {
        for (const auto &info : templates) {
            texts.append(info.*member);
        }
    });
    if (!isWhole) {
        texts.clear();
    }
}

} // namespace

UXmlReportTpl::UXmlReportTpl() : xml_(std::make_unique<kareport::ScanText>())
{
    CleanData(false);
}

UXmlReportTpl::~UXmlReportTpl() = default;

bool UXmlReportTpl::LoadTemplate(const QString &fileName, const QString &templateName)
{
    const bool isLoaded = kareport::whileMemoryLasts(false, [&] {
        const auto text = kareport::TemplateFile::readScanned(fileName);
        if (!text || templateName.isEmpty()) {
            return false;
        }
        name_ = templateName;
        *xml_ = kareport::ScanText(*text);
        return ReadXmlData();
    });
    if (!isLoaded) {
        CleanData(false);
    }
    return isLoaded;
}

bool UXmlReportTpl::SetXml(const QString &xml)
{
    *xml_ = kareport::ScanText(xml);
    return ReadXmlData();
}

QString UXmlReportTpl::GetXml() const
{
    return xml_->text();
}

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
                       kareport::tableField);
        tableNames_.append(table.Name);
        tables_.push_back(std::move(table));
    }
    return true;
}

bool UXmlReportTpl::ReadBlocks()
{
    for (const auto &element : kareport::readBlockElements(*xml_)) {
        sXmlReportBlock block{element.name.value.text(), element.use.value.text(), {}};
        block.Fields.reserve(element.fields.size());
        std::transform(element.fields.begin(), element.fields.end(), std::back_inserter(block.Fields),
                       kareport::blockField);
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

bool UXmlReportTpl::FindVariable(const QString &dictionaryName, const QString &variableName, qint32 &id,
                                 qint32 &type) const
{
    return kareport::whileMemoryLasts(false,
                                      [&] { return GetDicInfo(variablesOf(dictionaryName), variableName, id, type); });
}

/// The variables of all dictionaries of a name; null when there is none.
const UXmlReportTpl::Variables *UXmlReportTpl::variablesOf(const QString &dictionaryName) const
{
    const auto found = variables_.find(foldedKey(dictionaryName));
    return found == variables_.end() ? nullptr : &found->second;
}

bool UXmlReportTpl::GetDicInfo(const Variables *variables, const QString &variableName, qint32 &id, qint32 &type)
{
    if (variables == nullptr) {
        return false;
    }
    const auto variable = variables->find(foldedKey(variableName));
    if (variable == variables->end()) {
        return false;
    }
    id = variable->second.id;
    type = variable->second.type;
    return true;
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

void UXmlReportTpl::CleanData(bool keepText)
{
    tableNames_.clear();
    dictionaryNames_.clear();
    blockNames_.clear();
    tables_.clear();
    dictionaries_.clear();
    blocks_.clear();
    templates_.clear();
    sortLists_.clear();
    variables_.clear();
    option_ = sXmlReportOption();
    if (!keepText) {
        *xml_ = kareport::ScanText();
        name_.clear();
    }
}

QString UXmlReportTpl::GetTemplateTitle() const
{
    for (const auto &info : templates_) {
        if (equalFolded(info.Name, name_)) {
            return info.Title;
        }
    }
    return QString();
}

void UXmlReportTpl::GetAllTPLsByName(QStringList &names) const
{
    listTemplates(templates_, &sXmlReportTemplateInfo::Name, names);
}

void UXmlReportTpl::GetAllTPLsByTitle(QStringList &titles) const
{
    listTemplates(templates_, &sXmlReportTemplateInfo::Title, titles);
}

void UXmlReportTpl::GetAllTables(QStringList &names) const
{
    names = tableNames_;
}

void UXmlReportTpl::GetAllBlocks(QStringList &names) const
{
    names = blockNames_;
}

void UXmlReportTpl::GetAllDictionaries(QStringList &names) const
{
    names = dictionaryNames_;
}

const sXmlReportTable *UXmlReportTpl::GetTable(const QString &name) const
{
    return findByName(tables_, &sXmlReportTable::Name, name);
}

const sXmlReportBlock *UXmlReportTpl::GetBlock(const QString &name) const
{
    return findByName(blocks_, &sXmlReportBlock::Name, name);
}

const sXmlReportDictionary *UXmlReportTpl::GetDictionary(const QString &name) const
{
    return findByName(dictionaries_, &sXmlReportDictionary::DictionaryName, name);
}

const sXmlSortTableReport *UXmlReportTpl::GetSortList(const QString &tableName) const
{
    return findByName(sortLists_, &sXmlSortTableReport::Name, tableName);
}

bool UXmlReportTpl::SetNorthEastTableFieldOrder(const QString &tableName, ORIENTATION_ORDER order)
{
    const auto table = std::find_if(tables_.begin(), tables_.end(),
                                    [&](const auto &candidate) { return equalFolded(candidate.Name, tableName); });
    if (tableName.isEmpty() || table == tables_.end()) {
        return false;
    }
    const sXmlReportField *northing = nullptr;
    const sXmlReportField *easting = nullptr;
    for (const sXmlReportField &field : table->Fields) {
        const bool isNorthing = equalFolded(field.VariableName, u"Northing");
        if (!isNorthing && !equalFolded(field.VariableName, u"Easting")) {
            continue;
        }
        const bool isFirst = northing == nullptr && easting == nullptr;
        if (isFirst && order == (isNorthing ? ORDER_NORTHING_EASTING : ORDER_EASTING_NORTHING)) {
            return true;
        }
        (isNorthing ? northing : easting) = &field;
    }
    if (northing == nullptr || easting == nullptr) {
        return true;
    }
    const sXmlReportField northingField = *northing;
    const sXmlReportField eastingField = *easting;
    for (sXmlReportField &field : table->Fields) {
        if (equalFolded(field.VariableName, u"Northing")) {
            field = eastingField;
        } else if (equalFolded(field.VariableName, u"Easting")) {
            field = northingField;
        }
    }
    return true;
}
