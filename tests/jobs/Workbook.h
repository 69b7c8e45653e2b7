#pragma once

#include "ResultJob.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QProcess>

namespace jobs
{

/// A workbook of a job, read back without the library that wrote it.
class Workbook
{
public:
    explicit Workbook(const ResultJob &job, const char *name = "p.xlsx")
    {
        if (!job.error.isEmpty()) {
            ADD_FAILURE() << job.error.toStdString();
            return;
        }
        job.folder.put(name, QByteArray::fromStdString(job.bytes(name)));
        QProcess process;
        process.start(QStringLiteral("python3"),
                      {QStringLiteral(KAREPORT_TEST_DIR "/support/workbook.py"), job.folder.path(name)});
        EXPECT_TRUE(process.waitForFinished(60'000) && process.exitCode() == 0)
            << process.readAllStandardError().toStdString();
        book_ = QJsonDocument::fromJson(process.readAllStandardOutput()).object();
    }

    QString property(const char *name) const { return book_[u"properties"][QString::fromUtf8(name)].toString(); }
    QStringList sheets() const
    {
        QStringList names;
        for (const QJsonValue sheet : book_[u"sheets"].toArray()) {
            names.append(sheet[u"name"].toString());
        }
        return names;
    }
    QString of(int sheet, const char *key) const { return book_[u"sheets"][sheet][QString::fromUtf8(key)].toString(); }
    /// The cells of a sheet, each as "A1 s text", "A1 n number format" or "A1 f formula = number".
    std::string cells(int sheet) const
    {
        QString all;
        for (const QJsonValue cell : book_[u"sheets"][sheet][u"cells"].toArray()) {
            all += cell[0].toString() + u' ' + cell[1].toString() + u' ' + cell[2].toString() +
                   (cell[1].toString() == u"n" ? u' ' + cell[3].toString() : QString()) + u'\n';
        }
        return all.toStdString();
    }

private:
    QJsonObject book_;
};

} // namespace jobs
