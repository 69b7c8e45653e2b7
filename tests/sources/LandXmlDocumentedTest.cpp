#include "LandXmlFile.h"
#include "VariableKeywords.h"
#include "VariableType.h"

#include <QRegularExpression>
#include <gtest/gtest.h>

namespace
{

using namespace kareport;

/// What the numbers of a type are in.
QString unitOf(int type)
{
    switch (type) {
    case VARIABLE_LENGTH:
    case VARIABLE_DISTANCE:
    case VARIABLE_OFFSET:
    case VARIABLE_STATION:
    case VARIABLE_COORDINATE:
    case VARIABLE_ELEVATION: return QStringLiteral("m");
    case VARIABLE_AREA: return QStringLiteral("m²");
    case VARIABLE_ANGLE:
    case VARIABLE_BEARING: return QStringLiteral("rad");
    case VARIABLE_DOUBLE: return QStringLiteral("percent");
    default: return QString();
    }
}

TEST(LandXmlDocumented, AllVariablesAreInTheDocument)
{
    QFile file(QStringLiteral(KAREPORT_TEST_DIR "/../docs/landxml-lists.md"));
    ASSERT_TRUE(file.open(QIODevice::ReadOnly));
    const QStringList sections = QString::fromUtf8(file.readAll()).split(QStringLiteral("\n## "));
    int lists = 0;
    for (const QString &section : sections.sliced(1)) {
        const auto kind = landXmlListFromKey(section.mid(1, section.indexOf(u'`', 1) - 1));
        ASSERT_TRUE(kind) << section.left(30).toStdString();
        ++lists;
        QStringList documented;
        static const QRegularExpression row(QStringLiteral("\n\\| `(\\w+)` \\| (\\w+) \\| ?([^|]*?) ?\\|"));
        for (const QRegularExpressionMatch &match : row.globalMatch(section)) {
            documented.append(match.captured(1) + u' ' + match.captured(2) + u' ' + match.captured(3));
        }
        LandXmlQuery query = landxml::queryOf(*kind);
        query.offsets.resize(1);
        QStringList known;
        for (const LandXmlVariable &variable : LandXmlList::variables(query)) {
            const bool isOffset = variable.name.endsWith(u'1') && *kind != LandXmlListKind::Stations;
            EXPECT_FALSE(isOffset) << "only stations have offsets";
            known.append(variable.name + u' ' + keywordOf(variable.type).toString() + u' ' + unitOf(variable.type));
        }
        EXPECT_EQ(documented, known) << keyOf(*kind).toString().toStdString();
    }
    EXPECT_EQ(lists, 10);
}

} // namespace
