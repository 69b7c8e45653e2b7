#pragma once

#include <QByteArray>
#include <QByteArrayView>

namespace kareport
{

/// A text of the sources, cut where "@@" begins a note for its translator.
struct NotedText
{
    explicit NotedText(QByteArrayView whole)
    {
        const qsizetype mark = whole.indexOf("@@");
        text = whole.first(mark < 0 ? whole.size() : mark).toByteArray();
        if (mark >= 0) {
            note = QByteArray("").append(whole.sliced(mark + 2)); // an empty note is one as well
        }
    }
    /// As translators are asked; null for a text without one.
    const char *noteOrNull() const { return note.isNull() ? nullptr : note.constData(); }

    QByteArray text;
    QByteArray note; ///< null for none
};

} // namespace kareport
