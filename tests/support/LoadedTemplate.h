#pragma once

#include "UXmlReportTpl.h"

#include <QByteArray>
#include <QFile>
#include <QString>
#include <QTemporaryDir>

/// A template file in a folder of its own, which is removed with this object.
class TemplateOnDisk
{
public:
    explicit TemplateOnDisk(const QByteArray &content) : path_(folder_.filePath(QStringLiteral("template.xml")))
    {
        QFile file(path_);
        written_ = file.open(QIODevice::WriteOnly) && file.write(content) == content.size();
    }

    bool written() const { return written_; }
    const QString &path() const { return path_; }

private:
    QTemporaryDir folder_;
    QString path_;
    bool written_ = false;
};

/// A template of a name, loaded from a file of this content.
struct LoadedTemplate
{
    explicit LoadedTemplate(const QByteArray &content, const QString &name = QStringLiteral("T"));

    UXmlReportTpl tpl;
    bool loaded = false;
};
