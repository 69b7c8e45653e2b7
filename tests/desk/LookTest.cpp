#include "Contrast.h"
#include "PathDrawing.h"
#include "ProgramIcon.h"
#include "Readable.h"

#include <QApplication>
#include <QFile>
#include <QStyle>
#include <QStyleFactory>

#include <gtest/gtest.h>

#include <memory>

namespace
{

using namespace kareport;

QPalette darkPalette()
{
    QPalette palette(QColor(53, 53, 53), QColor(42, 42, 42));
    palette.setColor(QPalette::Base, QColor(30, 30, 30));
    palette.setColor(QPalette::Text, QColor(160, 160, 160));
    palette.setColor(QPalette::PlaceholderText, QColor(255, 255, 255, 60));
    palette.setColor(QPalette::Link, QColor(0, 0, 255));
    palette.setColor(QPalette::Highlight, QColor(42, 130, 218));
    palette.setColor(QPalette::HighlightedText, Qt::white);
    return palette;
}

TEST(Look, EveryTextHasTheContrastThatIsRequired)
{
    struct Pair
    {
        QPalette::ColorRole text;
        QPalette::ColorRole background;
        const char *name;
    };
    constexpr Pair pairs[] = {{QPalette::WindowText, QPalette::Window, "window"},
                              {QPalette::Text, QPalette::Base, "text"},
                              {QPalette::ButtonText, QPalette::Button, "button"},
                              {QPalette::HighlightedText, QPalette::Highlight, "selected"},
                              {QPalette::ToolTipText, QPalette::ToolTipBase, "tool tip"},
                              {QPalette::PlaceholderText, QPalette::Base, "placeholder"},
                              {QPalette::Link, QPalette::Base, "link"},
                              {QPalette::LinkVisited, QPalette::Base, "visited link"}};
    const QPalette light = std::unique_ptr<QStyle>(QStyleFactory::create(QStringLiteral("Fusion")))->standardPalette();
    for (const QPalette &given : {light, darkPalette(), QPalette(Qt::gray), QPalette(Qt::darkBlue)}) {
        const QPalette palette = readablePalette(given);
        for (const auto group : {QPalette::Active, QPalette::Inactive}) {
            for (const Pair &pair : pairs) {
                EXPECT_GE(contrast(palette.color(group, pair.text), palette.color(group, pair.background)),
                          leastTextContrast)
                    << pair.name << " on " << given.color(QPalette::Window).name().toStdString();
            }
        }
        for (const auto background : {QPalette::Window, QPalette::Base}) {
            EXPECT_GE(contrast(quietColor(palette, background), palette.color(background)), leastTextContrast)
                << "captions";
        }
    }
    EXPECT_LT(contrast(light.color(QPalette::HighlightedText), light.color(QPalette::Highlight)), leastTextContrast)
        << "which the palette of the style has not";
    EXPECT_EQ(readablePalette(light).color(QPalette::WindowText), light.color(QPalette::WindowText))
        << "what is readable stays";
}

TEST(Look, ContrastIsThatOfTheGuidelines)
{
    EXPECT_DOUBLE_EQ(contrast(Qt::black, Qt::white), 21);
    EXPECT_DOUBLE_EQ(contrast(Qt::white, Qt::white), 1);
    EXPECT_NEAR(contrast(QColor(0x77, 0x77, 0x77), Qt::white), 4.48, 0.01);
}

TEST(PathDrawing, ReadsTheCommandsOfAnSvgPath)
{
    const QPainterPath path = pathOf(u"M1,2 L4 2 h2V5 q1-1,2 0 c0 1 1 1 1 2z");
    EXPECT_EQ(path.elementAt(0), QPainterPath::Element({1, 2, QPainterPath::MoveToElement}));
    EXPECT_EQ(path.elementAt(1), QPainterPath::Element({4, 2, QPainterPath::LineToElement}));
    EXPECT_EQ(path.elementAt(2), QPainterPath::Element({6, 2, QPainterPath::LineToElement}));
    EXPECT_EQ(path.elementAt(3), QPainterPath::Element({6, 5, QPainterPath::LineToElement}));
    EXPECT_EQ(path.boundingRect().right(), 9);
    EXPECT_EQ(pathOf(u"M0 0 2 3").elementAt(1), QPainterPath::Element({2, 3, QPainterPath::LineToElement}));
    EXPECT_EQ(pathOf(u"M0 0 L2 x 9 9").elementCount(), 1) << "ends before what it does not know";
    EXPECT_TRUE(pathOf(u"").isEmpty());
    EXPECT_EQ(pathOf(u"A1 1").elementCount(), 0);
}

TEST(ProgramIcon, IsInTheSourcesInAllSizesAsItIsDrawn)
{
    for (const int size : programIconSizes) {
        const QString file = QStringLiteral(KAREPORT_TEST_DIR "/../packaging/icons/%1x%1/kareport.png").arg(size);
        const QImage kept = QImage(file).convertToFormat(QImage::Format_ARGB32_Premultiplied);
        ASSERT_EQ(kept.size(), QSize(size, size)) << file.toStdString();
        const QImage drawn = programPicture(size);
        qint64 difference = 0;
        for (int y = 0; y < size; ++y) {
            for (int x = 0; x < size; ++x) {
                difference += std::abs(qAlpha(kept.pixel(x, y)) - qAlpha(drawn.pixel(x, y))) +
                              std::abs(qBlue(kept.pixel(x, y)) - qBlue(drawn.pixel(x, y)));
            }
        }
        EXPECT_LE(difference, qint64(size) * size) << "draw it again with ka_pictures --icons packaging/icons";
    }
    EXPECT_FALSE(programIcon().isNull());
}

} // namespace
