#include "PrivateFile.h"

#include "FrameFixture.h"
#include "PrintQt.h"

#include <QDir>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace
{

constexpr QFile::Permissions others =
    QFile::ReadGroup | QFile::WriteGroup | QFile::ExeGroup | QFile::ReadOther | QFile::WriteOther | QFile::ExeOther;

class PrivateFile : public testing::Test
{
protected:
    QString at(const char *name) const { return folder_.filePath(QString::fromUtf8(name)); }

    QTemporaryDir folder_;
};

TEST_F(PrivateFile, IsNewAndTheUsersOwn)
{
    QFile file(at("a.rep"));
    ASSERT_TRUE(kareport::openPrivateFile(file));
    EXPECT_EQ(file.write("text"), 4);
    file.close();
    EXPECT_EQ(contentOf(at("a.rep")), "text");
    EXPECT_EQ(QFile::permissions(at("a.rep")) & others, QFile::Permissions()) << "no other user reads it";
    EXPECT_TRUE(QFile::permissions(at("a.rep")) & QFile::ReadOwner);
    EXPECT_TRUE(QFile::permissions(at("a.rep")) & QFile::WriteOwner);
}

TEST_F(PrivateFile, WhatHasTheNameIsNotOpened)
{
    putFile(at("file"), "content");
    ASSERT_TRUE(QFile::link(at("file"), at("link")));
    ASSERT_TRUE(QFile::link(at("nowhere"), at("loose link")));
    ASSERT_TRUE(QDir(folder_.path()).mkdir(QStringLiteral("folder")));
    for (const char *name : {"file", "link", "loose link", "folder"}) {
        QFile file(at(name));
        EXPECT_FALSE(kareport::openPrivateFile(file)) << name;
        EXPECT_TRUE(kareport::isNameTaken(at(name))) << name;
    }
    EXPECT_EQ(contentOf(at("file")), "content");
    EXPECT_FALSE(QFile::exists(at("nowhere"))) << "the link was not followed";

    QFile file(at("missing/a.rep"));
    EXPECT_FALSE(kareport::openPrivateFile(file)) << "no folder for it";
    EXPECT_FALSE(kareport::isNameTaken(at("missing/a.rep")));
    EXPECT_FALSE(kareport::isNameTaken(at("a.rep")));
}

TEST_F(PrivateFile, TakesThePlaceOfAFileOrALink)
{
    putFile(at("file"), "content");
    ASSERT_TRUE(QFile::setPermissions(at("file"), QFile::ReadOwner | QFile::WriteOwner | others));
    putFile(at("target"), "target");
    ASSERT_TRUE(QFile::link(at("target"), at("link")));
    ASSERT_TRUE(QFile::link(at("nowhere"), at("loose link")));
    for (const char *name : {"file", "link", "loose link", "new"}) {
        EXPECT_TRUE(kareport::makePrivateFile(at(name))) << name;
        EXPECT_EQ(contentOf(at(name)), "") << name;
        EXPECT_FALSE(QFileInfo(at(name)).isSymLink()) << name;
        EXPECT_EQ(QFile::permissions(at(name)) & others, QFile::Permissions()) << name;
    }
    EXPECT_EQ(contentOf(at("target")), "target") << "what a link points to stays";
    EXPECT_FALSE(QFile::exists(at("nowhere")));
}

TEST_F(PrivateFile, IsNotMadeWhereItCannotBe)
{
    ASSERT_TRUE(QDir(folder_.path()).mkdir(QStringLiteral("folder")));
    EXPECT_FALSE(kareport::makePrivateFile(at("folder")));
    EXPECT_TRUE(QFileInfo(at("folder")).isDir()) << "a folder stays, even an empty one";
    EXPECT_FALSE(kareport::makePrivateFile(at("missing/a.rep")));
    EXPECT_FALSE(kareport::makePrivateFile(QString()));
}

} // namespace
