#include "DataWriter.h"

#include "GroupedTable.h"
#include "WideVectors.h"

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
/// As the heading of a table has them.
constexpr qsizetype mostHeadingBlanks = 98;

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

/// Remarks without any yet, which ask for what the earlier ones do.
/// @param record  a table or a block
template <typename Record>
DataRemarks remarksFor(const Record &record, const DataRemarks &earlier)
{
    DataRemarks remarks;
    remarks.measures = earlier.measures;
    remarks.columns.resize(static_cast<std::size_t>(record.GetFieldsCount()));
    for (int i = 0; i < record.GetFieldsCount(); ++i) {
        remarks.columns[static_cast<std::size_t>(i)].variable = record.GetField(i).VariableName;
    }
    return remarks;
}

/// What cells say of the table or block that they are in.
template <typename Record>
WrittenCells::Record cellRecord(const Record &record, bool isTable, const QString &name)
{
    WrittenCells::Record of{isTable, name, {}};
    for (int i = 0; i < record.GetFieldsCount(); ++i) {
        of.variables.push_back(record.GetField(i).VariableName);
    }
    return of;
}

/// Counts a value by how it shows.
void addShown(DataRemarks &remarks, ColumnRemarks &column, Shown shown, quint64 row)
{
    if (shown != Shown::Whole) {
        remarks.add(shown == Shown::TooWide ? column.tooWide : column.notFinite, row);
    }
}

