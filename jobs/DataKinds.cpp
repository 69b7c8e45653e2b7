#include "DataKinds.h"

#include "CsvData.h"
#include "JsonData.h"
#include "LandXmlData.h"
#include "PostgresData.h"
#include "SqliteData.h"
#include "ValuesData.h"

namespace kareport
{

const std::vector<DataKind> &dataKinds()
{
    // A kind is added by a line here and a pair of files that makes it, as CsvData.h and CsvData.cpp.
    static const std::vector<DataKind> kinds = [] {
        std::vector<DataKind> made;
        made.push_back(csvDataKind());
        made.push_back(valuesDataKind());
        made.push_back(sqliteDataKind());
        made.push_back(postgresDataKind());
        made.push_back(jsonDataKind());
        made.push_back(landXmlDataKind());
        return made;
    }();
    return kinds;
}

} // namespace kareport
