#include "PdfReadBack.h"

#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QProcess>
#include <QRegularExpression>

#include <algorithm>

namespace
{

/// Adds entries of an outline, as qpdf gives them, to a text.
void addEntries(QString &text, const QJsonArray &entries, int level)
{
    for (const QJsonValue &value : entries) {
        const QJsonObject entry = value.toObject();
        const QJsonArray kids = entry.value(QStringLiteral("kids")).toArray();
        const bool isOpen = kids.isEmpty() || entry.value(QStringLiteral("open")).toBool();
        text += QString(2 * level, u' ') + entry.value(QStringLiteral("title")).toString() + u' ' +
                QString::number(entry.value(QStringLiteral("destpageposfrom1")).toInt()) +
                (isOpen ? QStringLiteral("\n") : QStringLiteral("…\n"));
        addEntries(text, kids, level + 1);
    }
}

} // namespace

PdfReadBack::PdfReadBack(const QByteArray &bytes, const char *remark)
    : path_(folder_.filePath(QStringLiteral("a.pdf"))), remark_(remark)
{
    QFile file(path_);
    EXPECT_TRUE(file.open(QIODevice::WriteOnly));
    EXPECT_EQ(file.write(bytes), bytes.size());
}

QStringList PdfReadBack::columns(double pointsPerCharacter) const
{
    QStringList texts = textOfPages({QStringLiteral("-fixed"), QString::number(pointsPerCharacter)});
    for (QString &text : texts) {
        QStringList lines = text.split(u'\n');
        qsizetype margin = text.size();
        for (const QString &line : lines) {
            const auto ink = std::find_if(line.begin(), line.end(), [](QChar c) { return c != u' '; });
            margin = ink != line.end() ? std::min<qsizetype>(margin, ink - line.begin()) : margin;
        }
        for (QString &line : lines) {
            line.remove(0, margin);
        }
        text = lines.join(u'\n');
    }
    return texts;
}

QString PdfReadBack::characters() const
{
    QString text = QString::fromUtf8(run("pdftotext", {QStringLiteral("-raw"), path_, QStringLiteral("-")}));
    return text.remove(QRegularExpression(QStringLiteral("[ \n\f]")));
}

std::vector<PdfFont> PdfReadBack::fonts() const
{
    // The columns after the name: type, encoding, emb, sub, uni, object.
    static const QRegularExpression row(
        QStringLiteral("^(\\S+) +(\\S.*?) +(\\S+) +(yes|no) +(yes|no) +(yes|no) +\\d+ +\\d+$"));
    std::vector<PdfFont> fonts;
    for (const QString &line : QString::fromUtf8(run("pdffonts", {path_})).split(u'\n').mid(2)) {
        if (const auto match = row.match(line.trimmed()); match.hasMatch()) {
            const auto isYes = [&match](int column) { return match.captured(column) == u"yes"; };
            fonts.push_back({match.captured(1), match.captured(2), isYes(4), isYes(5), isYes(6)});
        } else {
            EXPECT_TRUE(line.isEmpty()) << line.toStdString();
        }
    }
    return fonts;
}

std::vector<PdfWord> PdfReadBack::words(int page) const
{
    static const QRegularExpression word(
        QStringLiteral("<word xMin=\"(.*?)\" yMin=\"(.*?)\" xMax=\"(.*?)\" yMax=\"(.*?)\">(.*?)</word>"));
    const QString number = QString::number(page);
    const QString text =
        QString::fromUtf8(run("pdftotext", {QStringLiteral("-bbox"), QStringLiteral("-f"), number, QStringLiteral("-l"),
                                            number, path_, QStringLiteral("-")}));
    std::vector<PdfWord> words;
    for (auto match = word.globalMatch(text); match.hasNext();) {
        const auto found = match.next();
        QString written = found.captured(5);
        written.replace(QStringLiteral("&lt;"), QStringLiteral("<"));
        written.replace(QStringLiteral("&gt;"), QStringLiteral(">"));
        written.replace(QStringLiteral("&amp;"), QStringLiteral("&"));
        words.push_back({written, found.captured(1).toDouble(), found.captured(2).toDouble(),
                         found.captured(3).toDouble(), found.captured(4).toDouble()});
    }
    return words;
}

