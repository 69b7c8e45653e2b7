#pragma once

#include "ResultFile.h"
#include "ResultOptions.h"
#include "UJobSettings.h"

#include <QString>

#include <string>
#include <vector>

namespace kareport
{

/// A report as a web page that needs nothing from elsewhere: its lines, headings, blocks and tables. Long reports become
/// several pages.
class HtmlResult : public ResultFile
{
public:
    /// @param fileName  of the first page, without its folder; empty where all is one page
    HtmlResult(const ResultOptions &options, const QString &fileName) : options_(options), fileName_(fileName) {}

    /// The name of a page, from 1: "points.html", "points-2.html", ...
    static QString pageName(const QString &fileName, std::size_t page);
    /// Whether a file is a further page of a first page. @param bytes  that it begins with, up to its first table
    static bool isPage(const QByteArray &bytes, const QString &fileName, std::size_t page);

    void beginReport(const ResultReport &report) override;
    bool beginTable(const ResultTable &table) override;
    void addRow(const ResultRow &row) override;
    void endTable() override;
    void addText(ResultText kind, QStringView text, int style) override;

protected:
    void writeEnd() override;

private:
    struct Column
    {
        std::size_t place = 0; ///< in the table
        ResultColumn column;
        bool isNumber = false;
        bool hasSortValue = false; ///< its texts are not what it is sorted by
        qsizetype tail = 0;        ///< characters from the decimal sign on
        std::string opening;       ///< the tag that a cell begins with, without its end
    };

    void addColumn(const ResultColumn &column, std::size_t place, const UJobSettings &settings);
    void beginPage();
    void endPage(bool isLast);
    void turnFullPage();
    void openTable();
    void addTableText(ResultText kind, QStringView text, int level);
    void writeHeading(const std::string &escaped);
    void writeAcross(const char *opening, const std::string &escaped);
    void beginBody(char kind);
    void endBody();
    void writeBlock(const ResultRow &row);
    void writeCells(const ResultRow &row);

    ResultOptions options_;
    QString fileName_;
    std::string title_; ///< escaped
    std::string made_;  ///< the paragraph under it
    UJobSettings settings_;
    std::vector<Column> columns_;
    std::string label_; ///< of the table, escaped
    bool isTable_ = false;
    bool isHeadPending_ = false;        ///< the heading of the table is not written yet
    std::vector<std::string> headings_; ///< of the groups that the next row is in, by their levels; escaped
    char body_ = 0;                     ///< what the open part of a table is: rows of data or totals; 0 for none
    bool bodyHasRows_ = false;          ///< and not headings of groups alone
    int rowsOnPage_ = 0;
    bool hasPage_ = false;
};

} // namespace kareport
