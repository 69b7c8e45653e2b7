#include "Placeholders.h"

#include "PageHeader.h"
#include "PageMark.h"
#include "PlaceholderPiece.h"
#include "UnitFactors.h"

namespace kareport
{

namespace
{

using Kind = PlaceholderPiece::Kind;

constexpr qsizetype pageMarksOfLabel = 3;

} // namespace

Placeholders::Placeholders(const UJobSettings &settings, const QString &application, const QDateTime &time,
                           const std::optional<QString> &title)
    : lengthUnit_(nameOf(settings.lengthUnit).toString()),
      areaUnit_(nameOf(settings.areaUnit).toString()),
      angleUnit_(nameOf(settings.angleUnit).toString()),
      application_(application),
      date_(pageHeaderDay(time)),
      time_(pageHeaderHour(time)),
      title_(title)
{}

QStringList Placeholders::names()
{
    QStringList names;
    for (const char *name : {"lengthUnit", "areaUnit", "angleUnit", "date", "time", "title", "application", "page"}) {
        names.append(QLatin1StringView(name));
    }
    return names;
}

std::optional<QString> Placeholders::wrongIn(QStringView text)
{
    const QStringList known = names();
    for (qsizetype at = 0; at < text.size();) {
        const PlaceholderPiece piece = placeholderPieceAt(text, at);
        if (piece.kind == Kind::Unended) {
            return unendedPlaceholder(piece.text);
        }
        if (piece.kind == Kind::Placeholder && !known.contains(piece.text)) {
            QStringList braced;
            for (const QString &name : known) {
                braced.append(inBraces(name));
            }
            return unknownPlaceholder(piece.text, braced);
        }
        at = piece.end;
    }
    return std::nullopt;
}

std::optional<QString> Placeholders::valueOf(QStringView name, const QString &templateTitle, qsizetype pageMarks) const
{
    const struct
    {
        QStringView name;
        const QString &value;
    } values[] = {{u"lengthUnit", lengthUnit_},
                  {u"areaUnit", areaUnit_},
                  {u"angleUnit", angleUnit_},
                  {u"date", date_},
                  {u"time", time_},
                  {u"title", title_ ? *title_ : templateTitle},
                  {u"application", application_}};
    for (const auto &row : values) {
        if (row.name == name) {
            return row.value;
        }
    }
    return name == u"page" ? std::optional(QString(pageMarks, pageMark)) : std::nullopt;
}

QString Placeholders::withValues(QStringView text, const QString &templateTitle, qsizetype pageMarks) const
{
    QString done;
    for (qsizetype at = 0; at < text.size();) {
        const PlaceholderPiece piece = placeholderPieceAt(text, at);
        const auto value =
            piece.kind == Kind::Placeholder ? valueOf(piece.text, templateTitle, pageMarks) : std::nullopt;
        if (value) {
            done += *value;
        } else if (piece.kind == Kind::Placeholder) {
            done += text.sliced(at, piece.end - at);
        } else {
            done += piece.text;
        }
        at = piece.end;
    }
    return done;
}

QString Placeholders::textOf(QStringView text, const QString &templateTitle) const
{
    return withValues(text, templateTitle, 1);
}

QString Placeholders::labelOf(QStringView label, const QString &templateTitle) const
{
    return withValues(label, templateTitle, pageMarksOfLabel);
}

} // namespace kareport
