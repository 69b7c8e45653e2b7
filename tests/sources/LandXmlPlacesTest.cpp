#include "InputErrorText.h"
#include "LandXmlFile.h"
#include "LandXmlRoad.h"

#include <gtest/gtest.h>

// Where the rows of a list are in their file.

namespace
{

using namespace kareport;
using namespace landxml;
using Kind = LandXmlListKind;

QString placeOf(LandXmlFile &file, std::size_t row)
{
    const ValuePlace found = file.list->placeOf(row, QStringLiteral("any"));
    EXPECT_EQ(found.file, file.path());
    return placeText(found.place);
}

const QByteArray points = "<CgPoints name='g'>\n<CgPoint name='b'>1 2</CgPoint>\n  <CgPoint name='a'>3 4</CgPoint>"
                          "</CgPoints>\n";

TEST(LandXmlPlaces, OfRowsAreThoseOfTheirElements)
{
    LandXmlFile elements(fileOf(alignment(bend())), queryOf(Kind::Elements));
    elements.rows();
    EXPECT_EQ(placeOf(elements, 2), u"7:1"_qs);
    EXPECT_EQ(placeOf(elements, 0), u"5:1"_qs) << "in any order";
    EXPECT_EQ(placeOf(elements, 3), u"none"_qs) << "there is no such row";
    EXPECT_EQ(elements.notes(), QStringList()) << "what there is to say of the list stays";
}

TEST(LandXmlPlaces, OfPointsAreKnownThoughTheyAreNotKept)
{
    LandXmlFile file(fileOf(points), queryOf(Kind::Points), {QStringLiteral("Name")});
    file.rows();
    EXPECT_EQ(placeOf(file, 1), u"6:3"_qs);
    EXPECT_EQ(placeOf(file, 0), u"5:1"_qs);
    EXPECT_EQ(placeOf(file, 2), u"none"_qs);
    file.list->Sort({1});
    EXPECT_EQ(file.rows(), QStringList({u"a"_qs, u"b"_qs}));
    EXPECT_EQ(placeOf(file, 0), u"6:3"_qs) << "the row that is printed first";
    EXPECT_EQ(placeOf(file, 1), u"5:1"_qs);
    LandXmlFile projected(fileOf(points + alignment(bend())), queryOf(Kind::OffsetsOf));
    projected.rows();
    EXPECT_EQ(placeOf(projected, 1), u"6:3"_qs);
}

TEST(LandXmlPlaces, AreKnownWhileRowsAreLeft)
{
    LandXmlFile file(fileOf(points), queryOf(Kind::Points), {QStringLiteral("Name")});
    EXPECT_NE(file.list->GetAt(0), nullptr);
    EXPECT_EQ(placeOf(file, 0), u"5:1"_qs);
    EXPECT_EQ(file.rows(), QStringList({u"b"_qs, u"a"_qs})) << "all can be read after that";
}

TEST(LandXmlPlaces, OneMoreDifferenceIsOne)
{
    for (const int more : {1, 2}) {
        LandXmlFile file(
            fileOf("<CgPoints>" + QByteArray("<CgPoint name='1'>1 2</CgPoint>").repeated(101 + more) + "</CgPoints>"),
            queryOf(Kind::Points));
        file.rows();
        ASSERT_EQ(file.notes().size(), 101);
        EXPECT_EQ(file.notes().last(),
                  more == 1 ? u"and 1 more such difference"_qs : u"and 2 more such differences"_qs);
    }
}

} // namespace
