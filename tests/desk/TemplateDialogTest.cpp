#include "TemplateDialog.h"

#include "CommandLine.h"
#include "Profile.h"

#include <QComboBox>
#include <QDialogButtonBox>
#include <QLabel>
#include <QPushButton>
#include <QTest>

#include <gtest/gtest.h>

namespace
{

using kareport::TemplateDialog;
using kareport::TemplateJob;

QStringList itemsOf(const TemplateDialog &dialog, const char *name)
{
    QStringList items;
    for (const auto *box : dialog.findChildren<QComboBox *>()) {
        if (box->accessibleName() == QString::fromUtf8(name)) {
            for (int i = 0; i < box->count(); ++i) {
                items.append(box->itemText(i));
            }
        }
    }
    return items;
}

void choose(const TemplateDialog &dialog, const char *name, int index)
{
    for (auto *box : dialog.findChildren<QComboBox *>()) {
        if (box->accessibleName() == QString::fromUtf8(name)) {
            box->setCurrentIndex(index);
        }
    }
}

QPushButton *okButton(const TemplateDialog &dialog)
{
    return dialog.findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Ok);
}

class TemplateDialogs : public testing::Test
{
protected:
    void TearDown() override { kareport::setProfileStore(kareport::makeMemoryProfile()); }

    CommandLineFolder folder;
};

TEST_F(TemplateDialogs, ListsWhatAFileHolds)
{
    TemplateDialog dialog;
    EXPECT_FALSE(okButton(dialog)->isEnabled()) << "nothing is chosen yet";
    EXPECT_TRUE(dialog.findChild<QLabel *>(QStringLiteral("message"))->text().isEmpty()) << "and nothing is wrong yet";
    dialog.setTemplateFile(folder.path("t.xml"));
    EXPECT_EQ(itemsOf(dialog, "Template"),
              QStringList({QStringLiteral("CONTROL – Control points"), QStringLiteral("SITE – Site ä")}));
    EXPECT_EQ(itemsOf(dialog, "Table or block"), QStringList({QStringLiteral("Points"), QStringLiteral("Point")}));
    dialog.setData(folder.path("points.csv"));
    EXPECT_TRUE(okButton(dialog)->isEnabled());
    TemplateJob job = dialog.job();
    EXPECT_EQ(job.templateFile, folder.path("t.xml"));
    EXPECT_EQ(job.templateName, QStringLiteral("CONTROL"));
    EXPECT_EQ(job.table, QStringLiteral("Points"));
    EXPECT_TRUE(job.block.isEmpty());
    EXPECT_EQ(job.data, folder.path("points.csv"));
    choose(dialog, "Table or block", 1);
    job = dialog.job();
    EXPECT_EQ(job.block, QStringLiteral("Point")) << "the blocks stand behind the tables";
    EXPECT_TRUE(job.table.isEmpty());
}

TEST_F(TemplateDialogs, SaysWhatIsWrong)
{
    struct Row
    {
        const char *file;
        int templateIndex;
        const char *data;
        const char *says;
        const char *reason;
    };
    folder.put("none.xml", "<x>");
    folder.put("empty.xml", "");
    for (const Row &row :
         {Row{"t.xml", 0, "gone.csv", "no data file", "data that is not there"},
          Row{"t.xml", 1, "points.csv", "neither a table nor a block", "a template without outputs"},
          Row{"gone.xml", 0, "points.csv", "cannot be read", "a file that is not there"},
          Row{"none.xml", 0, "points.csv", "ReportTemplate", "no template in the file"},
          Row{"empty.xml", 0, "points.csv", "empty", "an empty file"}, Row{".", 0, "points.csv", "folder", "a folder"}})
    {
        TemplateDialog dialog;
        dialog.setTemplateFile(folder.path(row.file));
        dialog.setData(folder.path(row.data));
        choose(dialog, "Template", row.templateIndex);
        const QString text = dialog.findChild<QLabel *>(QStringLiteral("message"))->text();
        EXPECT_TRUE(text.contains(QString::fromUtf8(row.says))) << row.reason << ": " << text.toStdString();
        EXPECT_TRUE(text.isEmpty() || text[0].isUpper()) << row.reason;
        EXPECT_FALSE(okButton(dialog)->isEnabled()) << row.reason;
    }
}

TEST_F(TemplateDialogs, TheLastChoiceIsThereAgain)
{
    {
        TemplateDialog dialog;
        dialog.setTemplateFile(folder.path("t.xml"));
        dialog.setData(folder.path("points.csv"));
        choose(dialog, "Table or block", 1);
        dialog.accept();
    }
    {
        TemplateDialog dialog;
        EXPECT_EQ(dialog.job().block, QStringLiteral("Point"));
        EXPECT_EQ(dialog.job().data, folder.path("points.csv"));
        EXPECT_TRUE(okButton(dialog)->isEnabled()) << "one key makes the report anew";
        dialog.setData(QString());
        dialog.reject();
    }
    EXPECT_EQ(TemplateDialog().job().data, folder.path("points.csv")) << "what was cancelled is not kept";
    QFile::remove(folder.path("t.xml"));
    const TemplateDialog gone;
    EXPECT_FALSE(okButton(gone)->isEnabled());
}

} // namespace
