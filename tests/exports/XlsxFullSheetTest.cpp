#include "VariableType.h"
#include "XlsxResult.h"

#include <QFile>
#include <QProcess>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace
{

/// The names of the sheets of a workbook, each with the number of its rows.
QByteArray sheetsOf(std::string_view book)
{
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("book.xlsx"));
    QFile file(path);
    EXPECT_TRUE(file.open(QIODevice::WriteOnly) &&
                file.write(book.data(), static_cast<qint64>(book.size())) == static_cast<qint64>(book.size()));
    file.close();
    QProcess process;
    process.start(
        QStringLiteral("python3"),
        {QStringLiteral("-c"),
         QStringLiteral("import re, sys, zipfile\n"
                        "book = zipfile.ZipFile(sys.argv[1])\n"
                        "names = re.findall(r'<sheet name=\"([^\"]*)\"', book.read('xl/workbook.xml').decode())\n"
                        "for i, name in enumerate(names, 1):\n"
                        "    rows = book.read(f'xl/worksheets/sheet{i}.xml').count(b'<row ')\n"
                        "    print(name, rows)\n"),
         path});
    EXPECT_TRUE(process.waitForFinished(120'000)) << process.errorString().toStdString();
    return process.readAllStandardOutput() + process.readAllStandardError();
}

TEST(XlsxFullSheet, ATableGoesOnInAFurtherSheet)
{
    const UJobSettings settings;
    kareport::ResultColumn column;
    column.field.VariableName = QStringLiteral("Count");
    column.field.Label = QStringLiteral("Count");
    column.field.Type = VARIABLE_INTEGER;
    kareport::ResultTable table;
    table.name = QStringLiteral("Points");
    table.settings = &settings;
    table.columns = {column};

    kareport::XlsxResult result{kareport::ResultOptions()};
    ASSERT_TRUE(result.beginTable(table));
    const UDictEntry entry(1, qint32(7));
    kareport::ResultRow row;
    row.cells = {{&entry, u"7"}};
    constexpr int rows = 1'048'576; // one more than fit under the heading
    for (int i = 0; i < rows; ++i) {
        result.addRow(row);
    }
    result.endTable();
    ASSERT_TRUE(result.finish()) << result.problem().toStdString();
    EXPECT_EQ(sheetsOf(result.bytes()).toStdString(), "Points 1048576\nPoints (2) 2\n")
        << "the heading is in both, and one row in the second one";
}

} // namespace
