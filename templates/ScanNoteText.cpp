#include "ScanNoteText.h"

#include "NearestName.h"
#include "TagLint.h"
#include "Xlate.h"

namespace kareport
{

QString bracketedTag(QStringView tag)
{
    return u'<' + elementName(tag) + u'>';
}

QString quotedValue(const ScanElement &element)
{
    constexpr qsizetype longestQuote = 60;
    return u'"' + shortened(element.value.text(), longestQuote) + u'"';
}

bool isScanError(const ScanNote &note)
{
    return note.kind != ScanNote::Kind::ShortCloseDrops;
}

QString scanNoteText(const ScanNote &note)
{
    const QString tag = bracketedTag(note.tag);
    switch (note.kind) {
    case ScanNote::Kind::EmptyEndsList:
        return Xlate("an empty %1 ends its list: what follows in the list is not read").arg(tag);
    case ScanNote::Kind::ClosedBeforeOpen:
        return Xlate("%1 is not read: a closing tag of that name comes before it").arg(tag);
    case ScanNote::Kind::Unclosed: return Xlate("%1 is not read: its closing tag was expected").arg(tag);
    case ScanNote::Kind::RunsOn:
        return Xlate("%1 is inside another %1: the outer one ends at the first closing tag").arg(tag);
    case ScanNote::Kind::ShortCloseDrops: break;
    }
    return Xlate("\"%1\" is dropped with the short closing tag of %2").arg(note.text, tag);
}

} // namespace kareport
