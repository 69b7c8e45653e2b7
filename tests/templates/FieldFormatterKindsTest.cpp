#include "FormattedField.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

namespace
{

// What every type shows, six wide, for a value that it cannot take.
constexpr struct
{
    int type;
    int ownKinds;
    const char *expected;
    const char *zeroBlank;
} without[] = {
    {0, 2 | 4, "     0", "      "},   {1, 8, " 0.000", "      "},         {2, 16 | 32, "      ", "      "},
    {3, 8, "  0.00", "      "},       {4, 8, "N 00°00'00\" E", "      "}, {5, 8, " 0.000", "      "},
    {6, 8, " 0.000", "      "},       {7, 8, " 0.000", "      "},         {8, 8, " 0.000", "      "},
    {9, 8, "0+000.000", "0+000.000"}, {10, 8, "  0.00", "  0.00"},        {11, 8, " 0.000", "      "},
    {12, 0, "??????", "??????"},      {13, 0, "??????", "??????"},        {14, 0, "??????", "??????"},
    {15, 0, "??????", "??????"},      {16, 16 | 32, "      ", "      "},  {17, 16 | 32, "      ", "      "},
    {18, 8, "  0.00", "      "},      {19, 1, "     N", "     N"},        {20, 1, "      ", "      "},
    {21, 8, " 0.000", " 0.000"},      {22, 8, "  0.00", "  0.00"},        {23, 0, "??????", "??????"},
    {-1, 0, "??????", "??????"},
};

TEST(FieldFormatterKinds, ReadsOnlyTheKindsOfItsType)
{
    const bool flag = true;
    const qint16 small = 7;
    const qint32 large = 7;
    const double number = 7;
    const QString text = QStringLiteral("seven");
    const UPointNumber point(QStringLiteral("7A"));
    const struct
    {
        int kind;
        const void *value;
    } values[] = {{1, &flag},   {2, &small},  {4, &large},  {8, &number},  {16, &text},     {32, &point},
                  {0, &number}, {3, &number}, {-1, &text},  {64, &text},   {1000, &number}, {1, nullptr},
                  {2, nullptr}, {4, nullptr}, {8, nullptr}, {16, nullptr}, {32, nullptr},   {0, nullptr}};
    for (const auto &row : without) {
        for (const auto &value : values) {
            FormattedField formatted(row.type, 6, 2);
            const bool own = value.value != nullptr && value.kind > 0 && (row.ownKinds & value.kind) == value.kind;
            for (const bool zeroBlank : {false, true}) {
                formatted.options.zeroBlank = zeroBlank;
                const QString expected = QString::fromUtf8(zeroBlank ? row.zeroBlank : row.expected);
                const QString shown = formatted.of(value.kind, value.value);
                if (own) {
                    EXPECT_NE(shown, expected) << "type " << row.type << " of kind " << value.kind;
                } else {
                    EXPECT_EQ(shown, expected) << "type " << row.type << " of kind " << value.kind;
                }
            }
        }
    }
}

} // namespace
