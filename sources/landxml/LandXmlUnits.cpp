#include "LandXmlUnits.h"

#include "UnitFactors.h"
#include "Xlate.h"

#include <algorithm>
#include <cmath>
#include <string>

namespace kareport
{

namespace
{

/// Lower case, with runs of blanks as one and none around: programs differ in both.
std::string folded(std::string_view text)
{
    std::string result;
    for (const char character : text) {
        if (character == ' ' || character == '\t' || character == '\n' || character == '\r') {
            if (!result.empty() && result.back() != ' ') {
                result += ' ';
            }
        } else {
            result += character >= 'A' && character <= 'Z' ? static_cast<char>(character + 32) : character;
        }
    }
    while (!result.empty() && result.back() == ' ') {
        result.pop_back();
    }
    return result;
}

struct Unit
{
    std::string_view name;
    double size;
};

constexpr double usFoot = 1200.0 / 3937.0;
constexpr Unit lengths[] = {
    {"meter", 1},       {"metre", 1},       {"millimeter", 0.001},    {"centimeter", 0.01},       {"kilometer", 1000},
    {"foot", 0.3048},   {"feet", 0.3048},   {"ussurveyfoot", usFoot}, {"us survey foot", usFoot}, {"inch", 0.0254},
    {"mile", 1609.344}, {"miles", 1609.344}};
constexpr Unit areas[] = {{"squaremeter", 1},
                          {"squaremetre", 1},
                          {"squaremillimeter", 1e-6},
                          {"squarecentimeter", 1e-4},
                          {"hectare", 1e4},
                          {"squarefoot", 0.3048 * 0.3048},
                          {"squareinch", 0.0254 * 0.0254},
                          {"acre", 43560 * 0.3048 * 0.3048},
                          {"squaremiles", 1609.344 * 1609.344}};

struct AngleName
{
    std::string_view name;
    LandXmlAngle form;
};

constexpr AngleName angleNames[] = {{"radians", LandXmlAngle::Radians},
                                    {"grads", LandXmlAngle::Grads},
                                    {"decimal degrees", LandXmlAngle::Degrees},
                                    {"decimal dd.mm.ss", LandXmlAngle::DegreesMinutesSeconds}};

/// Reads up to the end of the units.
class HeaderReader : public XmlHandler
{
public:
    explicit HeaderReader(const std::shared_ptr<const FileBytes> &file) : stream_(file, *this) {}

    Expected<LandXmlHeader> read(const QString &path)
    {
        while (stream_.readSome()) {
        }
        if (stream_.error()) {
            return *stream_.error();
        }
        if (!hasUnits_) {
            return InputError{path, std::nullopt,
                              Xlate("the file has no units: Metric or Imperial in Units was expected")};
        }
        return header_;
    }

    Interest startElement(std::string_view name, const XmlAttributes &attributes) override
    {
        ++depth_;
        if (depth_ == 1) {
            header_.version = textOf(attributes.text("version"));
            if (name != "LandXML") {
                stream_.fail(stream_.currentByte(),
                             Xlate("the outermost element is \"%1\": LandXML was expected").arg(textOf(name)));
            }
            return Interest::Parts;
        }
        if (depth_ == 2 && name == "Units") {
            return Interest::Parts;
        }
        if (depth_ == 3 && (name == "Metric" || name == "Imperial")) {
            takeUnits(attributes);
        }
        --depth_;
        return Interest::None;
    }
    void endElement() override { --depth_; }
    void text(std::string_view) override {}
    void foreignElement(std::string_view) override {}
    void leftOutElements(std::string_view, std::size_t) override {}

private:
    static QString textOf(std::string_view text)
    {
        return QString::fromUtf8(text.data(), static_cast<qsizetype>(std::min<std::size_t>(text.size(), 200)));
    }

    void failUnit(const char *attribute, std::string_view value)
    {
        stream_.fail(stream_.currentByte(),
                     Xlate("the unit %1=\"%2\" is not known").arg(QString::fromUtf8(attribute), textOf(value)));
    }

    template <typename Units>
    void takeSize(const XmlAttributes &attributes, const char *attribute, const Units &units, double &size)
    {
        const std::string name = folded(attributes.text(attribute));
        for (const Unit &unit : units) {
            if (unit.name == name) {
                size = unit.size;
                return;
            }
        }
        failUnit(attribute, attributes.text(attribute));
    }

    /// Coordinates have one unit; another one of heights is stated by programs that do not convert them. The feet differ by
    /// less than heights have digits.
    void takeElevationUnit(const XmlAttributes &attributes)
    {
        header_.unitsByte = stream_.currentByte();
        if (!attributes.find("elevationUnit")) {
            return;
        }
        double metres = header_.units.metres;
        takeSize(attributes, "elevationUnit", lengths, metres);
        constexpr double asFeet = 1e-5;
        if (std::fabs(metres / header_.units.metres - 1) >= asFeet) {
            header_.otherElevationUnit = textOf(attributes.text("elevationUnit"));
        }
    }

    void takeAngle(const XmlAttributes &attributes, const char *attribute, LandXmlAngle &form)
    {
        const auto value = attributes.find(attribute);
        if (!value) {
            return; // radians, as the format has it
        }
        const std::string name = folded(*value);
        for (const AngleName &known : angleNames) {
            if (known.name == name) {
                form = known.form;
                return;
            }
        }
        failUnit(attribute, *value);
    }

    void takeUnits(const XmlAttributes &attributes)
    {
        LandXmlUnits &units = header_.units;
        takeSize(attributes, "linearUnit", lengths, units.metres);
        units.squareMetres = units.metres * units.metres;
        if (attributes.find("areaUnit")) {
            takeSize(attributes, "areaUnit", areas, units.squareMetres);
        }
        // An acre or a square foot is of the same foot as the lengths.
        const std::string area = folded(attributes.text("areaUnit"));
        if (units.metres == usFoot && (area == "acre" || area == "squarefoot")) {
            units.squareMetres *= (usFoot / 0.3048) * (usFoot / 0.3048);
        }
        takeElevationUnit(attributes);
        takeAngle(attributes, "angularUnit", units.angle);
        takeAngle(attributes, "directionUnit", units.direction);
        hasUnits_ = true;
        if (!stream_.error()) {
            stream_.stop();
        }
    }

    XmlStream stream_;
    LandXmlHeader header_;
    int depth_ = 0;
    bool hasUnits_ = false;
};

} // namespace

Expected<LandXmlHeader> readLandXmlHeader(const std::shared_ptr<const FileBytes> &file)
{
    return HeaderReader(file).read(file->path());
}

} // namespace kareport
