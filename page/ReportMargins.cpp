#include "ReportMargins.h"

#include "LeadingInteger.h"

#include <QStringList>

namespace kareport
{

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

} // namespace kareport
