#include "LandXmlContents.h"
#include "LandXmlList.h"
#include "VariableType.h"

#include <cmath>
#include <cstddef>
#include <cstdint>
#include <cstdlib>

namespace
{

using namespace kareport;

/// Reads a list of a file through, sorts it, and reads it again.
void readThrough(const std::shared_ptr<const FileBytes> &file, const LandXmlQuery &query)
{
    constexpr std::size_t most = 5000;
    unsigned id = 0;
    const std::vector<LandXmlVariable> variables = LandXmlList::variables(query);
    const auto find = [&](const QString &name) -> std::optional<ValueParser> {
        for (const LandXmlVariable &variable : variables) {
            if (variable.name == name) {
                return ValueParser(variable.type, ++id, LandXmlList::units());
            }
        }
        return std::nullopt;
    };
    LandXmlList list(file, query, find, {});
    std::size_t rows = 0;
    while (rows < most && list.GetAt(rows) != nullptr) {
        ++rows;
    }
    const auto error = list.error();
    if (error && error->place && (error->place->line < 1 || error->place->column < 1)) {
        std::abort();
    }
    if (rows < most) {
        list.notes();
        list.Sort({3, 1});
        std::size_t sorted = 0;
        while (list.GetAt(sorted) != nullptr) {
            ++sorted;
        }
        if (!error && sorted != rows) {
            std::abort(); // sorting loses no row
        }
    }
}

/// A query with all that a list may be asked for, but for names.
LandXmlQuery queryOf(LandXmlListKind kind, std::size_t size)
{
    LandXmlQuery query;
    query.kind = kind;
    query.interval = 10;
    query.fromRound = size % 2 == 0;
    query.offsets = {{-5, -2.5}, {5, std::nullopt}};
    query.stations = {0, 100.5};
    return query;
}

/// Some of the names of a file: the first and the last.
QStringList someOf(const std::vector<LandXmlNamed> &names)
{
    QStringList some;
    if (!names.empty()) {
        some.append(names.front().name);
        some.append(names.back().name);
    }
    return some;
}

/// Asks for what a list has by its name, as a user does who chooses among the names in the file.
void readNamed(const std::shared_ptr<const FileBytes> &file, std::size_t size)
{
    const auto read = readLandXmlContents(file, {});
    const auto *contents = std::get_if<LandXmlContents>(&read);
    if (contents == nullptr) {
        return;
    }
    using Kind = LandXmlListKind;
    const auto ask = [&](Kind kind, const std::vector<LandXmlNamed> &names, QString LandXmlQuery::*member) {
        for (const QString &name : someOf(names)) {
            LandXmlQuery query = queryOf(kind, size);
            query.*member = name;
            readThrough(file, query);
        }
    };
    ask(Kind::Points, contents->groups, &LandXmlQuery::name);
    ask(Kind::SurfacePoints, contents->surfaces, &LandXmlQuery::name);
    ask(Kind::Courses, contents->parcels, &LandXmlQuery::name);
    if (contents->alignments.empty()) {
        return;
    }
    for (const LandXmlContents::Alignment *alignment : {&contents->alignments.front(), &contents->alignments.back()}) {
        const std::vector<LandXmlNamed> itself = {{alignment->name, alignment->elements}};
        ask(Kind::Elements, itself, &LandXmlQuery::name);
        ask(Kind::OffsetsOf, itself, &LandXmlQuery::alignment);
        ask(Kind::Stations, alignment->gradeLines, &LandXmlQuery::gradeLine);
        ask(Kind::Profile, alignment->gradeLines, &LandXmlQuery::gradeLine);
        ask(Kind::Stations, alignment->surfacesAlong, &LandXmlQuery::surface);
        ask(Kind::CrossSections, alignment->surfacesAcross, &LandXmlQuery::surface);
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    const QByteArray bytes(reinterpret_cast<const char *>(data), static_cast<qsizetype>(size));
    const auto file = FileBytes::holding(QStringLiteral("fuzz.xml"), bytes);
    for (const char *key : {"points", "surfacePoints", "parcels", "courses", "alignments", "elements", "stations",
                            "profile", "crossSections", "offsetsOf"})
    {
        readThrough(file, queryOf(*landXmlListFromKey(QString::fromLatin1(key)), size));
    }
    isLandXml(file);
    readNamed(file, size);
    return 0;
}
