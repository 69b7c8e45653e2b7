#include "CsvPreview.h"

#include "CsvRows.h"
#include "DelimiterGuess.h"
#include "TextEncoding.h"
#include "Xlate.h"

#include <algorithm>

namespace kareport
{

namespace
{

/// A cell need not be shown to its end.
constexpr qsizetype longestShown = 200;

QString textOf(std::string_view cell)
{
    constexpr std::size_t longestBytes = 4 * std::size_t(longestShown);
    const QString text = QString::fromUtf8(cell.data(), static_cast<qsizetype>(std::min(cell.size(), longestBytes)));
    return text.size() <= longestShown ? text : text.first(longestShown) + u'…';
}

/// The cells of a row, each tried as what is read from its column.
std::vector<PreviewedCell> triedCells(const std::vector<std::string_view> &cells, const CsvRows &rows)
{
    std::vector<PreviewedCell> tried;
    for (const std::string_view cell : cells) {
        tried.push_back({textOf(cell)});
    }
    UDataObject object;
    for (const BoundField &field : rows.fields()) {
        if (field.column < cells.size() && !field.parser.store(cells[field.column], object)) {
            tried[field.column].wrong = Xlate("%1 was expected").arg(field.parser.expected());
        }
    }
    const std::size_t width = rows.columns().size();
    if (cells.size() != width) {
        tried.resize(std::max(cells.size(), std::min(cells.size() + 1, width)));
        tried[std::min(cells.size(), width)].wrong =
            Xlate("the row has %1 cells: %2 were expected").arg(cells.size()).arg(width);
    }
    return tried;
}

void readRows(const FileBytes &file, const CsvDialect &dialect, const CsvRows &rows, int mostRows, DataPreview &preview)
{
    CsvReader reader(file.path(), file.view(), layoutOf(dialect));
    if (dialect.hasHeader && !reader.next()) {
        return;
    }
    while (static_cast<int>(preview.rows.size()) < mostRows && reader.next()) {
        preview.rows.push_back(triedCells(reader.cells(), rows));
    }
}

} // namespace

DataPreview previewCsv(const std::shared_ptr<const FileBytes> &file, const CsvDialect &dialect,
                       const Variables &variables, int mostRows)
{
    DataPreview preview;
    const auto text = toUtf8(file, dialect.encoding);
    if (const InputError *error = errorOf(text)) {
        preview.error = *error;
        return preview;
    }
    const auto &bytes = std::get<std::shared_ptr<const FileBytes>>(text);
    CsvDialect known = dialect;
    if (dialect.kind == DelimiterKind::Automatic) {
        const auto guessed = guessDelimiter(bytes, dialect, variables);
        if (const InputError *error = errorOf(guessed)) {
            preview.error = *error;
            return preview;
        }
        known = std::get<CsvDialect>(guessed);
    }
    CsvRows rows(bytes, known, variables);
    rows.checkHeader();
    for (const SourceColumn &column : rows.columns()) {
        preview.columns.push_back({column.name, QString()});
    }
    for (const BoundField &field : rows.fields()) {
        preview.columns[field.column].variable = field.variable;
    }
    preview.error = rows.error();
    readRows(*bytes, known, rows, mostRows, preview);
    UDataObject object;
    for (int row = 0; row < mostRows && !preview.error && rows.next(object, nullptr); ++row) {
    }
    preview.error = preview.error ? preview.error : rows.error();
    return preview;
}

std::vector<std::vector<QString>> firstCells(const FileBytes &utf8, const CsvDialect &dialect, int mostRows)
{
    CsvReader reader(utf8.path(), utf8.view(), layoutOf(dialect));
    std::vector<std::vector<QString>> rows;
    while (static_cast<int>(rows.size()) < mostRows && reader.next()) {
        std::vector<QString> &row = rows.emplace_back();
        for (const std::string_view cell : reader.cells()) {
            row.push_back(textOf(cell));
        }
    }
    return rows;
}

} // namespace kareport
