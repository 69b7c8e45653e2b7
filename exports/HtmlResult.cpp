#include "HtmlResult.h"

#include "DataText.h"
#include "HtmlPage.h"
#include "HtmlText.h"
#include "ResultReport.h"
#include "Xlate.h"

#include <QUrl>

namespace kareport
{

namespace
{

/// What leads from a page to the one before it, up to the end of its name.
std::string linkToPrevious(const QString &fileName, std::size_t page)
{
    std::string link = "<nav><a rel=\"prev\" href=\"";
    appendHtmlText(link, QString::fromLatin1(QUrl::toPercentEncoding(HtmlResult::pageName(fileName, page - 1))));
    return link;
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

bool HtmlResult::isPage(const QByteArray &bytes, const QString &fileName, std::size_t page)
{
    return bytes.contains(QByteArray::fromStdString(linkToPrevious(fileName, page)));
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
        out() += linkToPrevious(fileName_, page);
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

void HtmlResult::addText(ResultText kind, QStringView text, int style)
{
    beginPage();
    if (isTable_) {
        addTableText(kind, text, style);
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
