#include "FixedPitchFont.h"

#include <gtest/gtest.h>

#include <QFontInfo>

using kareport::fixedPitchFont;
using kareport::setFixedPitch;
using kareport::substituteFaces;

namespace
{

TEST(FixedPitchFont, TheFaceThatIsWantedComesFirstAndTheStandInsFollow)
{
    const QFont font = fixedPitchFont(QStringLiteral("No Such Face"));
    EXPECT_EQ(font.families(), QStringList(QStringLiteral("No Such Face")) + substituteFaces());
    EXPECT_TRUE(font.fixedPitch());
    EXPECT_EQ(font.styleHint(), QFont::TypeWriter);
    EXPECT_EQ(font.weight(), int(QFont::Normal));
    EXPECT_FALSE(font.italic());
}

TEST(FixedPitchFont, AStandInThatIsNamedAlreadyStaysWhereItIs)
{
    QFont font({QStringLiteral("Liberation Mono"), QStringLiteral("A")});
    setFixedPitch(font);
    EXPECT_EQ(font.families(), QStringList({QStringLiteral("Liberation Mono"), QStringLiteral("A"),
                                            QStringLiteral("DejaVu Sans Mono"), QStringLiteral("Hack")}));
}

TEST(FixedPitchFont, AFaceThatIsNotInstalledIsReplacedByOneOfAFixedPitch)
{
    EXPECT_TRUE(QFontInfo(fixedPitchFont(QStringLiteral("No Such Face"))).fixedPitch());
}

} // namespace
