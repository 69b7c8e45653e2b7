#include "Printing.h"

#include "TerminalProgress.h"

#include <QStringList>

#include <algorithm>
#include <cstdio>

namespace kareport
{

namespace
{

bool isCommand(QChar character)
{
    const char16_t code = character.unicode();
    const bool isControl = code < 0x20 || (code >= 0x7F && code < 0xA0);
    const bool isSeparator = code == 0x2028 || code == 0x2029;
    const bool isDirection = (code >= 0x202A && code <= 0x202E) || (code >= 0x2066 && code <= 0x2069);
    return isControl || isSeparator || isDirection;
}

} // namespace

QString visibleText(const QString &text)
{
    if (std::none_of(text.begin(), text.end(), isCommand)) {
        return text;
    }
    QString visible;
    for (const QChar character : text) {
        if (isCommand(character)) {
            visible += QStringLiteral("\\u%1").arg(character.unicode(), 4, 16, QLatin1Char('0'));
        } else {
            visible += character;
        }
    }
    return visible;
}

void printLine(const QString &line)
{
    // The columns of a list are separated by a tab.
    QStringList columns = line.split(u'\t');
    for (QString &column : columns) {
        column = visibleText(column);
    }
    std::fprintf(stdout, "%s\n", columns.join(u'\t').toUtf8().constData());
}

void printError(const QString &line)
{
    eraseProgress();
    std::fprintf(stderr, "%s\n", visibleText(line).toUtf8().constData());
}

} // namespace kareport