QString PdfReadBack::check() const
{
    QProcess process;
    process.setProcessChannelMode(QProcess::MergedChannels);
    process.start(QStringLiteral("qpdf"), {QStringLiteral("--check"), path_}, QIODevice::ReadOnly);
    const bool ended = process.waitForFinished(60'000);
    const QString said = QString::fromUtf8(process.readAll());
    return ended && process.exitStatus() == QProcess::NormalExit && process.exitCode() == 0
               ? QString()
               : QStringLiteral("qpdf: ") + said;
}

QByteArray PdfReadBack::objects() const
{
    return run("qpdf",
               {QStringLiteral("--qdf"), QStringLiteral("--object-streams=disable"), path_, QStringLiteral("-")});
}

QImage PdfReadBack::picture(int page, int dotsPerInch) const
{
    const QString number = QString::number(page);
    const QString stem = folder_.filePath(QStringLiteral("page"));
    run("pdftoppm", {QStringLiteral("-r"), QString::number(dotsPerInch), QStringLiteral("-gray"),
                     QStringLiteral("-png"), QStringLiteral("-singlefile"), QStringLiteral("-f"), number, path_, stem});
    const QImage image(stem + QStringLiteral(".png"));
    EXPECT_FALSE(image.isNull());
    return image.convertToFormat(QImage::Format_Grayscale8);
}

QStringList PdfReadBack::textOfPages(const QStringList &options) const
{
    QStringList texts =
        QString::fromUtf8(run("pdftotext", options + QStringList{path_, QStringLiteral("-")})).split(u'\f');
    texts.removeLast(); // every page ends with a form feed
    for (QString &text : texts) {
        while (text.endsWith(u'\n')) {
            text.chop(1);
        }
    }
    return texts;
}

QByteArray PdfReadBack::run(const char *program, const QStringList &arguments) const
{
    QProcess process;
    process.start(QString::fromUtf8(program), arguments, QIODevice::ReadOnly);
    const bool ended = process.waitForFinished(60'000);
    EXPECT_TRUE(ended && process.exitStatus() == QProcess::NormalExit && process.exitCode() == 0)
        << program << ": " << process.readAllStandardError().toStdString();
    QByteArray said = process.readAllStandardError();
    said.replace(remark_, "");
    EXPECT_EQ(said.toStdString(), "") << program;
    return process.readAllStandardOutput();
}

QString PdfReadBack::info(const char *entry) const
{
    const QString name = QString::fromUtf8(entry) + u':';
    for (const QString &line : QString::fromUtf8(run("pdfinfo", {path_})).split(u'\n')) {
        if (line.startsWith(name)) {
            return line.mid(name.size()).trimmed();
        }
    }
    return {};
}

QJsonObject PdfReadBack::json(const char *key) const
{
    const QByteArray said =
        run("qpdf", {QStringLiteral("--json=1"), QStringLiteral("--json-key=") + QLatin1StringView(key), path_});
    return QJsonDocument::fromJson(said).object();
}

QString PdfReadBack::outline() const
{
    QString text;
    addEntries(text, json("outlines").value(QStringLiteral("outlines")).toArray(), 0);
    return text;
}

QStringList PdfReadBack::outlineTexts() const
{
    static const QRegularExpression item(QStringLiteral("<item page=\"\\d+\">(.*?)</item>"));
    const QString said = QString::fromUtf8(run("pdftohtml", {QStringLiteral("-xml"), QStringLiteral("-i"),
                                                             QStringLiteral("-stdout"), QStringLiteral("-q"), path_}));
    QStringList texts;
    for (auto match = item.globalMatch(said); match.hasNext();) {
        texts.append(match.next().captured(1));
    }
    return texts;
}

QStringList PdfReadBack::labels() const
{
    QStringList labels;
    const QJsonArray ranges = json("pagelabels").value(QStringLiteral("pagelabels")).toArray();
    const int pages = pageCount();
    for (qsizetype i = 0; i < ranges.size(); ++i) {
        const QJsonObject range = ranges[i].toObject();
        const QJsonObject label = range.value(QStringLiteral("label")).toObject();
        EXPECT_EQ(label.value(QStringLiteral("/S")).toString(), QStringLiteral("/D"));
        const int first = range.value(QStringLiteral("index")).toInt();
        const int end = i + 1 < ranges.size() ? ranges[i + 1].toObject().value(QStringLiteral("index")).toInt() : pages;
        const int number = label.value(QStringLiteral("/St")).toInt(1);
        for (int page = first; page < end; ++page) {
            labels.append(label.value(QStringLiteral("/P")).toString() + QString::number(number + page - first));
        }
    }
    return labels;
}

Ink inkIn(const QImage &image, const QRect &area)
{
    Ink ink;
    const QRect part = area.intersected(image.rect());
    for (int y = part.top(); y <= part.bottom(); ++y) {
        for (int x = part.left(); x <= part.right(); ++x) {
            const int darkness = 255 - qGray(image.pixel(x, y));
            ink.amount += darkness / 255.0;
            if (darkness > 40) {
                ink.box |= QRect(x, y, 1, 1);
            }
        }
    }
    return ink;
}
