#include "ImportGuess.h"

#include "CsvOptions.h"
#include "CsvPreview.h"
#include "CsvRows.h"
#include "DelimiterGuess.h"
#include "JobSettings.h"
#include "TextEncoding.h"
#include "TextFolding.h"

#include <QCryptographicHash>
#include <QStringDecoder>

#include <algorithm>
#include <array>

namespace kareport
{

namespace
{

constexpr std::size_t mostBytes = 256 * 1024;
constexpr int mostRows = 100;

const QString encodingKey = QStringLiteral("encoding");
const QString delimiterKey = QStringLiteral("delimiter");
const QString decimalKey = QStringLiteral("decimal");
const QString headerKey = QStringLiteral("header");
const QString orderKey = QStringLiteral("order");

bool isUtf16(std::string_view bytes)
{
    return bytes.starts_with("\xFE\xFF") || bytes.starts_with("\xFF\xFE");
}

TextEncoding guessEncoding(std::string_view bytes, QJsonObject &options)
{
    if (isUtf16(bytes)) {
        options.insert(encodingKey, QStringLiteral("utf-16"));
        return TextEncoding::Utf16;
    }
    QStringDecoder decoder(QStringDecoder::Utf8);
    const QString text = decoder.decode(QByteArrayView(bytes.data(), static_cast<qsizetype>(bytes.size())));
    if (!decoder.hasError()) {
        return TextEncoding::Utf8;
    }
    // Of the bytes that stand for no character of Windows, Latin-1 has control characters.
    constexpr std::string_view unused = "\x81\x8D\x8F\x90\x9D";
    const bool isWindows = bytes.find_first_of(unused) == std::string_view::npos;
    options.insert(encodingKey, isWindows ? QStringLiteral("windows-1252") : QStringLiteral("latin-1"));
    return isWindows ? TextEncoding::Windows1252 : TextEncoding::Latin1;
}

/// What finds variables decides, where one reading alone fits.
bool guessByVariables(const std::shared_ptr<const FileBytes> &text, const Variables &variables, CsvDialect &dialect)
{
    for (const char decimal : {'.', ','}) {
        CsvDialect tried;
        tried.kind = DelimiterKind::Automatic;
        tried.numbers.decimal = decimal;
        const auto guessed = guessDelimiter(text, tried, variables);
        if (const auto *found = std::get_if<CsvDialect>(&guessed)) {
            CsvRows rows(text, *found, variables);
            rows.checkHeader();
            UDataObject object; // where no reading fits, what was found says what is wrong with one
            for (int row = 0; row < mostRows && !rows.error() && rows.next(object, nullptr); ++row) {
            }
            if (!rows.error()) {
                dialect = *found;
                return true;
            }
        }
    }
    return false;
}

using Cells = std::vector<std::vector<QString>>;

bool isNumber(const QString &cell, char decimal)
{
    double number = 0;
    const QByteArray bytes = QString(cell).replace(QLatin1Char(decimal), u'.').trimmed().toUtf8();
    const bool hasOther = cell.contains(decimal == '.' ? u',' : u'.');
    bool isOne = false;
    number = bytes.toDouble(&isOne);
    return isOne && !hasOther && qIsFinite(number);
}

qsizetype numbersIn(const std::vector<QString> &row, char decimal)
{
    return std::count_if(row.begin(), row.end(), [decimal](const QString &cell) { return isNumber(cell, decimal); });
}

qsizetype numbersIn(const Cells &rows, char decimal)
{
    qsizetype count = 0;
    for (const std::vector<QString> &row : rows) {
        count += numbersIn(row, decimal);
    }
    return count;
}

/// Whether all rows have the same number of cells, two at least.
bool isEven(const Cells &rows)
{
    return !rows.empty() && rows.front().size() >= 2 &&
           std::all_of(rows.begin(), rows.end(),
                       [&rows](const std::vector<QString> &row) { return row.size() == rows.front().size(); });
}

/// What splits all rows into equally many cells, the most numbers among them.
Cells guessByCells(const FileBytes &text, CsvDialect &dialect)
{
    struct Candidate
    {
        DelimiterKind kind;
        char delimiter;
    };
    constexpr std::array<Candidate, 5> candidates = {{{DelimiterKind::Character, ';'},
                                                      {DelimiterKind::Character, '\t'},
                                                      {DelimiterKind::Character, '|'},
                                                      {DelimiterKind::Character, ','},
                                                      {DelimiterKind::Whitespace, ' '}}};
    Cells best;
    qsizetype bestNumbers = -1;
    for (const Candidate &candidate : candidates) {
        CsvDialect tried;
        tried.kind = candidate.kind;
        tried.delimiter = candidate.delimiter;
        Cells rows = firstCells(text, tried, mostRows);
        for (const char decimal : {'.', ','}) {
            const qsizetype numbers = numbersIn(rows, decimal);
            if (isEven(rows) && candidate.delimiter != decimal && numbers > bestNumbers) {
                dialect.kind = candidate.kind;
                dialect.delimiter = candidate.delimiter;
                dialect.numbers.decimal = decimal;
                bestNumbers = numbers;
                best = rows;
            }
        }
    }
    return best;
}

/// Whether the columns without names may be those of points: number, two coordinates, and what may come after.
bool arePoints(const std::vector<QString> &row, char decimal, const Variables &variables)
{
    constexpr std::size_t fewest = 3;
    const auto names = namesOfOrder(u"PNEZD");
    if (row.size() < fewest || row.size() > static_cast<std::size_t>(names->size())) {
        return false;
    }
    for (std::size_t i = 0; i < row.size(); ++i) {
        const bool isCoordinate = i == 1 || i == 2 || i == 3;
        if (!variables.find((*names)[static_cast<qsizetype>(i)]) || (isCoordinate && !isNumber(row[i], decimal))) {
            return false;
        }
    }
    return true;
}

void putOptions(const CsvDialect &dialect, QJsonObject &options)
{
    if (dialect.kind == DelimiterKind::Whitespace) {
        options.insert(delimiterKey, QStringLiteral("whitespace"));
    } else if (dialect.delimiter != ',') {
        options.insert(delimiterKey, QString(QLatin1Char(dialect.delimiter)));
    }
    if (dialect.numbers.decimal != '.') {
        options.insert(decimalKey, QString(QLatin1Char(dialect.numbers.decimal)));
    }
    if (!dialect.hasHeader) {
        options.insert(headerKey, false);
    }
    if (!dialect.order.isEmpty()) {
        options.insert(orderKey, dialect.order);
    }
}

QString shapeOf(const FileBytes &text, const CsvDialect &dialect)
{
    const Cells rows = firstCells(text, dialect, 1);
    const std::vector<QString> first = rows.empty() ? std::vector<QString>() : rows.front();
    QString shape = QString::number(first.size());
    for (const QString &name : first) {
        shape += dialect.hasHeader ? u'\n' + foldedKey(name.trimmed()) : QString();
    }
    // A long row of names makes a long entry of the profile.
    return QString::fromLatin1(QCryptographicHash::hash(shape.toUtf8(), QCryptographicHash::Sha1).toHex());
}

} // namespace

std::shared_ptr<const FileBytes> beginOfText(const std::shared_ptr<const FileBytes> &file)
{
    const std::string_view bytes = file->view();
    if (bytes.size() <= mostBytes) {
        return file;
    }
    std::string_view begin = bytes.substr(0, mostBytes);
    // A line of UTF-16 ends with two bytes; another character may have one of them.
    const std::size_t feed = begin.starts_with("\xFF\xFE")   ? begin.rfind(std::string_view("\n\0", 2))
                             : begin.starts_with("\xFE\xFF") ? begin.rfind(std::string_view("\0\n", 2))
                                                             : begin.rfind('\n');
    if (feed != std::string_view::npos && (!isUtf16(begin) || feed % 2 == 0)) {
        begin = begin.substr(0, feed + (isUtf16(begin) ? 2 : 1));
    }
    return FileBytes::holding(file->path(), QByteArray(begin.data(), static_cast<qsizetype>(begin.size())));
}

ImportGuess guessTextFile(const std::shared_ptr<const FileBytes> &begin, const Variables &variables)
{
    ImportGuess guess;
    const auto read = toUtf8(begin, guessEncoding(begin->view(), guess.options));
    const auto *text = std::get_if<std::shared_ptr<const FileBytes>>(&read);
    if (text == nullptr) {
        return guess;
    }
    CsvDialect dialect;
    if (!guessByVariables(*text, variables, dialect)) {
        const Cells rows = guessByCells(**text, dialect);
        if (!rows.empty()) {
            const char decimal = dialect.numbers.decimal;
            dialect.hasHeader = rows.size() > 1 ? numbersIn(rows[0], decimal) == 0 && numbersIn(rows[1], decimal) > 0
                                                : numbersIn(rows[0], decimal) == 0;
            if (!dialect.hasHeader && arePoints(rows[0], decimal, variables)) {
                dialect.order = QStringLiteral("PNEZD").first(static_cast<qsizetype>(rows[0].size()));
            }
        }
    }
    putOptions(dialect, guess.options);
    guess.shape = shapeOf(**text, dialect);
    return guess;
}

DataPreview previewTextFile(const std::shared_ptr<const FileBytes> &begin, const QJsonObject &options,
                            const std::function<Variables(const DataUnits &)> &variablesIn, int mostRowsShown)
{
    const JsonSource source = JsonSource::fromObject(options);
    std::optional<InputError> error;
    const JsonNode set(source, error);
    const CsvDialect dialect = readCsvDialect(set);
    const DataUnits units = readDataUnits(set[QStringLiteral("units")]);
    if (error) {
        DataPreview preview;
        preview.error = error;
        return preview;
    }
    return previewCsv(begin, dialect, variablesIn(units), mostRowsShown);
}

} // namespace kareport
