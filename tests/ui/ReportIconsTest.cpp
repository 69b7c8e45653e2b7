#include "ReportResources.h"

#include "PrintQt.h"

#include <QApplication>
#include <QImage>
#include <QPainter>
#include <QPalette>
#include <QPixmap>
#include <QStyle>
#include <QStyleFactory>

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <functional>
#include <memory>

namespace
{

constexpr std::array<unsigned, 3> ids = {11007, 11009, 11011};
constexpr double leastContrast = 3; // what a sign needs to be distinguished from its background

/// Gives the application other colours for a time.
class Theme
{
public:
    explicit Theme(bool dark) : before_(QApplication::palette())
    {
        const std::unique_ptr<QStyle> style(QStyleFactory::create(QStringLiteral("fusion")));
        QPalette palette = style->standardPalette();
        if (dark) {
            palette = QPalette(QColor(0x35, 0x35, 0x35), QColor(0x35, 0x35, 0x35));
            palette.setColor(QPalette::Highlight, QColor(0x2A, 0x82, 0xDA));
        }
        QApplication::setPalette(palette);
    }
    ~Theme() { QApplication::setPalette(before_); }
    Theme(const Theme &) = delete;
    Theme &operator=(const Theme &) = delete;

private:
    QPalette before_;
};

QColor ground()
{
    return QApplication::palette().color(QPalette::Button);
}

/// How bright a colour is to the eye, 0 to 1.
double luminance(const QColor &color)
{
    const auto linear = [](double part) {
        return part <= 0.04045 ? part / 12.92 : std::pow((part + 0.055) / 1.055, 2.4);
    };
    return 0.2126 * linear(color.redF()) + 0.7152 * linear(color.greenF()) + 0.0722 * linear(color.blueF());
}

/// 1 for colours that cannot be distinguished, 21 for black and white.
double contrast(const QColor &a, const QColor &b)
{
    const auto [low, high] = std::minmax({luminance(a), luminance(b)});
    return (high + 0.05) / (low + 0.05);
}

QImage drawn(unsigned id, int size, qreal ratio, QIcon::Mode mode = QIcon::Normal)
{
    return kareport::reportIcon(id).pixmap(QSize(size, size), ratio, mode).toImage();
}

/// The contrasts of an icon's dots to the button that it is drawn on.
std::vector<double> contrastsOf(const QImage &icon)
{
    QImage button(icon.size(), QImage::Format_RGB32);
    button.setDevicePixelRatio(icon.devicePixelRatio());
    button.fill(ground());
    QPainter(&button).drawImage(0, 0, icon);
    std::vector<double> contrasts;
    for (int y = 0; y < button.height(); ++y) {
        for (int x = 0; x < button.width(); ++x) {
            contrasts.push_back(contrast(button.pixelColor(x, y), ground()));
        }
    }
    return contrasts;
}

double strongest(const std::vector<double> &contrasts)
{
    return *std::max_element(contrasts.begin(), contrasts.end());
}

/// The part of an icon's sheet, 0 to 1, that is drawn on.
QRectF extentOf(const QImage &icon)
{
    QRect extent;
    for (int y = 0; y < icon.height(); ++y) {
        for (int x = 0; x < icon.width(); ++x) {
            extent |= icon.pixelColor(x, y).alpha() > 127 ? QRect(x, y, 1, 1) : QRect();
        }
    }
    return {extent.x() / qreal(icon.width()), extent.y() / qreal(icon.height()), extent.width() / qreal(icon.width()),
            extent.height() / qreal(icon.height())};
}

/// Calls a test of every command, size, resolution and set of colours.
void forEveryIcon(const std::function<void(unsigned id, int size, qreal ratio)> &test)
{
    for (const bool dark : {false, true}) {
        const Theme theme(dark);
        for (const unsigned id : ids) {
            for (const int size : {16, 32}) {
                for (const qreal ratio : {1.0, 2.0}) {
                    SCOPED_TRACE(testing::Message()
                                 << id << ", size " << size << ", ratio " << ratio << (dark ? ", dark" : ", light"));
                    test(id, size, ratio);
                }
            }
        }
    }
}

TEST(ReportIcons, StandOutFromTheirButton)
{
    forEveryIcon([](unsigned id, int size, qreal ratio) {
        const QImage icon = drawn(id, size, ratio);
        const int side = qRound(size * ratio);
        ASSERT_EQ(icon.size(), QSize(side, side)) << "as many dots as the screen has";
        EXPECT_EQ(icon.devicePixelRatio(), ratio);
        EXPECT_GE(extentOf(icon).width(), 0.55) << "fills its place";
        EXPECT_GE(extentOf(icon).height(), 0.65);

        const std::vector<double> contrasts = contrastsOf(icon);
        EXPECT_GE(std::count_if(contrasts.begin(), contrasts.end(), [](double c) { return c >= leastContrast; }),
                  2 * side)
            << "an outline, at least";
        EXPECT_GE(strongest(contrasts), 7) << "in the colour of the text";
        for (std::size_t i = 0; i < contrasts.size(); ++i) {
            const QPoint dot(static_cast<int>(i) % side, static_cast<int>(i) / side);
            if (icon.pixelColor(dot).alpha() == 255) {
                EXPECT_GE(contrasts[i], leastContrast) << dot.x() << ", " << dot.y();
            }
        }
        EXPECT_EQ(icon.pixelColor(0, 0).alpha(), 0) << "the button shows through";
        EXPECT_EQ(icon.pixelColor(side - 1, side - 1).alpha(), 0);
    });
}

TEST(ReportIcons, ArePalerWhenDisabled)
{
    forEveryIcon([](unsigned id, int size, qreal ratio) {
        const QImage icon = drawn(id, size, ratio, QIcon::Disabled);
        const std::vector<double> enabled = contrastsOf(drawn(id, size, ratio));
        const std::vector<double> disabled = contrastsOf(icon);
        ASSERT_EQ(disabled.size(), enabled.size());
        EXPECT_GT(strongest(disabled), 1.4) << "still to be seen";
        EXPECT_LT(strongest(disabled), strongest(enabled) / 2);
        for (std::size_t i = 0; i < disabled.size(); ++i) {
            EXPECT_LE(disabled[i], enabled[i] + 0.05) << i << ": no dot is stronger";
        }
        for (int y = 0; y < icon.height(); ++y) {
            for (int x = 0; x < icon.width(); ++x) {
                EXPECT_EQ(icon.pixelColor(x, y).saturation(), 0) << x << ", " << y << ": no colour";
            }
        }
    });
}

TEST(ReportIcons, AreToldApart)
{
    forEveryIcon([](unsigned id, int size, qreal ratio) {
        const QImage icon = drawn(id, size, ratio);
        for (const unsigned other : ids) {
            const QImage otherIcon = drawn(other, size, ratio);
            int different = 0;
            for (int y = 0; y < icon.height(); ++y) {
                for (int x = 0; x < icon.width(); ++x) {
                    different += contrast(icon.pixelColor(x, y), otherIcon.pixelColor(x, y)) >= leastContrast ||
                                         icon.pixelColor(x, y).alpha() / 128 != otherIcon.pixelColor(x, y).alpha() / 128
                                     ? 1
                                     : 0;
                }
            }
            const int leastDifference = icon.width() * icon.height() / 8;
            EXPECT_EQ(different >= leastDifference, other != id) << other << ": " << different;
        }
    });
}

TEST(ReportIcons, AreDrawnForTheScreensResolution)
{
    for (const unsigned id : ids) {
        QImage fine = drawn(id, 16, 2);
        fine.setDevicePixelRatio(1);
        EXPECT_EQ(fine, drawn(id, 32, 1)) << id;
        EXPECT_NE(fine, drawn(id, 16, 1).scaled(32, 32)) << id << ": not enlarged";
    }
}

TEST(ReportIcons, FollowTheColoursOfTheApplication)
{
    for (const unsigned id : ids) {
        const Theme light(false);
        const QIcon icon = kareport::reportIcon(id);
        const QImage before = icon.pixmap(16).toImage();
        {
            const Theme dark(true);
            const QImage after = icon.pixmap(16).toImage();
            EXPECT_NE(after, before) << id;
            EXPECT_GE(strongest(contrastsOf(after)), 7) << id << ": the same icon reads on dark";
        }
        EXPECT_EQ(icon.pixmap(16).toImage(), before) << id << ": and back";
    }
}

TEST(ReportIcons, KeepToTheirPlace)
{
    const QRect place(20, 10, 32, 32);
    for (const unsigned id : ids) {
        QImage sheet(80, 60, QImage::Format_ARGB32_Premultiplied);
        sheet.fill(Qt::transparent);
        QPainter painter(&sheet);
        painter.setPen(Qt::red);
        painter.setBrush(Qt::green);
        kareport::reportIcon(id).paint(&painter, place);
        EXPECT_EQ(painter.pen().color(), QColor(Qt::red)) << id << ": put back";
        EXPECT_EQ(painter.brush().color(), QColor(Qt::green)) << id;
        EXPECT_TRUE(painter.transform().isIdentity()) << id;
        EXPECT_FALSE(painter.testRenderHint(QPainter::Antialiasing)) << id;
        painter.end();
        EXPECT_EQ(sheet.copy(place).convertToFormat(QImage::Format_ARGB32),
                  drawn(id, 32, 1).convertToFormat(QImage::Format_ARGB32))
            << id;
        QPainter eraser(&sheet);
        eraser.setCompositionMode(QPainter::CompositionMode_Clear);
        eraser.fillRect(place, Qt::black);
        eraser.end();
        EXPECT_TRUE(extentOf(sheet).isEmpty()) << id << ": nothing beside it";
    }
}

TEST(ReportIcons, OtherNumbersHaveNone)
{
    struct Row
    {
        unsigned id;
        const char *reason;
    };
    constexpr Row rows[] = {
        {0, "no number"},       {11001, "a title"},       {11005, "a list"},         {11008, "between two commands"},
        {11018, "the toolbar"}, {57603, "a menu's Save"}, {0xFFFFFFFF, "no number"},
    };
    for (const Row &row : rows) {
        EXPECT_TRUE(kareport::reportIcon(row.id).isNull()) << row.reason;
    }
    for (const unsigned id : ids) {
        EXPECT_FALSE(kareport::reportIcon(id).isNull()) << id;
    }
}

} // namespace
