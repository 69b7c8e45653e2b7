#include "PlaceholderPiece.h"

#include "NearestName.h"
#include "Xlate.h"

namespace kareport
{

namespace
{

/// The most characters of a text that a message repeats.
constexpr qsizetype longestQuote = 40;

} // namespace

PlaceholderPiece placeholderPieceAt(QStringView text, qsizetype at)
{
    using Kind = PlaceholderPiece::Kind;
    if (text[at] != u'{') {
        const qsizetype brace = text.indexOf(u'{', at);
        const qsizetype end = brace < 0 ? text.size() : brace;
        return {Kind::Text, text.sliced(at, end - at), end};
    }
    if (text.sliced(at + 1).startsWith(u'{')) {
        return {Kind::Text, text.sliced(at, 1), at + 2};
    }
    const qsizetype end = text.indexOf(u'}', at);
    if (end < 0) {
        return {Kind::Unended, text.sliced(at), text.size()};
    }
    return {Kind::Placeholder, text.sliced(at + 1, end - at - 1), end + 1};
}

QString inBraces(QStringView name)
{
    return u'{' + name.toString() + u'}';
}

QString unendedPlaceholder(QStringView rest)
{
    return Xlate("\"%1\" begins a placeholder that does not end: \"}\" was expected, or \"{{\" for a brace")
        .arg(shortened(rest.toString(), longestQuote));
}

QString unknownPlaceholder(QStringView name, const QStringList &known)
{
    const QString braced = inBraces(shortened(name.toString(), longestQuote));
    return Xlate("unknown placeholder %1: %2").arg(braced, oneOfExpected(braced, known));
}

} // namespace kareport
