#include "ReportMargins.h"

#include "LeadingInteger.h"
#include "Profile.h"

#include <QStringList>

namespace kareport
{

namespace
{

const QString profileEntry = QStringLiteral("Report Margins");

} // namespace

QString marginsToText(const QMargins &margins)
{
    return QStringLiteral("%1, %2, %3, %4")
        .arg(margins.left())
        .arg(margins.top())
        .arg(margins.right())
        .arg(margins.bottom());
}

QMargins marginsFromText(const QString &text, QMargins margins)
{
    QStringList pieces;
    for (const QString &piece : text.split(u',')) {
        pieces += piece.split(u' ', Qt::SkipEmptyParts);
    }
    using Setter = void (QMargins::*)(int);
    constexpr Setter setters[] = {&QMargins::setLeft, &QMargins::setTop, &QMargins::setRight, &QMargins::setBottom};
    qsizetype next = 0;
    for (const Setter set : setters) {
        if (next == pieces.size()) {
            break;
        }
        (margins.*set)(leadingInteger(pieces[next++]));
    }
    return margins;
}

std::optional<QMargins> profileMargins(const QMargins &missing)
{
    const QString kept = GetProfileString(QString(), profileEntry);
    return kept.isEmpty() ? std::nullopt : std::optional(marginsFromText(kept, missing));
}

void setProfileMargins(const QMargins &margins)
{
    WriteProfileString(QString(), profileEntry, marginsToText(margins));
}

} // namespace kareport
