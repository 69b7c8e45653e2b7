#include "World.h"

#include "ReportTextDecoder.h"
#include "RichTextReader.h"
#include "UReportDoc.h"

#include <QFile>
#include <QFileInfo>
#include <QTextDocument>

#include <algorithm>

namespace monkey
{

namespace
{

/// The characters of a text, whatever ends its lines.
QString plainLines(QString text)
{
    text.replace(QStringLiteral("\r\n"), QStringLiteral("\n")).replace(u'\r', u'\n').replace(QChar(0xA0), u' ');
    while (text.endsWith(u'\n')) {
        text.chop(1);
    }
    return text;
}

/// What is seen of a rich text, as far as it can be read.
template <typename View>
QString seenOf(View rich)
{
    QTextDocument document;
    kareport::readRichText(rich, document);
    return plainLines(document.toPlainText());
}

/// Whether a rich text shows what a report shows: the report's text, read as characters or as the bytes of a file, or as it
/// stands.
bool showsSame(const QByteArray &rich, const QString &text)
{
    const QString seen = seenOf(QByteArrayView(rich));
    if (seen == plainLines(text)) {
        return true; // also what somebody typed that reads like rich text
    }
    return kareport::isRichText(text) &&
           (seen == seenOf(QStringView(text)) || seen == seenOf(QByteArrayView(text.toLatin1())));
}

/// Whether a file holds a text, as whoever opens it reads it.
bool loadsAs(const QString &path, const QString &text)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        return false;
    }
    const QByteArray content = file.readAll();
    QString kept;
    if (!kareport::decodeReportText(content, kept) && kept == text) {
        return true;
    }
    return kareport::isRichText(QByteArrayView(content)) && showsSame(content, text);
}

} // namespace

QStringList World::writtenFiles() const
{
    QStringList written;
    const QHash<QString, Stamp> now = lookAtFiles();
    for (auto file = now.begin(); file != now.end(); ++file) {
        if (filesBefore_.value(file.key()) != file.value()) {
            written.append(file.key());
        }
    }
    return written;
}

bool World::isKept(const QString &text) const
{
    const QStringList written = writtenFiles();
    return std::any_of(written.begin(), written.end(), [&text](const QString &path) { return loadsAs(path, text); });
}

QString World::describeWritten(const QString &text) const
{
    constexpr int shown = 120;
    const auto start = [&](const QByteArray &bytes) {
        return QString::fromLatin1(bytes.first(qMin(bytes.size(), shown)).toPercentEncoding(" {}\\\""));
    };
    QString described = QStringLiteral("\n  text of %1: %2").arg(text.size()).arg(start(text.toUtf8()));
    for (const QString &path : writtenFiles()) {
        QFile file(path);
        const QByteArray content = file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
        described += QStringLiteral("\n  %1 of %2: %3").arg(path).arg(content.size()).arg(start(content));
    }
    return described;
}

QString World::checkFiles() const
{
    for (const UReportDoc *report : reports()) {
        const Seen *was = seen(ids_.value(report));
        const bool isSaved = was != nullptr && was->isModified && !report->IsModified() && !isReloaded(*was);
        const QString text = textOf(*report);
        if (isSaved && !text.isEmpty() && !isKept(text)) {
            return QStringLiteral("%1 counts as saved and is in no file").arg(was->title) + describeWritten(text);
        }
    }
    return {};
}

} // namespace monkey
