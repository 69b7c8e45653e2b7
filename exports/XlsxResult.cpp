#include "XlsxResult.h"

#include "ResultReport.h"
#include "UnitFactors.h"
#include "Xlate.h"

#include <QFile>

#include <utility>

namespace kareport
{

XlsxResult::XlsxResult(const ResultOptions &options, lxw_row_t rowsOfSheet)
    : options_(options), rowsOfSheet_(rowsOfSheet), book_(std::make_unique<XlsxBook>())
{
    setProblem(book_->problem());
}

void XlsxResult::beginReport(const ResultReport &report)
{
    title_ = report.title;
    properties_[0] = report.title.toUtf8();
    properties_[1] = report.application.toUtf8();
    created_ = report.time.isValid() ? report.time.toSecsSinceEpoch() : 0;
}

XlsxResult::Sheet XlsxResult::furtherSheet(const QString &name)
{
    Sheet sheet;
    sheet.sheet = book_->addSheet(name);
    return sheet;
}

/// The sheet of lines, headings and blocks, with room for one more row.
XlsxResult::Sheet &XlsxResult::textSheet()
{
    const bool isFirst = text_.sheet == nullptr;
    if (!isFirst && text_.nextRow < rowsOfSheet_) {
        return text_;
    }
    endTextSheet();
    text_ = furtherSheet(title_.isEmpty() ? Xlate("Report") : title_);
    if (isFirst && !title_.isEmpty()) {
        book_->writeText(text_.sheet, text_.nextRow, 0, title_, book_->formatOf({.isBold = true}));
        text_.nextRow += 2;
    }
    return text_;
}

void XlsxResult::endTextSheet()
{
    if (text_.sheet == nullptr) {
        return;
    }
    constexpr lxw_row_t mostRowsInView = 15; ///< with more, little of the window would move
    if (text_.tables == 1 && text_.headRow < mostRowsInView) {
        keepInView(text_);
    }
    setWidths(text_);
}

/// Keeps the heading of a sheet's table in view, and on every sheet of paper.
void XlsxResult::keepInView(const Sheet &sheet)
{
    worksheet_freeze_panes(sheet.sheet, sheet.headRow + 1, 0);
    worksheet_repeat_rows(sheet.sheet, sheet.headRow, sheet.headRow);
}

void XlsxResult::setWidths(Sheet &sheet)
{
    for (std::size_t i = 0; i < sheet.widths.size(); ++i) {
        if (sheet.widths[i] > 0) {
            const auto at = static_cast<lxw_col_t>(i);
            worksheet_set_column(sheet.sheet, at, at, sheet.widths[i], nullptr);
        }
    }
}

void XlsxResult::addText(ResultText kind, QStringView text, int style)
{
    if (!problem().isEmpty()) {
        return;
    }
    if (isTable_) {
        makeRoom();
        book_->writeText(table_.sheet, table_.nextRow++, 0, text, book_->formatOf({.isBold = true}));
        return;
    }
    Sheet &sheet = textSheet();
    const bool isBold = kind == ResultText::Heading || style == 1 || style == 3;
    book_->writeText(sheet.sheet, sheet.nextRow++, 0, text, isBold ? book_->formatOf({.isBold = true}) : nullptr);
}

QStringList XlsxResult::warnings() const
{
    QStringList warnings;
    if (book_->cutTexts() > 0) {
        warnings.append(
            Xlate("%1 texts are longer than a cell of a workbook holds, and are cut").arg(book_->cutTexts()));
    }
    if (columnsLeftOut_ > 0) {
        warnings.append(
            Xlate("%1 columns are more than a sheet of a workbook holds, and are left out").arg(columnsLeftOut_));
    }
    if (totalsAsValues_ > 0) {
        warnings.append(Xlate("%1 totals are values: a formula would show other digits, or does not reach their rows")
                            .arg(totalsAsValues_));
    }
    return warnings;
}

void XlsxResult::writeEnd()
{
    if (!problem().isEmpty()) {
        return;
    }
    if (text_.sheet == nullptr && table_.sheet == nullptr) {
        textSheet(); // a workbook has one sheet at least
    }
    endTextSheet();
    if (isSettingsKnown_) {
        properties_[2] = Xlate("Lengths in %1, areas in %2, angles in %3")
                             .arg(nameOf(settings_.lengthUnit), nameOf(settings_.areaUnit), nameOf(settings_.angleUnit))
                             .toUtf8();
    }
    lxw_doc_properties properties = {};
    properties.title = properties_[0].data();
    properties.author = properties_[1].data();
    properties.comments = properties_[2].data();
    properties.created = static_cast<time_t>(created_);
    book_->setProperties(properties);
    const QString wrong = book_->close();
    if (wrong.isEmpty()) {
        copyBook();
    } else {
        setProblem(wrong);
    }
}

/// Hands the bytes of the finished book on.
void XlsxResult::copyBook()
{
    QFile file(book_->path());
    if (!file.open(QIODevice::ReadOnly)) {
        setProblem(file.errorString());
        return;
    }
    constexpr qint64 piece = qint64(1) << 20;
    for (QByteArray bytes = file.read(piece); !bytes.isEmpty(); bytes = file.read(piece)) {
        out().append(bytes.constData(), static_cast<std::size_t>(bytes.size()));
        flush();
    }
}

} // namespace kareport
