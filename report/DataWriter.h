#pragma once

#include "DataRemarks.h"
#include "FieldFormatter.h"
#include "GroupedList.h"
#include "PageWriter.h"
#include "ResultFeed.h"
#include "UDataObjectList.h"
#include "UXmlReportBlock.h"
#include "UXmlReportTable.h"

#include <QString>

namespace kareport
{

/// Writes data objects through a template: one object as a block, a list of them as a table.
class DataWriter
{
public:
    /// @param results  receives the values that are written; may be null
    DataWriter(PageWriter &page, const FormatOptions &options, ResultSink *results = nullptr)
        : page_(page), options_(options), feed_(results, options)
    {}

    /// @param remarks  receives what the block does not show as it is; may be null
    void writeBlock(const UXmlReportBlock &block, const UDataObject &object, int linesBefore, int linesAfter,
                    DataRemarks *remarks = nullptr);

    struct TableLayout
    {
        int linesBefore = 0;
        int linesAfter = 0;
        int headingLinesAfter = -1; ///< -1 for the usual 2
        QString chainageLabel;
        bool writeName = false;         ///< the table's name over its heading
        DataRemarks *remarks = nullptr; ///< receives what the table does not show as it is
    };
    void writeTable(const UXmlReportTable &table, UDataObjectList &list, const TableLayout &layout);

private:
    void placeHeading(const UXmlReportTable &table, bool writeName, qint64 lines);
    void writeRows(const UXmlReportTable &table, UDataObjectList &list, DataRemarks &remarks);
    void writeGroups(const UXmlReportTable &table, UDataObjectList &list, GroupedList &groups, bool writeName,
                     DataRemarks &remarks);
    void formatRow(const std::vector<FieldFormatter> &fields, const UDataObject &object, quint64 row,
                   DataRemarks &remarks);
    void endOutput(int linesAfter);

    PageWriter &page_;
    const FormatOptions &options_;
    TextBuffer row_;
    ResultFeed feed_;
};

/// The word of a table's heading that the chainage column's own label replaces: "Chainage" or, where there is none, "Station".
QString chainageWordOf(const QString &heading);
/// A table's heading with the chainage column's own label: it replaces every "Chainage" or, where there is none, every
/// "Station".
QString withChainageLabel(QString heading, const QString &label);

} // namespace kareport
