#include "JobNotes.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <algorithm>
#include <iterator>

namespace kareport
{

namespace
{

QString keyOf(JobNote::Kind kind)
{
    switch (kind) {
    case JobNote::Kind::UnknownColumn: return QStringLiteral("unknown-column");
    case JobNote::Kind::WideValue: return QStringLiteral("wide-value");
    case JobNote::Kind::MissingValue: return QStringLiteral("missing-value");
    case JobNote::Kind::BlankValue: return QStringLiteral("blank-value");
    case JobNote::Kind::NotFinite: return QStringLiteral("not-finite");
    case JobNote::Kind::UnknownSortKey: return QStringLiteral("unknown-sort-key");
    case JobNote::Kind::UnshownCharacter: return QStringLiteral("unshown-character");
    case JobNote::Kind::NotInTotal: return QStringLiteral("not-in-total");
    case JobNote::Kind::Difference: return QStringLiteral("difference");
    case JobNote::Kind::PassedOver: return QStringLiteral("passed-over");
    case JobNote::Kind::AssumedUnit: return QStringLiteral("assumed-unit");
    case JobNote::Kind::UnfilledField: break;
    }
    return QStringLiteral("unfilled-field");
}

/// Which values a note is about.
void insertValues(QJsonObject &object, const JobNote &note)
{
    object.insert(QStringLiteral("count"), static_cast<qint64>(note.values));
    if (note.firstRow > 0) {
        object.insert(QStringLiteral("row"), static_cast<qint64>(note.firstRow));
    }
    object.insert(QStringLiteral("reportLine"), note.line);
    if (!note.dataFile.isEmpty()) {
        object.insert(QStringLiteral("dataFile"), note.dataFile);
    }
    if (note.dataPlace) {
        object.insert(QStringLiteral("dataLine"), note.dataPlace->line);
        object.insert(QStringLiteral("dataColumn"), note.dataPlace->column);
    }
}

} // namespace

QString JobNote::message() const
{
    return about.messageAs(QStringLiteral("note"));
}

void JobNotes::add(const JobNote &note)
{
    if (messages_.insert(note.message()).second) {
        notes_.push_back(note);
    }
}

std::vector<JobNote> JobNotes::said() const
{
    std::vector<JobNote> notes;
    std::copy_if(notes_.begin(), notes_.end(), std::back_inserter(notes),
                 [](const JobNote &note) { return note.isToBeSaid(); });
    return notes;
}

QByteArray JobNotes::toJson() const
{
    QJsonArray list;
    for (const JobNote &note : notes_) {
        QJsonObject object;
        object.insert(QStringLiteral("kind"), keyOf(note.kind));
        object.insert(QStringLiteral("file"), note.about.file);
        if (note.about.place) {
            object.insert(QStringLiteral("line"), note.about.place->line);
            object.insert(QStringLiteral("column"), note.about.place->column);
        }
        object.insert(QStringLiteral("text"), note.about.text);
        if (note.values > 0) {
            insertValues(object, note);
        }
        list.append(object);
    }
    return QJsonDocument(list).toJson();
}

} // namespace kareport
