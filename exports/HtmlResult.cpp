#include "HtmlResult.h"

#include "DataText.h"
#include "HtmlPage.h"
#include "HtmlText.h"
#include "ResultReport.h"
#include "ShownNumber.h"
#include "VariableType.h"
#include "Xlate.h"

#include <QUrl>

namespace kareport
{

namespace
{

// The parts of a table.
constexpr char dataRows = 'd';
constexpr char groupHeading = 'g';
constexpr char totals = 't';

/// The characters of a number from its decimal sign on, or from the letters on that stand after it.
qsizetype tailOf(QStringView text)
{
    const qsizetype point = text.indexOf(u'.');
    if (point >= 0) {
        return text.size() - point;
    }
    qsizetype letters = 0;
    while (letters < text.size() && !text[text.size() - 1 - letters].isDigit()) {
        ++letters;
    }
    return letters;
}

} // namespace

QString HtmlResult::pageName(const QString &fileName, std::size_t page)
{
    if (page == 1) {
        return fileName;
    }
    const qsizetype dot = fileName.lastIndexOf(u'.');
    const qsizetype end = dot > fileName.lastIndexOf(u'/') + 1 ? dot : fileName.size();
    return fileName.left(end) + u'-' + QString::number(page) + fileName.mid(end);
}

void HtmlResult::beginReport(const ResultReport &report)
{
    title_.clear();
    const QString title = options_.title.isEmpty() ? report.title : options_.title;
    appendHtmlText(title_, title.isEmpty() ? Xlate("Report") : title); // no page is without a title
    made_ = "<p class=\"made\">";
    appendHtmlText(made_, report.application);
    if (report.time.isValid()) {
        made_ += ", <time datetime=\"";
        appendHtmlText(made_, report.time.toString(QStringLiteral("yyyy-MM-ddTHH:mm:ss")));
        made_ += "\">";
        appendHtmlText(made_, report.time.toString(QStringLiteral("yyyy-MM-dd HH:mm")));
        made_ += "</time>";
    }
    made_ += "</p>\n";
}

void HtmlResult::beginPage()
{
    if (hasPage_) {
        return;
    }
    hasPage_ = true;
    rowsOnPage_ = 0;
    markPage();
    std::string language;
    appendHtmlText(language, options_.language);
    out() += htmlHead(language) + "<title>" + title_ + "</title>\n</head>\n<body>\n<h1>" + title_ + "</h1>\n" + made_;
    const std::size_t page = pageCount();
    if (page > 1) {
        out() += "<nav><a rel=\"prev\" href=\"";
        appendHtmlText(out(), QString::fromLatin1(QUrl::toPercentEncoding(pageName(fileName_, page - 1))));
        out() += "\">&larr; " + std::to_string(page - 1) + "</a> " + std::to_string(page) + "</nav>\n";
    }
}

void HtmlResult::endPage(bool isLast)
{
    if (!isLast) {
        const std::size_t page = pageCount();
        out() += "<nav>" + std::to_string(page) + " <a rel=\"next\" href=\"";
        appendHtmlText(out(), QString::fromLatin1(QUrl::toPercentEncoding(pageName(fileName_, page + 1))));
        out() += "\">" + std::to_string(page + 1) + " &rarr;</a></nav>\n";
    }
    out() += htmlEnd();
    hasPage_ = false;
}

void HtmlResult::addColumn(const ResultColumn &column, std::size_t place, const UJobSettings &settings)
{
    Column added;
    added.place = place;
    added.column = column;
    added.isNumber = showsNumbers(column);
    const int type = column.field.Type;
    added.hasSortValue = type == VARIABLE_STATION || type == VARIABLE_OFFSET || type == VARIABLE_BEARING;
    if (added.isNumber) {
        const int decimals = shownDecimals(column, settings);
        added.tail = (decimals > 0 ? decimals + 1 : 0) + (hasSideLetter(column) ? 1 : 0);
    }
    const bool isRight = column.field.Align == u"R" || type == VARIABLE_BEARING;
    added.opening = added.isNumber               ? " class=\"n\""
                    : isRight                    ? " class=\"r\""
                    : column.field.Align == u"C" ? " class=\"c\""
                                                 : "";
    columns_.push_back(std::move(added));
}

bool HtmlResult::beginTable(const ResultTable &table)
{
    beginPage();
    settings_ = *table.settings;
    isTable_ = table.isTable;
    label_.clear();
    appendHtmlText(label_, table.name);
    columns_.clear();
    for (std::size_t i = 0; i < table.columns.size(); ++i) {
        if (table.columns[i].isShown) {
            addColumn(table.columns[i], i, settings_);
        }
    }
    if (isTable_) {
        writeTableHead();
    }
    return true;
}

void HtmlResult::writeTableHead()
{
    out() += "<table class=\"data\" aria-label=\"" + label_ + "\">\n<thead>\n<tr>";
    for (const Column &column : columns_) {
        out() += "<th scope=\"col\"" + column.opening;
        out() += column.hasSortValue && !column.isNumber ? " data-v><span>" : "><span>";
        appendHtmlText(out(), column.column.field.Label.trimmed());
        out() += "</span></th>";
    }
    out() += "</tr>\n</thead>\n";
}

/// Begins a part of the table, unless it is the open one.
void HtmlResult::beginBody(char kind)
{
    if (body_ == kind && kind != groupHeading) {
        return;
    }
    endBody();
    body_ = kind;
    out() += "<tbody class=\"";
    out() += kind;
    out() += "\">\n";
}

void HtmlResult::endBody()
{
    out() += body_ != 0 ? "</tbody>\n" : "";
    body_ = 0;
}

/// Goes on in a further page, under the heading of the table again, where the page has all the rows that it may have.
void HtmlResult::turnFullPage()
{
    if (rowsOnPage_ >= options_.rowsPerPage && !fileName_.isEmpty()) {
        endBody();
        out() += "</table>\n";
        endPage(false);
        beginPage();
        writeTableHead();
    }
}

void HtmlResult::addRow(const ResultRow &row)
{
    if (!isTable_) {
        writeBlock(row);
        return;
    }
    const bool isData = row.kind == ResultRowKind::Row;
    if (isData) {
        turnFullPage();
        ++rowsOnPage_;
    }
    beginBody(isData ? dataRows : totals);
    writeCells(row);
    flush();
}

void HtmlResult::writeCells(const ResultRow &row)
{
    out() += "<tr>";
    for (const Column &column : columns_) {
        const ResultCell &cell = row.cells[column.place];
        out() += "<td" + column.opening;
        if (column.hasSortValue) {
            if (const auto number = shownNumber(column.column, cell, settings_)) {
                out() += " data-v=\"";
                appendNumber(out(), *number, false);
                out() += '"';
            }
        }
        out() += '>';
        appendHtmlText(out(), cell.text);
        if (column.isNumber && !cell.text.isEmpty()) {
            for (qsizetype tail = tailOf(cell.text); tail < column.tail; ++tail) {
                out() += "\xC2\xA0"; // no digit follows here, and the decimal signs are below each other
            }
        }
        out() += "</td>";
    }
    out() += "</tr>\n";
}

void HtmlResult::writeBlock(const ResultRow &row)
{
    out() += "<table class=\"block\" aria-label=\"" + label_ + "\">\n<tbody>\n";
    for (const Column &column : columns_) {
        const ResultCell &cell = row.cells[column.place];
        if (cell.value == nullptr && cell.text.isEmpty()) {
            continue; // the report has no line for it
        }
        out() += "<tr><th scope=\"row\">";
        appendHtmlText(out(), column.column.field.Label.trimmed());
        out() += "</th><td>";
        appendHtmlText(out(), cell.text);
        out() += "</td></tr>\n";
    }
    out() += "</tbody>\n</table>\n";
    flush();
}

void HtmlResult::endTable()
{
    if (isTable_) {
        endBody();
        out() += "</table>\n";
    }
    isTable_ = false;
    flush();
}

void HtmlResult::addText(ResultText kind, QStringView text, int style)
{
    beginPage();
    if (isTable_) {
        if (kind == ResultText::GroupHeading) {
            turnFullPage(); // no heading is without a row under it
        }
        beginBody(kind == ResultText::GroupHeading ? groupHeading : totals);
        out() += "<tr><th scope=\"rowgroup\" colspan=\"" + std::to_string(columns_.size()) + "\">";
        appendHtmlText(out(), text);
        out() += "</th></tr>\n";
        flush();
        return;
    }
    if (text.trimmed().isEmpty()) {
        return;
    }
    const bool isHeading = kind == ResultText::Heading;
    const bool isBold = !isHeading && (style == 1 || style == 3);
    const bool isUnderlined = !isHeading && (style == 2 || style == 3);
    out() += isHeading ? "<h2>" : "<p>";
    out() += isBold ? "<b>" : "";
    out() += isUnderlined ? "<u>" : "";
    appendHtmlText(out(), text);
    out() += isUnderlined ? "</u>" : "";
    out() += isBold ? "</b>" : "";
    out() += isHeading ? "</h2>\n" : "</p>\n";
    flush();
}

void HtmlResult::writeEnd()
{
    beginPage(); // also of a report without anything
    endPage(true);
}

} // namespace kareport
