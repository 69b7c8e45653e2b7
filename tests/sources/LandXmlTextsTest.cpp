#include "LandXmlFile.h"
#include "LandXmlRoad.h"
#include "VariableType.h"

#include <gtest/gtest.h>

namespace
{

using namespace kareport;
using namespace landxml;
using Kind = LandXmlListKind;

/// The values of a list whose dictionary has all variables as texts. @return one text for each row
QStringList textsOf(const QByteArray &content, const LandXmlQuery &query, const QStringList &variables,
                    const UJobSettings &settings = {})
{
    const auto find = [&](const QString &name) -> std::optional<ValueParser> {
        const qsizetype index = variables.indexOf(name);
        return index < 0
                   ? std::nullopt
                   : std::optional(ValueParser(VARIABLE_TEXT, static_cast<unsigned>(index + 1), LandXmlList::units()));
    };
    LandXmlList list(FileBytes::holding(QStringLiteral("f.xml"), content), query, find, {}, settings);
    QStringList rows;
    for (std::size_t i = 0; const UDataObject *object = list.GetAt(i); ++i) {
        QStringList row;
        for (qsizetype column = 0; column < variables.size(); ++column) {
            const UDictEntry *entry = object->Find(static_cast<unsigned>(column + 1));
            row.append(entry == nullptr ? QString() : *static_cast<const QString *>(entry->GetData()));
        }
        rows.append(row.join(u'|'));
    }
    return rows;
}

TEST(LandXmlTexts, ARadiusIsInfOnALine)
{
    const QStringList variables = {QStringLiteral("Type"), QStringLiteral("Radius"), QStringLiteral("StartRadius"),
                                   QStringLiteral("EndRadius")};
    const PlaneCurve spiral = curve(TransitionForm::Clothoid, {1200, 650}, std::numbers::pi / 2, 60, 0, -1 / 200.0);
    const QByteArray content = fileOf(alignment(bend() + landxml::spiral(spiral, "clothoid")));
    EXPECT_EQ(textsOf(content, queryOf(Kind::Elements), variables),
              QStringList({u"Line|INF|INF|INF"_qs, u"Curve|100.000|100.000|100.000"_qs, u"Line|INF|INF|INF"_qs,
                           u"Spiral||INF|200.000"_qs}));
    UJobSettings feet;
    feet.lengthUnit = LengthUnit::InternationalFoot;
    feet.lengthDecimals = 1;
    EXPECT_EQ(textsOf(content, queryOf(Kind::Elements), variables, feet).value(1), u"Curve|328.1|328.1|328.1"_qs)
        << "in the unit and with the decimals of the report";
}

TEST(LandXmlTexts, StationsAreWrittenAsTheReportDoesAndAreBlankWhereThereAreNone)
{
    const QByteArray content = fileOf(alignment(bend(), "name='road' staStart='-10'",
                                                "<StaEquation staInternal='90' staBack='90' staAhead='1500'/>"));
    LandXmlQuery query = queryOf(Kind::Stations);
    const QStringList variables = {QStringLiteral("Station"), QStringLiteral("StationBack"), QStringLiteral("Region"),
                                   QStringLiteral("Radius")};
    EXPECT_EQ(textsOf(content, query, variables),
              QStringList({u"-0+010.000||0|INF"_qs, u"1+500.000|0+090.000|1|100.000"_qs, u"1+657.080||1|INF"_qs,
                           u"1+707.080||1|INF"_qs}));
    UJobSettings hundreds;
    hundreds.stationFormat = UJobSettings::StationFormat::HundredsPlus;
    hundreds.stationDecimals = 0;
    EXPECT_EQ(textsOf(content, query, variables, hundreds).value(1), u"15+00|0+90|1|100.000"_qs);
}

TEST(LandXmlTexts, AnglesAndBearingsAreInTheUnitOfTheReport)
{
    const QStringList variables = {QStringLiteral("Deflection"), QStringLiteral("EndBearing")};
    const QByteArray content = fileOf(alignment(bend()));
    EXPECT_EQ(textsOf(content, queryOf(Kind::Elements), variables).value(1), u"90.000|N 90\u00B000'00\" E"_qs);
    UJobSettings gon;
    gon.angleUnit = AngleUnit::Gon;
    gon.numberDecimals = 1;
    gon.bearingUnit = 2;
    gon.bearingStyle = 0;
    gon.bearingDecimals = 2;
    EXPECT_EQ(textsOf(content, queryOf(Kind::Elements), variables, gon).value(1), u"100.0|100.00g"_qs);
}

TEST(LandXmlTexts, OffsetsAndAreasAreInTheUnitOfTheReport)
{
    LandXmlQuery query = queryOf(Kind::Stations);
    query.offsets = {{-3.048, {}}, {3.048, {}}, {0, {}}};
    UJobSettings feet;
    feet.lengthUnit = LengthUnit::InternationalFoot;
    feet.areaUnit = AreaUnit::Hectare;
    feet.lengthDecimals = 2;
    const QStringList offsets = {QStringLiteral("Offset1"), QStringLiteral("Offset2"), QStringLiteral("Offset3")};
    EXPECT_EQ(textsOf(fileOf(alignment(bend())), query, offsets, feet).value(0), u"10.00L|10.00R|0.00"_qs);
    const QByteArray section = "<CrossSects><CrossSect sta='5' areaCut='25000' areaFill='-0.0001'><CrossSectSurf>"
                               "<PntList2D>1 2</PntList2D></CrossSectSurf></CrossSect></CrossSects>";
    EXPECT_EQ(textsOf(fileOf(alignment(bend(), "name='road' staStart='0'", {}, section)), queryOf(Kind::CrossSections),
                      {QStringLiteral("Offset"), QStringLiteral("CutArea"), QStringLiteral("FillArea")}, feet)
                  .value(0),
              u"3.28R|2.500|0.000"_qs);
}

TEST(LandXmlTexts, NumbersWithoutAUnitAreNumbers)
{
    EXPECT_EQ(textsOf(fileOf(alignment(bend())), queryOf(Kind::Elements), {QStringLiteral("Element")}).value(1),
              u"2"_qs);
}

} // namespace
