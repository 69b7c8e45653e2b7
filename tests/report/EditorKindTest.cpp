#include "EditorKind.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

namespace
{

using kareport::EditorKind;

TEST(EditorKind, ADotInAFolderIsNotPartOfTheProgramsName)
{
    struct Row
    {
        QStringView path;
        QStringView stem;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"C:\\Apps\\WINWORD.EXE", u"WINWORD", "the usual path of another platform"},
        {u"/usr/bin/winword", u"winword", "no dot: all of the name"},
        {u"/opt/office.d/winword", u"winword", "the cut comes after the last separator"},
        {u"C:\\office.d\\winword", u"winword", "the cut comes after the last separator"},
        {u"C:\\Apps/bin\\winword.exe", u"winword", "both separators, the last one counts"},
        {u"C:\\Apps\\bin/winword.exe", u"winword", "both separators, the last one counts"},
        {u"/opt/excel.2016.exe", u"excel.2016", "only what follows the last dot goes"},
        {u"winword.exe.", u"winword.exe", "a dot at the end"},
        {u"/opt/.winword", u"", "a dot at the beginning leaves nothing"},
        {u"/opt/winword/", u"", "a folder only"},
        {u"/opt/winword.exe/", u"", "a folder only"},
        {u"winword", u"winword", "a name only"},
        {u"C:winword.exe", u"C:winword", "a drive is not a folder"},
        {u"/opt/測量.é/Ω é.x", u"Ω é", "characters beyond ASCII"},
        {u".", u"", "a dot only"},
        {u"\\", u"", "a separator only"},
        {u"", u"", "empty"},
        {QStringView(), u"", "none"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(kareport::editorStem(row.path).toString(), row.stem.toString())
            << row.reason << ": " << testing::PrintToString(row.path);
    }
}

TEST(EditorKind, IsChosenByTheProgramsName)
{
    constexpr auto plain = EditorKind::Plain;
    constexpr auto word = EditorKind::WordProcessor;
    struct Row
    {
        QStringView path;
        EditorKind expected;
        EditorKind withExcelOption;
        bool isExcel;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"C:\\Apps\\WINWORD.EXE", word, word, false, "in capitals"},
        {u"/usr/bin/winword", word, word, false, "in small letters"},
        {u"/usr/bin/WordPad", word, word, false, "in both"},
        {u"C:\\Apps\\excel.exe", plain, word, true, "a spreadsheet, where the report allows it"},
        {u"/opt/EXCEL", plain, word, true, "a spreadsheet, where the report allows it"},
        {u"C:\\Apps\\notepad.exe", plain, plain, false, "any other"},
        {u"/opt/winword2", plain, plain, false, "more than the name"},
        {u"/opt/mywinword", plain, plain, false, "more than the name"},
        {u"/opt/winword.old.exe", plain, plain, false, "more than the name"},
        {u"/opt/winwor", plain, plain, false, "less than the name"},
        {u"/opt/winword /x", plain, plain, false, "a folder of the name"},
        {u"/opt/ winword", plain, plain, false, "a blank belongs to the name"},
        {u"/opt/excel/edit", plain, plain, false, "a folder of the name"},
        {u"/opt/wınword", plain, plain, false, "a letter that only looks alike"},
        {u"", plain, plain, false, "none"},
    };
    for (const Row &row : rows) {
        const std::string what = row.reason + (": " + row.path.toString().toStdString());
        EXPECT_EQ(kareport::editorKind(row.path, false), row.expected) << what;
        EXPECT_EQ(kareport::editorKind(row.path, true), row.withExcelOption) << what;
        EXPECT_EQ(kareport::isExcelEditor(row.path), row.isExcel) << what;
    }
}

} // namespace
