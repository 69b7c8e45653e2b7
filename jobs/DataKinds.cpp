#include "DataKinds.h"

namespace kareport
{

const std::vector<DataKind> &dataKinds()
{
    // A kind is added by a line here, one in the header, and a file that makes it, as CsvData.cpp.
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
