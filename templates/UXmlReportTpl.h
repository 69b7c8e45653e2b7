#pragma once

#include "KaReportExport.h"
#include "OrientationOrder.h"
#include "sXmlReportBlock.h"
#include "sXmlReportDictionary.h"
#include "sXmlReportOption.h"
#include "sXmlReportTable.h"
#include "sXmlReportTemplateInfo.h"
#include "sXmlSortTableReport.h"

#include <QHashFunctions>
#include <QString>
#include <QStringList>

#include <functional>
#include <memory>
#include <unordered_map>
#include <vector>

namespace kareport
{
class ScanText;
}

/// One report template, read from a file that may hold several. Names are compared without regard to case.
///
/// The records that the functions hand out belong to this object; a pointer to one is valid until the next load or the
/// object's end.
class KAREPORT_EXPORT UXmlReportTpl
{
public:
    /// Holds no template until one is loaded.
    UXmlReportTpl();
    /// Destroys the records that were handed out.
    ~UXmlReportTpl();
    UXmlReportTpl(const UXmlReportTpl &) = delete;
    UXmlReportTpl &operator=(const UXmlReportTpl &) = delete;

    /// Reads a template file and chooses the template of a name; of several with that name, the last.
    /// @return false when the file cannot be read, the name is empty or the file has no such template. The object then
    ///         holds nothing, the list of templates included.
    bool LoadTemplate(const QString &fileName, const QString &templateName);

    /// Makes the text that is shown of a label. @param title  of the template
    using LabelText = std::function<QString(const QString &label, const QString &title)>;
    /// Has templates that are read from now on show other texts than the labels of their fields; null for the labels
    /// themselves. A column is at least as wide as what is shown.
    void SetLabelText(LabelText textOf) { labelText_ = std::move(textOf); }

    /// The title of the chosen template: of several with its name, the first one's; "" when no template has the name.
    QString GetTemplateTitle() const;

    /// Replaces the list by the names of all templates of the file, in file order; by none when memory ends.
    void GetAllTPLsByName(QStringList &names) const;
    /// Replaces the list by the titles of all templates of the file, in file order; by none when memory ends.
    void GetAllTPLsByTitle(QStringList &titles) const;
    /// Replaces the list by the names of the chosen template's tables, in file order.
    void GetAllTables(QStringList &names) const;
    /// Replaces the list by the names of the chosen template's blocks, in file order.
    void GetAllBlocks(QStringList &names) const;
    /// Replaces the list by the names of the chosen template's dictionaries, in file order.
    void GetAllDictionaries(QStringList &names) const;

    /// The page options of the chosen template; never null.
    const sXmlReportOption *GetOption() const { return &option_; }
    /// The column separator of the options, Latin-1; 0 for a template that names none.
    char GetSeparatorXmlOption() const { return option_.Separator; }
    /// Whether the options allow page breaks.
    bool GetPageBreakXmlOption() const { return option_.PageBreaks; }

    /// The first table of a name; null for an empty name or when there is none.
    const sXmlReportTable *GetTable(const QString &name) const;
    /// The first block of a name; null for an empty name or when there is none.
    const sXmlReportBlock *GetBlock(const QString &name) const;
    /// The first dictionary of a name; null for an empty name or when there is none.
    const sXmlReportDictionary *GetDictionary(const QString &name) const;
    /// The sort keys of a table; null for an empty name or a table without any.
    const sXmlSortTableReport *GetSortList(const QString &tableName) const;

    /// Gives a dictionary variable's identifier and type, as the fields that name it get them: of several dictionaries
    /// and variables of the names, the last. @return false, with nothing changed, when there is none
    bool FindVariable(const QString &dictionaryName, const QString &variableName, qint32 &id, qint32 &type) const;

    /// Puts the fields "Northing" and "Easting" of a table into an order, each with its label, width and all. A table
    /// that lacks one of the two stays as it is.
    /// @return false when there is no such table
    bool SetNorthEastTableFieldOrder(const QString &tableName, ORIENTATION_ORDER order);

private:
    bool SetXml(const QString &xml);
    QString GetXml() const;

    bool ReadXmlData();
    bool ReadTemplatesAvailable();
    bool ReadTables();
    bool ReadDictionary();
    bool ReadBlocks();
    bool ReadOptions();
    void ReadSortData();
    void MergeTableWithDictionary();
    void MergeBlockWithDictionary();
    void MergeSortWithDictionary();
    void CleanData(bool keepText);
    QString shownLabel(const QString &label) const;

    struct VariableInfo
    {
        qint32 id;
        qint32 type;
    };
    using Variables =
        std::unordered_map<QString, VariableInfo>; ///< by their folded names; of several with one name, the last

    const Variables *variablesOf(const QString &dictionaryName) const;
    static bool GetDicInfo(const Variables *variables, const QString &variableName, qint32 &id, qint32 &type);

    std::unique_ptr<kareport::ScanText> xml_; ///< after loading, the body of the chosen template
    QString name_;
    LabelText labelText_;
    QStringList tableNames_;
    QStringList dictionaryNames_;
    QStringList blockNames_;
    std::vector<sXmlReportTable> tables_;
    std::vector<sXmlReportDictionary> dictionaries_;
    std::vector<sXmlReportBlock> blocks_;
    std::vector<sXmlReportTemplateInfo> templates_;
    std::vector<sXmlSortTableReport> sortLists_;
    sXmlReportOption option_;
    std::unordered_map<QString, Variables> variables_; ///< by the folded name of their dictionaries

    friend class UXmlReportTplTest;
};
