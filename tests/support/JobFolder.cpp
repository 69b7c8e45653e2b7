#include "JobFolder.h"

void JobFolder::put(const char *name, const QByteArray &content) const
{
    QFile file(path(name));
    ASSERT_TRUE(file.open(QIODevice::WriteOnly)) << name;
    ASSERT_EQ(file.write(content), content.size()) << name;
}

QByteArray JobFolder::bytesOf(const char *name) const
{
    QFile file(path(name));
    EXPECT_TRUE(file.open(QIODevice::ReadOnly)) << name;
    return file.readAll();
}

MarkedText::MarkedText(const QByteArray &marked)
{
    const qsizetype mark = marked.indexOf('@');
    EXPECT_GE(mark, 0) << marked.constData();
    const QString before = QString::fromUtf8(marked.first(mark));
    const qsizetype lineStart = before.lastIndexOf(u'\n') + 1;
    place = QStringLiteral("%1:%2").arg(before.count(u'\n') + 1).arg(before.sliced(lineStart).toUcs4().size() + 1);
    text = marked.first(mark) + marked.sliced(mark + 1);
}
