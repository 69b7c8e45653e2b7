// Reads a LandXML file and says what that took, for comparisons with other programs.
//
//   ka_landxml_work points FILE   lists the points of FILE
//   ka_landxml_work walk FILE     a bare parser tells all elements and texts of FILE to functions that do nothing
//
// Prints the seconds of processor time and the peak memory of the process in KB.

#include "LandXmlList.h"
#include "ProcessorTime.h"

#include <QFile>

#include <array>
#include <cstdio>
#include <ctime>
#include <expat.h>
#include <functional>

namespace
{

using namespace kareport;

int say(const std::function<bool()> &work)
{
    const bool isDone = work();
    const double seconds = static_cast<double>(std::clock()) / CLOCKS_PER_SEC; // since the process began
    std::printf("%.6f %ld\n", seconds, peakMemory());
    return isDone ? 0 : 1;
}

bool listPoints(const QString &path)
{
    const auto file = FileBytes::open(path);
    if (errorOf(file) != nullptr) {
        return false;
    }
    const LandXmlQuery query;
    const QStringList wanted = QStringLiteral("Name Code Northing Easting Elevation").split(u' ');
    const auto find = [&](const QString &name) -> std::optional<ValueParser> {
        const qsizetype index = wanted.indexOf(name);
        for (const LandXmlVariable &variable : LandXmlList::variables(query)) {
            if (variable.name == name && index >= 0) {
                return ValueParser(variable.type, static_cast<unsigned>(index + 1), LandXmlList::units());
            }
        }
        return std::nullopt;
    };
    LandXmlList list(std::get<std::shared_ptr<const FileBytes>>(file), query, find, {});
    std::size_t rows = 0;
    while (list.GetAt(rows) != nullptr) {
        ++rows;
    }
    return rows > 0 && !list.error();
}

void beginNothing(void *, const char *, const char **) {}
void endNothing(void *, const char *) {}
void textNothing(void *, const char *, int) {}

bool walk(const QString &path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        return false;
    }
    const XML_Parser parser = XML_ParserCreate(nullptr);
    XML_SetElementHandler(parser, beginNothing, endNothing);
    XML_SetCharacterDataHandler(parser, textNothing);
    static std::array<char, 65536> block;
    auto status = XML_STATUS_OK;
    for (bool isLast = false; !isLast && status == XML_STATUS_OK;) {
        const qint64 size = file.read(block.data(), block.size());
        isLast = size <= 0;
        status = XML_Parse(parser, block.data(), static_cast<int>(size), isLast ? 1 : 0);
    }
    XML_ParserFree(parser);
    return status == XML_STATUS_OK;
}

} // namespace

int main(int argc, char **argv)
{
    const QByteArrayView verb(argc > 1 ? argv[1] : "");
    const QString path = argc == 3 ? QFile::decodeName(argv[2]) : QString();
    if (verb == QByteArrayView("points") && argc == 3) {
        return say([&] { return listPoints(path); });
    }
    if (verb == QByteArrayView("walk") && argc == 3) {
        return say([&] { return walk(path); });
    }
    std::fputs("ka_landxml_work points FILE | walk FILE\n", stderr);
    return 1;
}
