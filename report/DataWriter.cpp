#include "DataWriter.h"

#include "GroupedTable.h"
#include "WrittenRecord.h"

#include <QScopeGuard>

#include <algorithm>

namespace kareport
{

namespace
{

/// A heading of a table needs this many lines and one more for a row.
constexpr int headingRoom = 3;
constexpr int linesOfName = 3; ///< a table's name with a blank line before and after it
constexpr int usualHeadingLinesAfter = 2;

const PageHeading noHeading = {QString(), 0, usualHeadingLinesAfter};

std::vector<FieldFormatter> formattersOf(const UXmlReportTable &table)
{
    std::vector<FieldFormatter> fields;
    fields.reserve(static_cast<std::size_t>(table.GetFieldsCount()));
    for (int i = 0; i < table.GetFieldsCount(); ++i) {
        fields.emplace_back(table.GetField(i));
    }
    return fields;
}

/// Says which line of the report the row is in that was written last.
KA_REMARK void setRowLine(DataRemarks &remarks, qint64 line)
{
    remarks.setLine(line);
}

} // namespace

QString chainageWordOf(const QString &heading)
{
    return heading.contains(u"Chainage") ? QStringLiteral("Chainage") : QStringLiteral("Station");
}

QString withChainageLabel(QString heading, const QString &label)
{
    const QString word = chainageWordOf(heading);
    return heading.replace(word, label);
}

void DataWriter::writeTable(const UXmlReportTable &table, UDataObjectList &list, const TableLayout &layout)
{
    page_.skipLines(layout.linesBefore);
    std::vector<quint32> sortIds;
    if (!table.GetSortList(sortIds)) {
        page_.noteLostText();
        return;
    }
    if (!sortIds.empty()) {
        list.Sort(sortIds);
    }
    const int linesAfter = layout.headingLinesAfter == -1 ? usualHeadingLinesAfter : layout.headingLinesAfter;
    page_.setHeading({withChainageLabel(table.GetHeading(), layout.chainageLabel), 0, linesAfter});
    std::vector<qint64> headings;
    const auto noHeadings = qScopeGuard([this] { page_.noteHeadings(nullptr); });
    if (cells_ != nullptr) {
        record_ = cells_->begin(cellRecord(table, true, table.GetTableName()));
        page_.noteHeadings(&headings);
    }
    auto *groups = dynamic_cast<GroupedList *>(&list);
    const bool isGrouped = groups != nullptr && !groups->groups().isEmpty();
    if (!isGrouped) {
        placeHeading(table, layout.writeName, 0);
    }
    DataRemarks unwanted;
    DataRemarks &remarks = layout.remarks != nullptr ? *layout.remarks : unwanted;
    remarks = remarksFor(table, remarks);
    feed_.beginTable(table, layout.chainageLabel, isGrouped && groups->groups().addsPrinted);
    if (isGrouped) {
        writeGroups(table, list, *groups, layout.writeName, remarks);
    } else {
        writeRows(table, list, remarks);
    }
    feed_.endTable();
    if (cells_ != nullptr) {
        addHeadingCells(table, layout.chainageLabel, headings);
    }
    endOutput(layout.linesAfter);
}

/// At a page's start the header brings the heading with it. Without headers the heading is then not written at all,
/// which hosts that lay out their own pages count on.
/// @param lines  that stay with the heading, where a page can hold as many; 0 where they were not counted
void DataWriter::placeHeading(const UXmlReportTable &table, bool writeName, qint64 lines)
{
    if (page_.heading().text.isEmpty()) {
        return;
    }
    if (page_.lineCount() == 0) {
        page_.beginFirstPage();
        return;
    }
    const qint64 needed = std::max(page_.heading().linesAfter, 0) + (writeName ? linesOfName : 0) + lines;
    const bool isApart = lines > 0 && page_.linesLeft() < needed && needed < page_.linesPerPage();
    if (page_.linesLeft() <= headingRoom || isApart) {
        page_.breakPage();
        return;
    }
    if (writeName) {
        page_.lineFeed(1);
        page_.writeLine(table.GetTableName(), 0, 1, 0);
        page_.lineFeed(1);
    }
    page_.writeHeading();
}

void DataWriter::writeRows(const UXmlReportTable &table, UDataObjectList &list, DataRemarks &remarks)
{
    const std::vector<FieldFormatter> fields = formattersOf(table);
    const quint64 losses = page_.losses();
    const UDataObject *object = list.GetAt(0);
    // With a row missing, those after it are of no use either.
    for (std::size_t index = 1; object != nullptr && page_.losses() == losses; ++index) {
        // The row is complete before the next object is asked for: a list may hold one object at a time.
        formatRow(fields, *object, index - 1, remarks);
        if (feed_.isOpen()) {
            feed_.endRow(*object);
        }
        remarks.rows = index;
        object = list.GetAt(index);
        if (object != nullptr) {
            page_.writeLine(row_.view(), 0, 1, 0);
            addCells(rowCells_, page_.lastPieceStart());
            setRowLine(remarks, page_.lineCount());
            continue;
        }
        // The last line end may turn the page: without a heading it does not begin with one over no rows.
        page_.newPage(0);
        page_.write(row_.view(), 0);
        addCells(rowCells_, page_.lastPieceStart());
        page_.noteChange();
        page_.setHeading(noHeading);
        page_.writeLine(QStringView(), 0, 1, 0);
        setRowLine(remarks, page_.lineCount());
    }
}

/// The heading is not placed before it is known how many lines stay with it.
void DataWriter::writeGroups(const UXmlReportTable &table, UDataObjectList &list, GroupedList &groups, bool writeName,
                             DataRemarks &remarks)
{
    const std::vector<FieldFormatter> fields = formattersOf(table);
    bool isPlaced = false;
    const auto placeOnce = [&](qint64 lines) {
        isPlaced = true;
        placeHeading(table, writeName, lines);
    };
    GroupResults results(feed_, [&](const UDataObject &object, int level) {
        DataRemarks unused = remarksFor(table, DataRemarks());
        formatRow(fields, object, 0, unused);
        feed_.endRow(object, level);
    });
    GroupedTable grouped(page_, options_, table, groups, remarks);
    grouped.giveResults(results);
    grouped.write({list,
                   [&](const UDataObject &object, quint64 row) {
                       formatRow(fields, object, row, remarks);
                       if (cells_ != nullptr) {
                           waitingCells_.emplace_back(row + 1, rowCells_);
                       }
                       return row_.view();
                   },
                   placeOnce,
                   [&](quint64 row) {
                       while (!waitingCells_.empty() && waitingCells_.front().first <= row) {
                           if (waitingCells_.front().first == row) {
                               addCells(waitingCells_.front().second, page_.lastPieceStart());
                           }
                           waitingCells_.pop_front();
                       }
                   }});
    if (!isPlaced) {
        placeOnce(0);
    }
}

void DataWriter::endOutput(int linesAfter)
{
    page_.setHeading(noHeading);
    page_.skipLines(linesAfter);
}

} // namespace kareport
