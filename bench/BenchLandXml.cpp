#include "CurveFit.h"
#include "LandXmlList.h"

#include "ProcessorTime.h"

#include <benchmark/benchmark.h>

#include <QHash>

#include <cmath>
#include <memory>
#include <variant>

namespace
{

using namespace kareport;

QByteArray fileOf(const QByteArray &content)
{
    return "<LandXML version=\"1.2\"><Units><Metric linearUnit=\"meter\"/></Units>\n" + content + "</LandXML>\n";
}

/// A line, a clothoid into a curve, the curve and a clothoid out of it, again and again; each is 100 m long.
QByteArray alignmentOf(int elements)
{
    constexpr double length = 100;
    constexpr double curvature = 1 / 500.0;
    QByteArray content = "<Alignments><Alignment name=\"road\" staStart=\"0\"><CoordGeom>\n";
    CurvePlace place;
    const auto text = [](PlanePoint point) {
        return QByteArray::number(point.northing, 'f', 6) + ' ' + QByteArray::number(point.easting, 'f', 6);
    };
    for (int i = 0; i < elements; ++i) {
        const double side = i / 4 % 2 == 0 ? 1 : -1;
        const double first = i % 4 == 2 || i % 4 == 3 ? side * curvature : 0;
        const double last = i % 4 == 1 || i % 4 == 2 ? side * curvature : 0;
        const auto curve = std::get<PlaneCurve>(
            PlaneCurve::make(TransitionForm::Clothoid, place.point, place.bearing, length, first, last));
        const QByteArray rotation = side > 0 ? "cw" : "ccw";
        const auto radius = [](double bend) { return bend == 0 ? QByteArray("INF") : QByteArray("500"); };
        const QByteArray ends = "<Start>" + text(place.point) + "</Start><End>" + text(curve.end().point) + "</End>";
        if (curve.isLine()) {
            content += "<Line>" + ends + "</Line>\n";
        } else if (curve.isArc()) {
            content +=
                "<Curve rot=\"" + rotation + "\"><Center>" + text(*centreOf(curve)) + "</Center>" + ends + "</Curve>\n";
        } else {
            content += "<Spiral spiType=\"clothoid\" length=\"100\" rot=\"" + rotation + "\" radiusStart=\"" +
                       radius(first) + "\" radiusEnd=\"" + radius(last) + "\">" + ends + "</Spiral>\n";
        }
        place = curve.end();
    }
    return content + "</CoordGeom></Alignment></Alignments>";
}

/// Reads a list through. @return its rows
qint64 rowsOf(const QByteArray &content, const LandXmlQuery &query, const QStringList &wanted)
{
    QHash<QString, int> types;
    for (const LandXmlVariable &variable : LandXmlList::variables(query)) {
        types.insert(variable.name, variable.type);
    }
    const auto find = [&](const QString &name) -> std::optional<ValueParser> {
        const qsizetype index = wanted.indexOf(name);
        return index < 0 ? std::nullopt
                         : std::optional(
                               ValueParser(types.value(name), static_cast<unsigned>(index + 1), LandXmlList::units()));
    };
    LandXmlList list(FileBytes::holding(QStringLiteral("bench.xml"), content), query, find, {});
    qint64 rows = 0;
    while (list.GetAt(static_cast<std::size_t>(rows)) != nullptr) {
        ++rows;
    }
    return rows;
}

/// Points; compare the bytes a second at N and 10 N.
void listLandXmlPoints(benchmark::State &state)
{
    QByteArray points = "<CgPoints>\n";
    for (qint64 i = 0; i < state.range(0); ++i) {
        points +=
            "<CgPoint name=\"P" + QByteArray::number(i) + "\" code=\"EP\">6295.3311 16603.3967 108.584</CgPoint>\n";
    }
    const QByteArray content = fileOf(points + "</CgPoints>");
    LandXmlQuery query;
    const QStringList wanted = QStringLiteral("Name Code Northing Easting Elevation").split(u' ');
    const ProcessorTime time;
    for (auto _ : state) {
        if (rowsOf(content, query, wanted) != state.range(0)) {
            state.SkipWithError("rows were lost");
        }
    }
    state.SetBytesProcessed(state.iterations() * content.size());
    time.report(state, static_cast<double>(content.size()));
}
BENCHMARK(listLandXmlPoints)->Arg(50'000)->Arg(500'000)->Unit(benchmark::kMillisecond);

/// Stations with two points beside them: the first number is that of the rows, the second that of the elements. The cost of
/// a row must not grow with the elements.
void listLandXmlStations(benchmark::State &state)
{
    const int elements = static_cast<int>(state.range(1));
    const QByteArray content = fileOf(alignmentOf(elements));
    LandXmlQuery query;
    query.kind = LandXmlListKind::Stations;
    query.atElements = false;
    query.interval = 100.0 * elements / static_cast<double>(state.range(0));
    query.offsets.resize(2);
    query.offsets[0].offset = -3.5;
    query.offsets[1].offset = 3.5;
    const QStringList wanted =
        QStringLiteral("Station Northing Easting Bearing Northing1 Easting1 Northing2 Easting2").split(u' ');
    const ProcessorTime time;
    for (auto _ : state) {
        if (rowsOf(content, query, wanted) < state.range(0)) {
            state.SkipWithError("rows were lost");
        }
    }
    state.SetItemsProcessed(state.iterations() * state.range(0));
    time.report(state, static_cast<double>(state.range(0)));
}
BENCHMARK(listLandXmlStations)
    ->Args({100'000, 500})
    ->Args({100'000, 5})
    ->Args({1'000'000, 500})
    ->Args({1'000'000, 5})
    ->Unit(benchmark::kMillisecond);

} // namespace
