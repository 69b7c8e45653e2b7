#include "Placeholders.h"

#include "NearestName.h"
#include "PageHeader.h"
#include "PageMark.h"
#include "UnitFactors.h"
#include "Xlate.h"

#include <QLocale>

namespace kareport
{

namespace
{

constexpr qsizetype pageMarksOfLabel = 3;
constexpr qsizetype longestQuote = 40;

/// A piece of a text: characters, or a placeholder.
struct Piece
{
    enum class Kind
    {
        Text,
        Placeholder,
        Unended ///< a brace that begins a placeholder, and what follows it
    };
    Kind kind;
    QStringView text; ///< of a placeholder, its name
    qsizetype end;    ///< where the next piece begins
};

Piece pieceAt(QStringView text, qsizetype at)
{
    if (text[at] != u'{') {
        const qsizetype brace = text.indexOf(u'{', at);
        const qsizetype end = brace < 0 ? text.size() : brace;
        return {Piece::Kind::Text, text.sliced(at, end - at), end};
    }
    if (text.sliced(at + 1).startsWith(u'{')) {
        return {Piece::Kind::Text, text.sliced(at, 1), at + 2};
    }
    const qsizetype end = text.indexOf(u'}', at);
    if (end < 0) {
        return {Piece::Kind::Unended, text.sliced(at), text.size()};
    }
    return {Piece::Kind::Placeholder, text.sliced(at + 1, end - at - 1), end + 1};
}

QString inBraces(const QString &name)
{
    return u'{' + name + u'}';
}

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
        const Piece piece = pieceAt(text, at);
        if (piece.kind == Piece::Kind::Unended) {
            return Xlate("\"%1\" begins a placeholder that does not end: \"}\" was expected, or \"{{\" for a brace")
                .arg(piece.text.left(longestQuote));
        }
        if (piece.kind == Piece::Kind::Placeholder && !known.contains(piece.text)) {
            QStringList braced;
            for (const QString &name : known) {
                braced.append(inBraces(name));
            }
            const QString name = inBraces(piece.text.left(longestQuote).toString());
            return Xlate("unknown placeholder %1: %2").arg(name, oneOfExpected(name, braced));
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
        const Piece piece = pieceAt(text, at);
        const auto value =
            piece.kind == Piece::Kind::Placeholder ? valueOf(piece.text, templateTitle, pageMarks) : std::nullopt;
        if (value) {
            done += *value;
        } else if (piece.kind == Piece::Kind::Placeholder) {
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
