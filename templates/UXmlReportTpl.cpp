#include "UXmlReportTpl.h"

#include "MemoryLasts.h"
#include "ScanText.h"
#include "TemplateFile.h"
#include "TextFolding.h"

#include <algorithm>

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
