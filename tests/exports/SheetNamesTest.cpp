#include "SheetNames.h"

#include <gtest/gtest.h>

namespace
{

QString nameOf(const QString &wanted)
{
    return kareport::SheetNames().add(wanted);
}

TEST(SheetNames, WhatNoProgramTakesIsReplaced)
{
    struct Row
    {
        QString wanted;
        QString name;
        const char *reason;
    };
    const Row rows[] = {
        {QStringLiteral("Points"), QStringLiteral("Points"), "a good name"},
        {QStringLiteral("a:b\\c/d?e*f[g]h"), QStringLiteral("a_b_c_d_e_f_g_h"), "characters that are not part of one"},
        {QStringLiteral("'a'"), QStringLiteral("_a_"), "apostrophes at the ends"},
        {QStringLiteral("a'b"), QStringLiteral("a'b"), "and inside"},
        {QString(), QStringLiteral("_"), "no name"},
        {QStringLiteral("  "), QStringLiteral("_"), "blanks"},
        {QStringLiteral("history"), QStringLiteral("history_"), "one that spreadsheets keep for themselves"},
        {QString(40, u'x'), QString(31, u'x'), "31 characters"},
        {QString(30, u'x') + QStringLiteral("\U0001d11e"), QString(30, u'x'), "no half of a pair of surrogates"},
        {QStringLiteral("a\tb"), QStringLiteral("a_b"), "control characters"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(nameOf(row.wanted), row.name) << row.reason;
    }
}

TEST(SheetNames, ANameThatIsTakenIsNumbered)
{
    kareport::SheetNames names;
    EXPECT_EQ(names.add(QStringLiteral("Points")), QStringLiteral("Points"));
    EXPECT_EQ(names.add(QStringLiteral("POINTS")), QStringLiteral("POINTS (2)")) << "without regard to case";
    EXPECT_EQ(names.add(QStringLiteral("Points")), QStringLiteral("Points (3)"));
    EXPECT_EQ(names.add(QStringLiteral("Points (2)")), QStringLiteral("Points (2) (2)"));
    names.add(QString(31, u'x'));
    EXPECT_EQ(names.add(QString(40, u'x')), QString(27, u'x') + QStringLiteral(" (2)"));
}

} // namespace
