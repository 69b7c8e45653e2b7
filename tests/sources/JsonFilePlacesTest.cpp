#include "JsonFileList.h"

#include "InputErrorText.h"
#include "JobFolder.h"
#include "MappedMemory.h"
#include "SurveyRows.h"

#include <gtest/gtest.h>

// Where the values of a JSON file are.

namespace
{

using kareport::JsonFileList;

std::shared_ptr<const kareport::FileBytes> fileOf(const JobFolder &folder, const QByteArray &text)
{
    folder.put("points.json", text);
    return std::get<std::shared_ptr<const kareport::FileBytes>>(kareport::FileBytes::open(folder.path("points.json")));
}

/// The place of a byte, counted from the start.
QString countedPlace(const QByteArray &text, qsizetype byte)
{
    kareport::TextPlace place;
    for (qsizetype i = 0; i < byte; ++i) {
        if (text[i] == '\n') {
            place = {place.line + 1, 1};
        } else if ((static_cast<unsigned char>(text[i]) & 0xC0U) != 0x80U) {
            ++place.column;
        }
    }
    return QStringLiteral("%1:%2").arg(place.line).arg(place.column);
}

TEST(JsonFilePlaces, AreThoseOfTheValuesWhereverTheyAre)
{
    const QByteArray filler = QByteArray("\xC3\xA4").repeated(300);
    for (const char *between : {",\n", ","})
    { // a line for each object, and one line for all, longer than what is looked at once
        QByteArray text = "\xEF\xBB\xBF[";
        std::vector<qsizetype> values;
        for (int row = 0; row < 1500; ++row) {
            text += row > 0 ? between : "";
            text += "{\"k\":\"" + filler + "\", \"Number\" : ";
            values.push_back(text.size());
            text += QByteArray::number(row) + "}";
        }
        text += "]";
        const JobFolder folder;
        JsonFileList list(fileOf(folder, text), {}, survey::variables(), {});
        ASSERT_EQ(survey::rowsOf(list).size(), 1500);
        const QByteArray seen = text.mid(3); // a byte-order mark has no column
        for (const std::size_t row : {1499U, 0U, 700U, 1U, 1498U, 700U, 699U}) {
            EXPECT_EQ(placeText(list.placeOf(row, QStringLiteral("Number")).place), countedPlace(seen, values[row] - 3))
                << row << (between[1] != '\0' ? " of lines" : " of one line");
        }
    }
}

TEST(JsonFilePlaces, OfALargeFileDoNotKeepItInMemory)
{
    constexpr int rows = 12000;
    QByteArray text = "[";
    const QByteArray filler(4000, 'x');
    for (int row = 0; row < rows; ++row) {
        text +=
            QByteArray(row > 0 ? "," : "") + "{\"Number\":" + QByteArray::number(row) + ",\"k\":\"" + filler + "\"}";
    }
    text += "]";
    const qsizetype last = text.lastIndexOf("\"Number\":") + 9;
    const JobFolder folder;
    JsonFileList list(fileOf(folder, text), {}, survey::variables(), {});
    for (std::size_t row = 0; list.GetAt(row) != nullptr; ++row) {
    }
    const double before = mappedMegabytes();
    EXPECT_EQ(placeText(list.placeOf(rows - 1, QStringLiteral("Number")).place), QStringLiteral("1:%1").arg(last + 1));
    EXPECT_LT(mappedMegabytes() - before, 14) << "of 46";
}

} // namespace
