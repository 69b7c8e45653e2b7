#include "XlsxBook.h"

#include "DataText.h"
#include "PlainNumbers.h"
#include "SystemPath.h"
#include "Xlate.h"

#include <algorithm>
#include <cerrno>
#include <cstdio>
#include <new>
#include <utility>

namespace kareport
{

namespace
{

constexpr qsizetype longestCell = 32'767; ///< of a cell
constexpr qsizetype escapeLength = 7;     ///< of _x0041_

/// Whether a text has an escape of the file format at a position, such as _x0041_.
bool isEscape(QStringView text, qsizetype at)
{
    if (at + 7 > text.size() || text[at + 1] != u'x' || text[at + 6] != u'_') {
        return false;
    }
    for (qsizetype i = at + 2; i < at + 6; ++i) {
        if (!QStringView(u"0123456789abcdefABCDEF").contains(text[i])) {
            return false;
        }
    }
    return true;
}

template <typename Pointer>
Pointer notNull(Pointer pointer)
{
    if (pointer == nullptr) {
        throw std::bad_alloc();
    }
    return pointer;
}

void setAlign(lxw_format *format, CellLook::Align align)
{
    switch (align) {
    case CellLook::Align::None: break;
    case CellLook::Align::Left: format_set_align(format, LXW_ALIGN_LEFT); break;
    case CellLook::Align::Centre: format_set_align(format, LXW_ALIGN_CENTER); break;
    case CellLook::Align::Right: format_set_align(format, LXW_ALIGN_RIGHT); break;
    }
}

} // namespace

qsizetype appendSheetText(std::string &out, QStringView text, qsizetype most)
{
    qsizetype start = 0;
    qsizetype i = 0;
    for (qsizetype count = 0; i < text.size(); ++i) {
        const char16_t character = text[i].unicode();
        const char *instead = character == u'_' && isEscape(text, i)                         ? "_x005F_"
                              : character == 0xFFFE || character == 0xFFFF || character == 0 ? "\xEF\xBF\xBD"
                              : character == u'\r'                                           ? "_x000D_"
                                                                                             : nullptr;
        count += instead != nullptr && *instead == '_' ? escapeLength : 1;
        const bool isPair = text[i].isHighSurrogate() && i + 1 < text.size();
        if (count > most || (isPair && count == most)) {
            break;
        }
        if (instead != nullptr) {
            appendUtf8(out, text.sliced(start, i - start));
            out += instead;
            start = i + 1;
        }
    }
    appendUtf8(out, text.sliced(start, i - start));
    return i;
}

XlsxBook::XlsxBook() : folderName_(pathForLibrary(folder_.path()))
{
    lxw_workbook_options options = {};
    options.constant_memory = LXW_TRUE;
    options.tmpdir = folderName_.data();
    options.use_zip64 = LXW_FALSE;
    book_ = notNull(workbook_new_opt(pathForLibrary(path()).constData(), &options));
}

XlsxBook::~XlsxBook()
{
    if (book_ != nullptr) {
        lxw_workbook_free(book_);
    }
}

lxw_worksheet *XlsxBook::addSheet(const QString &wantedName)
{
    sheets_.push_back(notNull(workbook_add_worksheet(book_, names_.add(wantedName).toUtf8().constData())));
    return sheets_.back();
}

lxw_format *XlsxBook::formatOf(const CellLook &look)
{
    const auto found = formats_.find(look);
    if (found != formats_.end()) {
        return found->second;
    }
    lxw_format *format = notNull(workbook_add_format(book_));
    if (!look.numberFormat.empty()) {
        format_set_num_format(format, look.numberFormat.c_str());
    }
    setAlign(format, look.align);
    if (look.isBold || look.isHead) {
        format_set_bold(format);
    }
    if (look.hasRule) {
        format_set_top(format, LXW_BORDER_THIN);
    }
    if (look.isHead) {
        format_set_bottom(format, LXW_BORDER_THIN);
        format_set_text_wrap(format);
    }
    formats_.emplace(look, format);
    return format;
}

void XlsxBook::setProperties(lxw_doc_properties properties)
{
    workbook_set_properties(book_, &properties);
}

void XlsxBook::writeText(lxw_worksheet *sheet, lxw_row_t row, lxw_col_t column, QStringView text, lxw_format *format)
{
    text_.clear();
    const PlainNumbers plain; // with the first cell of a row, the library writes the row before it
    cutTexts_ += appendSheetText(text_, text, longestCell) < text.size() ? 1U : 0U;
    worksheet_write_string(sheet, row, column, text_.c_str(), format);
}

void XlsxBook::writeFormula(lxw_worksheet *sheet, lxw_row_t row, lxw_col_t column, const std::string &formula,
                            double value, lxw_format *format)
{
    const PlainNumbers plain;
    worksheet_write_formula_num(sheet, row, column, formula.c_str(), format, value);
}

void XlsxBook::writeNumber(lxw_worksheet *sheet, lxw_row_t row, lxw_col_t column, double number, lxw_format *format)
{
    const PlainNumbers plain;
    worksheet_write_number(sheet, row, column, number, format);
}

/// Whether the system took all rows: the library keeps those of each sheet in a file, and does not ask.
bool XlsxBook::areRowsWritten() const
{
    return std::all_of(sheets_.begin(), sheets_.end(), [](const lxw_worksheet *sheet) {
        FILE *const rows = sheet->optimize_tmpfile;
        return rows == nullptr || (std::fflush(rows) == 0 && std::ferror(rows) == 0);
    });
}

QString XlsxBook::close()
{
    if (!areRowsWritten()) {
        return Xlate("the workbook could not be put together: %1").arg(qt_error_string(errno));
    }
    const PlainNumbers plain;
    const lxw_error error = workbook_close(std::exchange(book_, nullptr));
    if (error == LXW_ERROR_MEMORY_MALLOC_FAILED) {
        throw std::bad_alloc();
    }
    return error == LXW_NO_ERROR
               ? QString()
               : Xlate("the workbook could not be put together: %1").arg(QString::fromUtf8(lxw_strerror(error)));
}

} // namespace kareport
