#pragma once

#include "ApplicationTitle.h"
#include "DataUnits.h"
#include "DefaultPrinter.h"
#include "JsonPlaces.h"
#include "OutputKind.h"
#include "TableShape.h"
#include "UJobSettings.h"

#include <QDateTime>
#include <QHash>
#include <QJsonObject>
#include <QMargins>
#include <QString>

#include <memory>
#include <optional>
#include <variant>
#include <vector>

namespace kareport
{

class DataSource;

/// What a report is made of: a job file that has been read, or the short form of the command line. File names are
/// complete.
struct Job
{
    struct Page
    {
        DefaultPrinter printer{PrinterSource::BuiltIn, PaperSize::A4, 600};
        bool portrait = true;
        std::optional<QMargins> margins; ///< hundredths of a millimetre
        std::optional<QString> fontName;
        std::optional<int> fontSize; ///< points
        std::optional<int> linesPerPage;
        std::optional<int> charsPerRow;

        /// Whether the page is given. Any other is measured with a font, which needs a running QGuiApplication.
        bool isFixed() const { return linesPerPage && charsPerRow; }
    };
    struct Template
    {
        QString file; ///< the job's own, or else an installed one
        QString name;
    };
    struct Options
    {
        bool zeroBlank = false;
        bool writeTableName = false;
        bool printHash = false;
        bool excel = false;
        bool placeholders = false; ///< texts of the report have placeholders such as {lengthUnit}
        std::optional<QString> chainageLabel;
        std::optional<char16_t> separator;
    };
    /// What PDFs of the report say of themselves.
    struct Pdf
    {
        std::optional<QString> title; ///< nothing for the report's own
        QString author;
        std::optional<QString> creator; ///< nothing for the job's application
        QString language;
        bool outline = true;
        bool pageLabels = true;
    };
    struct DataSet
    {
        QString kind;                             ///< the key of its kind, whose value says where the data is
        std::shared_ptr<const DataSource> source; ///< never null in a job that was read
        DataUnits units;
    };

    struct Heading
    {
        QString text;
        int before;
        int after;
    };
    struct Line
    {
        QString text;
        int before;
        int after;
        int style;
    };
    struct LineFeed
    {
        int count;
    };
    struct NewPage
    {
        int linesNeeded;
    };
    struct Block
    {
        QString name;
        QString data;
        int before;
        int after;
    };
    struct Table
    {
        QString name;
        QString data;
        int before;
        int after;
        int headingAfter;
        TableShape shape = {};
    };
    struct Clear
    {};
    struct Step
    {
        std::variant<Heading, Line, LineFeed, NewPage, Block, Table, Clear> action;
        JsonPath path; ///< in the job file, for messages
    };

    std::optional<QString> title;
    bool strict = false; ///< a note on the report is an error
    QString application = baseApplicationTitle;
    bool header = true;
    std::optional<QDateTime> now;
    Page page;
    UJobSettings settings;
    std::optional<Template> reportTemplate;
    Options options;
    QHash<QString, DataSet> data;
    std::vector<Step> steps;
    std::vector<Output> outputs;
    std::shared_ptr<const Pdf> pdf; ///< null when PDFs have their pages alone
};

/// The short form of a job: a data file written through one table or block of a template.
struct TemplateJob
{
    QString templateFile;
    QString templateName;
    QString table; ///< or a block
    QString block;
    QString data;                             ///< a file, "-" for standard input, or a connection to a database server
    QJsonObject dataOptions = {};             ///< what else the data set says, such as its delimiter
    QString dataKind = QStringLiteral("csv"); ///< the key of the kind of data that the file holds

    /// Whether the data comes from a database server, and from no file.
    bool isOfServer() const { return dataKind == u"postgresql"; }
    /// The file that the report is named after: that of the data or, without one, that of the template.
    QString mainFile() const { return isOfServer() ? templateFile : data; }

    /// The content of the equivalent job file.
    QJsonObject toJson() const;
};

} // namespace kareport
