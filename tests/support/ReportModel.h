#pragma once

#include "ReportPages.h"

#include <QRegularExpression>
#include <QString>
#include <QStringList>

#include <algorithm>
#include <vector>

/// A table of data, laid out.
struct ModelTable
{
    QString name; ///< the text above the heading; empty for none
    QString heading;
    QStringList rows;
    int before = 0;
    int after = 0;
    int headingAfter = 0;
};

/// A report as its rules say, as plainly as can be: every character knows whether a page begins at it. What it is compared
/// with is faster.
class ReportModel
{
public:
    explicit ReportModel(QString headerFront) : headerFront_(std::move(headerFront)) {}

    // What the writer does

    void clear();
    void setData(const QString &text);
    void setHeading(const QString &text, int before, int after);
    void setHeaderFlag(bool on) { headerFlag_ = on; }
    bool headerFlag() const { return headerFlag_; }
    void setLinesPerPage(int lines) { linesPerPage_ = lines; }
    int linesPerPage() const { return linesPerPage_; }
    int lineCount() const { return lineCount_; }

    void write(const QString &text);
    void lineFeed(int count);
    void writeHeader();
    void writeHeading();
    bool newPage(int needed);
    void writeLine(const QString &text, int before, int after);
    void writeTable(const ModelTable &table);
    void writeBlock(const QStringList &lines, int before, int after);
    /// A file has been read at the end of the report. @param lines  with the line ends that they keep
    void load(const QStringList &lines);
    /// The report has been read back from its file.
    void reload(const QString &text);
    /// Lines were counted that are no longer in the text.
    void countLines(int lines) { lineNumber_ += lines; }
    /// A file has taken the place of the text, whose lines are those of its source.
    void countLinesOfFile(int lines)
    {
        lineNumber_ += lines;
        lineCount_ += lines;
    }
    /// The view has put the same text with other line ends instead of this one.
    void withCrLf();

    /// Another text has taken the place of this one, whose pages begin there.
    void setTextWithStarts(const QString &text, const std::vector<qint64> &starts);

    // What the user does

    void replace(qint64 at, qint64 removed, const QString &inserted);

    // What there is then

    qint64 size() const { return static_cast<qint64>(cells_.size()); }
    QString text() const;
    std::vector<qint64> starts() const { return absolute(startsAt(0, size()), 0); }

    std::vector<kareport::ReportPage> pages() const;
    /// Where lines of a text begin that are page headers.
    static std::vector<qint64> headersIn(const QString &text);

private:
    struct Cell
    {
        QChar character;
        bool starts;
    };
    struct Change
    {
        qint64 at;
        QString removed;
        QString inserted;
        std::vector<qint64> before;
        std::vector<qint64> after;
    };

    void setText(const QString &text);
    void skipLines(int count);
    void endHeading() { setHeading(QString(), 0, 2); }
    static bool isHeader(const QString &line);
    bool beginsLine(qint64 at) const { return at == 0 || cells_[static_cast<std::size_t>(at - 1)].character == u'\n'; }
    void findHeaders(qint64 from);
    std::vector<qint64> startsAt(qint64 at, qint64 length) const;
    static std::vector<qint64> absolute(std::vector<qint64> offsets, qint64 at);
    static void trim(Change &change);
    /// The offsets at which an inserted piece begins pages; those beside it are begun at once.
    std::vector<qint64> broughtBy(const Change &change, qint64 at, const QString &inserted);
    void splice(const Change &change, const std::vector<qint64> &brought, bool isUndo);

    QString headerFront_;
    std::vector<Cell> cells_;
    bool startsAtEnd_ = false;
    std::vector<Change> history_; ///< what touched a start
    int linesPerPage_ = 72;
    int lineNumber_ = 0;
    int lineCount_ = 0;
    int page_ = 0;
    bool headerFlag_ = false;
    QString heading_;
    int headingBefore_ = 0;
    int headingAfter_ = 0;
};
