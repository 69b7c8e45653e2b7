#pragma once

#include "SheetNames.h"

#include <QByteArray>
#include <QString>
#include <QTemporaryDir>

#include <xlsxwriter.h>

#include <cstdint>
#include <map>
#include <memory>
#include <string>
#include <vector>

namespace kareport
{

/// How a cell looks.
struct CellLook
{
    std::string numberFormat = {}; ///< empty for a text
    enum class Align
    {
        None,
        Left,
        Centre,
        Right
    } align = Align::None;
    bool isBold = false;
    bool hasRule = false; ///< above it, as over totals
    bool isHead = false;  ///< of a table

    auto operator<=>(const CellLook &) const = default;
};

/// A workbook that is written row after row into a folder of its own, so that memory does not grow with it.
class XlsxBook
{
public:
    XlsxBook();
    ~XlsxBook();
    XlsxBook(const XlsxBook &) = delete;
    XlsxBook &operator=(const XlsxBook &) = delete;

    /// What keeps the workbook from being written anywhere; empty when nothing does. Without a folder, nothing may be added.
    QString problem() const { return folder_.isValid() ? QString() : folder_.errorString(); }

    /// @throws std::bad_alloc when memory runs out, as the other functions do
    lxw_worksheet *addSheet(const QString &wantedName);
    lxw_format *formatOf(const CellLook &look);
    void setProperties(lxw_doc_properties properties);

    // Cells of a sheet, row after row.
    void writeText(lxw_worksheet *sheet, lxw_row_t row, lxw_col_t column, QStringView text, lxw_format *format);
    /// @param value  what the formula gives
    static void writeFormula(lxw_worksheet *sheet, lxw_row_t row, lxw_col_t column, const std::string &formula,
                             double value, lxw_format *format);
    static void writeNumber(lxw_worksheet *sheet, lxw_row_t row, lxw_col_t column, double number, lxw_format *format);

    /// How many texts were longer than a cell holds, and are cut.
    quint64 cutTexts() const { return cutTexts_; }
    /// Ends the workbook. @return the system's or the library's reason where it could not be made; else empty
    QString close();
    /// The file that it is in when it has been closed.
    QString path() const { return folder_.filePath(QStringLiteral("book.xlsx")); }

private:
    bool areRowsWritten() const;

    QTemporaryDir folder_;
    QByteArray folderName_;
    lxw_workbook *book_ = nullptr;
    SheetNames names_;
    std::map<CellLook, lxw_format *> formats_;
    std::vector<lxw_worksheet *> sheets_;
    std::string text_; ///< reused from cell to cell
    quint64 cutTexts_ = 0;
};

/// A text as the cells of a workbook hold it: "_x0041_" would be read as "A", and some characters cannot be in any file.
/// @param most  characters that there may be, with all escapes @return how many characters of the text are in it
qsizetype appendSheetText(std::string &out, QStringView text, qsizetype most);

} // namespace kareport
