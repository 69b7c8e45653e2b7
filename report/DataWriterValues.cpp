#include "DataWriter.h"

#include "WideVectors.h"
#include "WrittenRecord.h"

#include <algorithm>

// How values become the lines of blocks and the rows of tables.

namespace kareport
{

namespace
{

/// As the heading of a table has them.
constexpr qsizetype mostHeadingBlanks = 98;

/// Counts a value by how it shows.
KA_REMARK void addShown(DataRemarks &remarks, ColumnRemarks &column, Shown shown, quint64 row)
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

/// Counts a value that is not there, so that a block has no line for it.
void addUnwritten(DataRemarks &remarks, ColumnRemarks &column, const FieldFormatter &field,
                  const FormatOptions &options)
{
    if (field.marker() == FieldMarker::None && field.showsZeroForNone(FormatOptions())) {
        remarks.add(column.unwritten, 0);
        column.isBlankAsked = !field.showsZeroForNone(options);
    }
}

} // namespace

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
        ColumnRemarks *about = remarks != nullptr ? &remarks->columns[static_cast<std::size_t>(i)] : nullptr;
        if (entry == nullptr) {
            if (about != nullptr) {
                addUnwritten(*remarks, *about, formatter, options_);
            }
            if (feed_.isOpen() && formatter.marker() == FieldMarker::None) {
                feed_.skip();
            }
            continue;
        }
        row_.clear();
        row_.append(field.Label);
        row_.append(options_.separator);
        const std::size_t start = row_.size();
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

} // namespace kareport
