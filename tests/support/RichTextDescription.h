#pragma once

#include "RichTextReader.h"

#include "PrintQt.h"

#include <QColor>
#include <QFont>
#include <QStringList>
#include <QTextBlock>
#include <QTextDocument>

#include <gtest/gtest.h>

/// Documents in one line: paragraphs separated by "|", each with its formats in brackets and those of its pieces of text in
/// angle brackets. What a rich text has where it says nothing is not mentioned: 12 points, no colour, no indents.
namespace richtext
{

QString number(double value);

QString charactersOf(const QTextCharFormat &format);

QString paragraphOf(const QTextBlockFormat &format);

QString described(const QTextDocument &document);

/// What is read of a whole file.
QString shown(QByteArrayView bytes, kareport::RichTextNotes *notes = nullptr);

/// What is read of a body: of the outermost group after the first word.
QString body(const QByteArray &bytes, kareport::RichTextNotes *notes = nullptr);

/// A table of bodies, with the reason for each.
struct Row
{
    QByteArray bytes;
    QStringView expected;
    const char *reason;
};

template <std::size_t size>
void expectBodies(const Row (&rows)[size], const QByteArray &before = {})
{
    for (const Row &row : rows) {
        EXPECT_EQ(body(before + row.bytes), row.expected) << row.reason << ": " << row.bytes.constData();
    }
}

} // namespace richtext
