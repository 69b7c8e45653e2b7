#include "SurveyData.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QStringEncoder>

#include <random>

namespace survey
{

namespace
{

/// A number in the style of a dialect.
QString numberIn(const QString &plain, const kareport::NumberStyle &style)
{
    QString whole = plain.section(u'.', 0, 0);
    const QString fraction = plain.section(u'.', 1);
    const bool isNegative = whole.startsWith(u'-');
    whole = isNegative ? whole.mid(1) : whole;
    for (qsizetype at = whole.size() - 3; !style.thousands.empty() && at > 0; at -= 3) {
        whole.insert(at, QString::fromStdString(style.thousands));
    }
    return (isNegative ? QStringLiteral("-") : QString()) + whole +
           (fraction.isEmpty() ? QString() : QLatin1Char(style.decimal) + fraction);
}

QString cellOf(const QString &text, const QString &delimiter, bool isSpaced)
{
    const bool needsQuotes = text.contains(delimiter) || text.contains(u'"') || text.contains(u'\n') ||
                             (isSpaced && (text.isEmpty() || text.contains(u' ')));
    return needsQuotes ? u'"' + QString(text).replace(u'"', QStringLiteral("\"\"")) + u'"' : text;
}

QString literalOf(const QString &text)
{
    return u'\'' + QString(text).replace(u'\'', QStringLiteral("''")) + u'\'';
}

} // namespace

std::vector<Point> somePoints(int count)
{
    const QStringList descriptions = {QString(),
                                      QStringLiteral("TREE"),
                                      QStringLiteral("OAK, OLD"),
                                      QStringLiteral("3\" pipe; steel"),
                                      QStringLiteral("Grenzstein Größe"),
                                      QStringLiteral("it's"),
                                      QStringLiteral("two\nlines")};
    std::mt19937 random(14);
    const auto number = [&random](int decimals, bool mayMiss) {
        const double value = (static_cast<double>(random() % 2'000'000'000) - 1e9) / 1e3;
        return mayMiss && random() % 7 == 0 ? QString() : QString::number(value, 'f', decimals);
    };
    std::vector<Point> points;
    for (int i = 0; i < count; ++i) {
        const auto description = static_cast<qsizetype>(random()) % descriptions.size();
        points.push_back({QStringLiteral("P%1").arg(random() % 500), number(4, false), number(3, true), number(1, true),
                          descriptions[description]});
    }
    return points;
}

QByteArray textOf(const std::vector<Point> &points, const kareport::CsvDialect &dialect)
{
    const bool isSpaced = dialect.kind == kareport::DelimiterKind::Whitespace;
    const QString delimiter = isSpaced ? QStringLiteral("  ") : QString(QLatin1Char(dialect.delimiter));
    QString text;
    for (qsizetype i = 0; i < dialect.skip; ++i) {
        text += QStringLiteral("\"line %1\n").arg(i);
    }
    if (dialect.hasHeader) {
        const QStringList names = {QStringLiteral("Number"), QStringLiteral("Northing"), QStringLiteral("Easting"),
                                   QStringLiteral("Elevation"), QStringLiteral("Description")};
        text += names.join(delimiter) + u'\n';
    }
    for (std::size_t i = 0; i < points.size(); ++i) {
        const Point &point = points[i];
        text +=
            dialect.comment && i % 3 == 0 ? QLatin1Char(*dialect.comment) + QStringLiteral(" a comment\n") : QString();
        text += dialect.passesBlankLines && i % 4 == 0 ? QStringLiteral("  \n\n") : QString();
        QStringList cells = {point.number, numberIn(point.northing, dialect.numbers),
                             numberIn(point.easting, dialect.numbers), numberIn(point.elevation, dialect.numbers),
                             point.description};
        for (QString &cell : cells) {
            cell = cellOf(cell, isSpaced ? QStringLiteral("\t") : delimiter, isSpaced);
        }
        text += cells.join(delimiter) + u'\n';
    }
    switch (dialect.encoding) {
    case kareport::TextEncoding::Utf8: return text.toUtf8();
    case kareport::TextEncoding::Utf16:
        return QStringEncoder(QStringConverter::Utf16LE, QStringConverter::Flag::WriteBom).encode(text);
    default: return text.toLatin1();
    }
}

QByteArray jsonOf(const std::vector<Point> &points, bool isList)
{
    QJsonArray list;
    QByteArray lines;
    for (const Point &point : points) {
        QJsonObject object = {{QStringLiteral("Number"), point.number},
                              {QStringLiteral("Northing"), point.northing.toDouble()},
                              {QStringLiteral("Description"), point.description}};
        if (!point.easting.isEmpty()) {
            object.insert(QStringLiteral("Easting"), point.easting.toDouble());
        }
        object.insert(QStringLiteral("Elevation"),
                      point.elevation.isEmpty() ? QJsonValue() : QJsonValue(point.elevation));
        list.append(object);
        lines += QJsonDocument(object).toJson(QJsonDocument::Compact) + '\n';
    }
    return isList ? QJsonDocument(list).toJson() : lines;
}

QByteArray sqlOf(const std::vector<Point> &points)
{
    QString sql = QStringLiteral("CREATE TABLE points (Number TEXT, Northing FLOAT8, Easting FLOAT8, Elevation FLOAT8, "
                                 "Description TEXT);");
    for (const Point &point : points) {
        const auto numberOf = [](const QString &number) { return number.isEmpty() ? QStringLiteral("NULL") : number; };
        sql += QStringLiteral("INSERT INTO points VALUES (%1, %2, %3, %4, %5);")
                   .arg(literalOf(point.number), numberOf(point.northing), numberOf(point.easting),
                        numberOf(point.elevation), literalOf(point.description));
    }
    return sql.toUtf8();
}

} // namespace survey
