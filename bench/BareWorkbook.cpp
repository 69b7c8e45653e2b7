// The cells of a file of points written as a workbook by the library alone: what a workbook of a report takes at the least.
//
//     ka_bare_workbook POINTS.csv BOOK.xlsx

#include <xlsxwriter.h>

#include <algorithm>
#include <cstdlib>
#include <fstream>
#include <iostream>
#include <string>

namespace
{

/// Writes the cells of a row: numbers in all columns but the first and the last one.
void writeRow(lxw_worksheet *sheet, lxw_row_t row, std::string &line, lxw_format *const (&formats)[6])
{
    std::size_t start = 0;
    for (lxw_col_t column = 0; column < 6; ++column) {
        const std::size_t comma = std::min(line.find(',', start), line.size());
        line[comma] = '\0';
        const char *text = line.data() + start;
        if (row > 0 && column > 0 && column < 5) {
            worksheet_write_number(sheet, row, column, std::strtod(text, nullptr), formats[column]);
        } else {
            worksheet_write_string(sheet, row, column, text, row > 0 ? formats[column] : nullptr);
        }
        start = comma + 1;
    }
}

} // namespace

int main(int argc, char **argv)
{
    if (argc != 3) {
        std::cerr << "ka_bare_workbook POINTS.csv BOOK.xlsx\n";
        return 1;
    }
    lxw_workbook_options options = {};
    options.constant_memory = LXW_TRUE;
    lxw_workbook *book = workbook_new_opt(argv[2], &options);
    lxw_worksheet *sheet = workbook_add_worksheet(book, "Points");
    lxw_format *formats[6] = {};
    const char *const codes[6] = {"@", "0.000", "0.000", "0.000", "0+000.000", "@"};
    for (int column = 0; column < 6; ++column) {
        formats[column] = workbook_add_format(book);
        format_set_num_format(formats[column], codes[column]);
    }
    std::ifstream file(argv[1]);
    std::string line;
    for (lxw_row_t row = 0; std::getline(file, line); ++row) {
        line += '\0';
        writeRow(sheet, row, line, formats);
    }
    return workbook_close(book) == LXW_NO_ERROR ? 0 : 1;
}
