#pragma once

#include "DataRemarks.h"
#include "FieldFormatter.h"
#include "GroupedList.h"
#include "PageWriter.h"
#include "ResultFeed.h"
#include "UDataObjectList.h"
#include "UXmlReportBlock.h"
#include "UXmlReportTable.h"
#include "WrittenCells.h"

#include <QString>

#include <deque>
#include <utility>
#include <vector>

namespace kareport
{

/// Writes data objects through a template: one object as a block, a list of them as a table.
class DataWriter
{
public:
    /// @param results  receives the values that are written; may be null
    /// @param cells    receives where they are shown; may be null
    DataWriter(PageWriter &page, const FormatOptions &options, ResultSink *results = nullptr,
               WrittenCells *cells = nullptr)
        : page_(page), options_(options), feed_(results, options), cells_(cells)
    {}

    /// @param remarks  receives what the block does not show as it is; may be null
    /// @param name     of the block, for its cells
    void writeBlock(const UXmlReportBlock &block, const UDataObject &object, int linesBefore, int linesAfter,
                    DataRemarks *remarks = nullptr, const QString &name = QString());

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
    void addCells(const std::vector<WrittenCell> &line, qint64 start);
    void addHeadingCells(const UXmlReportTable &table, const QString &chainageLabel, const std::vector<qint64> &starts);

    PageWriter &page_;
    const FormatOptions &options_;
    TextBuffer row_;
    ResultFeed feed_;
    WrittenCells *cells_;               ///< null where they are not needed
    int record_ = 0;                    ///< of the cells
    std::vector<WrittenCell> rowCells_; ///< of the row that was formatted last, by their places in it
    std::deque<std::pair<quint64, std::vector<WrittenCell>>> waitingCells_; ///< of rows, from 1, without a place
};

/// The word of a table's heading that the chainage column's own label replaces: "Chainage" or, where there is none, "Station".
QString chainageWordOf(const QString &heading);
/// A table's heading with the chainage column's own label: it replaces every "Chainage" or, where there is none, every
/// "Station".
QString withChainageLabel(QString heading, const QString &label);

} // namespace kareport
