#pragma once

#include "TemplateOutline.h"

#include <QString>
#include <QStringList>
#include <QStringView>

namespace kareport
{

// Pieces that are written into the text of a template, in the way in which its author writes.

/// Whether a text is blanks and tabs alone.
bool isIndentation(QStringView text);
/// Where the line of a position begins.
qsizetype lineStartOf(const QString &text, qsizetype position);

/// An element with a value, in one line.
QString element(const char *name, const QString &value);
/// Puts lines, each with its depth as tabs, at the end of what an element holds, before its closing tag.
/// @param inside  of the element
void insertInside(QString &text, const TextRange &inside, const QStringList &lines);
/// Puts such lines after an element. @param end  of the element
void insertAfter(QString &text, qsizetype end, const QStringList &lines);
/// The end of an element with its closing tag. @param inside  what it holds
qsizetype endOfElement(const QString &text, const TextRange &inside);

/// A name with a number that none of the others has, without regard to case.
QString freeName(const QString &front, const QStringList &others);
/// The value of the first element of a name that begins at or after a position; an empty range there when there is none.
TextRange valueAfter(const QString &text, qsizetype position, const char *name);

} // namespace kareport