/// Counts a value that is not there by how it shows.
void addMissing(DataRemarks &remarks, ColumnRemarks &column, const FieldFormatter &field, const FormatOptions &options,
                quint64 row)
{
    if (field.showsZeroForNone(options)) {
        remarks.add(column.missing, row);
    } else if (field.showsZeroForNone(FormatOptions())) {
        remarks.add(column.blank, row);
    }
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

void DataWriter::writeBlock(const UXmlReportBlock &block, const UDataObject &object, int linesBefore, int linesAfter,
                            DataRemarks *remarks, const QString &name)
{
    page_.skipLines(linesBefore);
    if (remarks != nullptr) {
        *remarks = remarksFor(block, *remarks);
        remarks->rows = 1;
    }
    feed_.beginBlock(block);
    if (cells_ != nullptr) {
        record_ = cells_->begin(cellRecord(block, false, name));
    }
    for (int i = 0; i < block.GetFieldsCount(); ++i) {
        const sXmlReportField field = block.GetField(i);
        const FieldFormatter formatter(field);
        const UDictEntry *entry = object.Find(formatter.id());
        if (entry == nullptr) {
            if (feed_.isOpen() && formatter.marker() == FieldMarker::None) {
                feed_.skip();
            }
            continue;
        }
        row_.clear();
        row_.append(field.Label);
        row_.append(options_.separator);
        const std::size_t start = row_.size();
        ColumnRemarks *about = remarks != nullptr ? &remarks->columns[static_cast<std::size_t>(i)] : nullptr;
        WidestText *widest = about != nullptr && remarks->measures ? &about->widest : nullptr;
        const Shown shown = formatter.append(row_, options_, entry->kind(), entry->GetData(), QStringView(), widest);
        if (feed_.isOpen() && formatter.marker() == FieldMarker::None) {
            feed_.take(formatter, entry, QStringView(), row_.from(start), shown);
        }
        // No column follows that a wide value would move: only what shows as "#" is lost.
        if (about != nullptr && !formatter.shows(entry->kind())) {
            addMissing(*remarks, *about, formatter, options_, 0);
        } else if (about != nullptr && (shown != Shown::TooWide || options_.printHash)) {
            addShown(*remarks, *about, shown, 0);
        }
        row_.trim(start);
        if (!page_.losesNothing([&] { page_.writeNumberedLine(row_.view(), field.Label.size(), 0, 1, 0); })) {
            break;
        }
        if (cells_ != nullptr) {
            cells_->add({page_.lastPieceStart(), static_cast<qsizetype>(row_.size()), record_, i, false});
        }
        if (about != nullptr) {
            remarks->addWidest(*about, 0);
            remarks->setLine(page_.lineCount());
        }
    }
    if (feed_.isOpen()) {
        feed_.endRow(object);
        feed_.endTable();
    }
    endOutput(linesAfter);
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
            remarks.setLine(page_.lineCount());
            continue;
        }
        // The last line end may turn the page: without a heading it does not begin with one over no rows.
        page_.newPage(0);
        page_.write(row_.view(), 0);
        addCells(rowCells_, page_.lastPieceStart());
        page_.noteChange();
        page_.setHeading(noHeading);
        page_.writeLine(QStringView(), 0, 1, 0);
        remarks.setLine(page_.lineCount());
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

void DataWriter::formatRow(const std::vector<FieldFormatter> &fields, const UDataObject &object, quint64 row,
                           DataRemarks &remarks)
{
    endWideVectors();
    row_.clear();
    rowCells_.clear();
    QStringView suffix;
    auto column = remarks.columns.begin();
    for (const FieldFormatter &field : fields) {
        ColumnRemarks &about = *column++;
        const std::size_t begin = row_.size();
        const auto noteCell = [&] {
            if (cells_ != nullptr) {
                rowCells_.push_back({static_cast<qint64>(begin), static_cast<qsizetype>(row_.size() - begin), record_,
                                     static_cast<int>(&field - fields.data()), false});
            }
        };
        switch (field.marker()) {
        case FieldMarker::SuffixR: suffix = u"R"; continue;
        case FieldMarker::SuffixPlus: suffix = u"+"; continue;
        case FieldMarker::Filler:
            field.append(row_, options_, ValueKind::None, nullptr, suffix);
            noteCell();
            break;
        case FieldMarker::None: {
            const UDictEntry *entry = object.Find(field.id());
            WidestText *const widest = remarks.measures ? &about.widest : nullptr;
            const qsizetype widestBefore = about.widest.width;
            const std::size_t start = row_.size();
            const Shown shown = entry != nullptr
                                    ? field.append(row_, options_, entry->kind(), entry->GetData(), suffix, widest)
                                    : field.append(row_, options_, ValueKind::None, nullptr, suffix, widest);
            if (entry != nullptr && field.shows(entry->kind())) {
                addShown(remarks, about, shown, row);
            } else { // a text that another variable of the same identifier has is not a number
                about.wideZeros += shown == Shown::TooWide ? 1U : 0U;
                addMissing(remarks, about, field, options_, row);
            }
            if (feed_.isOpen()) {
                feed_.take(field, entry, suffix, row_.from(start), shown);
            }
            if (about.widest.width != widestBefore) {
                remarks.addWidest(about, row);
            }
            noteCell();
            row_.append(options_.separator);
            break;
        }
        }
        suffix = QStringView();
    }
    if (row_.size() > 0 && row_.view().back() == QChar(options_.separator)) {
        row_.truncate(row_.size() - 1);
    }
}

/// Notes where the cells of a line are. @param start  of the line in the text
void DataWriter::addCells(const std::vector<WrittenCell> &line, qint64 start)
{
    for (WrittenCell cell : line) { // none where they are not needed
        cell.at += start;
        cells_->add(cell);
    }
}

/// Notes where the labels are in the headings of a table that were written.
void DataWriter::addHeadingCells(const UXmlReportTable &table, const QString &chainageLabel,
                                 const std::vector<qint64> &starts)
{
    const QString heading = table.GetHeading();
    const QString word = chainageWordOf(heading);
    const bool fills = table.GetColumnSeparator() != u"\t";
    std::vector<WrittenCell> labels;
    qsizetype at = 0;      // in the heading of the template
    qsizetype shownAt = 0; // in the one that is shown
    for (int i = 0; i < table.GetFieldsCount(); ++i) {
        const sXmlReportField field = table.GetField(i);
        const qsizetype blanks =
            fills ? std::clamp<qsizetype>(field.Width - field.Label.size(), 0, mostHeadingBlanks) : 0;
        const QString piece = heading.mid(at, field.Label.size() + blanks);
        const qsizetype shown = QString(piece).replace(word, chainageLabel).size();
        const qsizetype separator = fieldMarker(field.VariableName) == FieldMarker::None ? 1 : 0;
        labels.push_back({shownAt, shown, record_, i, true});
        at += piece.size() + separator;
        shownAt += shown + separator;
    }
    for (const qint64 start : starts) {
        addCells(labels, start);
    }
}

void DataWriter::endOutput(int linesAfter)
{
    page_.setHeading(noHeading);
    page_.skipLines(linesAfter);
}

} // namespace kareport
