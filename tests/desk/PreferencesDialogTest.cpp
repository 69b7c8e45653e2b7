#include "PreferencesDialog.h"

#include "Profile.h"

#include <QCheckBox>
#include <QComboBox>
#include <QDialogButtonBox>
#include <QDoubleSpinBox>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QSpinBox>
#include <QTabWidget>
#include <QTemporaryDir>
#include <QTest>

#include <gtest/gtest.h>

namespace
{

using namespace kareport;

/// The control of a dialog with an accessible name.
template <typename Control>
Control *control(const QWidget &dialog, const char *name)
{
    for (auto *found : dialog.findChildren<Control *>()) {
        if (found->accessibleName() == QString::fromUtf8(name)) {
            return found;
        }
    }
    ADD_FAILURE() << "there is no " << name;
    return nullptr;
}

DeskPreferences unusualPreferences()
{
    DeskPreferences preferences;
    preferences.settings.lengthUnit = LengthUnit::UsSurveyFoot;
    preferences.settings.areaUnit = AreaUnit::Acre;
    preferences.settings.angleUnit = AngleUnit::Gon;
    preferences.settings.lengthDecimals = 2;
    preferences.settings.stationDecimals = 4;
    preferences.settings.numberDecimals = 5;
    preferences.settings.stationFormat = UJobSettings::StationFormat::HundredsPlus;
    preferences.settings.northEastOrder = 0;
    preferences.settings.bearingUnit = 1;
    preferences.settings.bearingStyle = 0;
    preferences.settings.bearingDecimals = 6;
    preferences.settings.bearingPadding = 0;
    preferences.settings.bearingReference = 1;
    preferences.settings.angleMarks = {'d', '\0', '\xBB'};
    preferences.fontSize = 11;
    preferences.margins = QMargins(501, 602, 703, 804);
    preferences.portrait = false;
    preferences.paper = QSize(842, 1191); // A3
    preferences.inInches = true;
    preferences.usesEditor = false;
    preferences.editor = QStringLiteral("/opt/no such/editor");
    preferences.language = QStringLiteral("ja");
    return preferences;
}

void expectSame(const DeskPreferences &a, const DeskPreferences &b)
{
    savePreferences(a);
    const QString first = GetProfileString(QString(), QStringLiteral("Job Settings"));
    savePreferences(b);
    EXPECT_EQ(GetProfileString(QString(), QStringLiteral("Job Settings")), first);
    EXPECT_EQ(a.fontSize, b.fontSize);
    EXPECT_EQ(a.margins, b.margins);
    EXPECT_EQ(a.portrait, b.portrait);
    EXPECT_EQ(a.paper, b.paper);
    EXPECT_EQ(a.inInches, b.inInches);
    EXPECT_EQ(a.usesEditor, b.usesEditor);
    EXPECT_EQ(a.editor, b.editor);
    EXPECT_EQ(a.language, b.language);
}

class PreferencesDialogs : public testing::Test
{
protected:
    void TearDown() override { setProfileStore(makeMemoryProfile()); }
};

TEST_F(PreferencesDialogs, WhatIsNotTouchedStays)
{
    for (const DeskPreferences &preferences : {DeskPreferences(), unusualPreferences()}) {
        const PreferencesDialog dialog(preferences);
        expectSame(dialog.preferences(), preferences);
    }
}

TEST_F(PreferencesDialogs, PaperAndUnitOfMarginsAreChosen)
{
    DeskPreferences preferences;
    preferences.margins = QMargins(2540, 1000, 1000, 1000);
    PreferencesDialog dialog(preferences);
    const auto *left = control<QDoubleSpinBox>(dialog, "Left margin");
    EXPECT_EQ(left->text(), QStringLiteral("25.40 mm"));
    control<QComboBox>(dialog, "Unit of margins")->setCurrentIndex(1);
    EXPECT_EQ(left->text(), QStringLiteral("1.000 in"));
    auto *paper = control<QComboBox>(dialog, "Paper");
    EXPECT_EQ(paper->currentIndex(), 0) << "the country's";
    EXPECT_EQ(paper->count(), 5) << "and four that are always the same";
    paper->setCurrentText(QStringLiteral("A4"));
    EXPECT_EQ(dialog.preferences().paper, QSize(595, 842)) << "also where it is the country's";
    EXPECT_TRUE(dialog.preferences().inInches);
    EXPECT_EQ(dialog.preferences().margins, preferences.margins);
}

TEST_F(PreferencesDialogs, SamplesFollowTheChoices)
{
    PreferencesDialog dialog((DeskPreferences()));
    const auto sample = [&dialog] {
        for (const QLabel *label : dialog.findChildren<QLabel *>()) {
            if (label->text().startsWith(QStringLiteral("Length\n"))) {
                return label->text();
            }
        }
        return QString();
    };
    EXPECT_TRUE(sample().contains(QStringLiteral("1234.568 m"))) << sample().toStdString();
    EXPECT_TRUE(sample().contains(QStringLiteral("12+345.678")));
    EXPECT_TRUE(sample().contains(QStringLiteral("S 44°55'51\" E"))) << sample().toStdString();
    control<QSpinBox>(dialog, "Decimals of lengths")->setValue(1);
    control<QComboBox>(dialog, "Unit of lengths")->setCurrentIndex(3);
    control<QComboBox>(dialog, "Form of stations")->setCurrentIndex(1);
    control<QComboBox>(dialog, "Style of bearings")->setCurrentIndex(0);
    control<QLineEdit>(dialog, "Minute mark")->setText(QStringLiteral("m"));
    EXPECT_TRUE(sample().contains(QStringLiteral("4050.4 ft"))) << sample().toStdString();
    EXPECT_TRUE(sample().contains(QStringLiteral("405+"))) << "stations are lengths: " << sample().toStdString();
    EXPECT_TRUE(sample().contains(QStringLiteral("135°04m09\""))) << sample().toStdString();
}

TEST_F(PreferencesDialogs, MarksTakeOnlyWhatHasOneByte)
{
    struct Row
    {
        const char *typed;
        char mark;
        const char *reason;
    };
    for (const Row &row : {Row{"x", 'x', "a letter"}, Row{"\xC2\xB0", '\xB0', "a Latin-1 sign"},
                           Row{"\xE2\x88\x9E", '\0', "infinity has no byte: nothing is typed"},
                           Row{"xy", 'x', "the second character is too many"}})
    {
        PreferencesDialog dialog((DeskPreferences()));
        auto *field = control<QLineEdit>(dialog, "Degree mark");
        field->clear();
        for (const QChar character : QString::fromUtf8(row.typed)) {
            QKeyEvent key(QEvent::KeyPress, 0, Qt::NoModifier, QString(character));
            QCoreApplication::sendEvent(field, &key);
        }
        EXPECT_EQ(dialog.preferences().settings.angleMarks[0], row.mark) << row.reason;
    }
}

TEST_F(PreferencesDialogs, IsNotLeftWithWhatCannotBeUsed)
{
    struct Row
    {
        bool hasRoom;
        bool usesEditor;
        const char *editor;
        int tab; ///< that is led to; -1 when the dialog is left
        const char *reason;
    };
    const QTemporaryDir folder;
    const QByteArray plain = QFile::encodeName(folder.filePath(QStringLiteral("plain")));
    QFile file(QString::fromUtf8(plain));
    ASSERT_TRUE(file.open(QIODevice::WriteOnly));
    file.close();
    for (const Row &row :
         {Row{true, false, "", -1, "no editor is wanted"},
          Row{true, false, "/gone", -1, "an editor that is not wanted need not be there"},
          Row{true, true, "/bin/sh", -1, "a program that is there"}, Row{true, true, "", 2, "none is named"},
          Row{true, true, "/gone", 2, "one that is not there"}, Row{true, true, "sh", 2, "not a full path"},
          Row{true, true, "/bin", 2, "a folder"}, Row{true, true, plain.constData(), 2, "a file that is not a program"},
          Row{false, true, "/bin/sh", 1, "margins as wide as the paper"}})
    {
        DeskPreferences preferences;
        preferences.margins = row.hasRoom ? QMargins(1000, 1000, 1000, 1000) : QMargins(20000, 0, 20000, 0);
        preferences.usesEditor = row.usesEditor;
        preferences.editor = QString::fromUtf8(row.editor);
        PreferencesDialog dialog(preferences);
        dialog.show();
        QTest::mouseClick(dialog.findChild<QDialogButtonBox *>()->button(QDialogButtonBox::Ok), Qt::LeftButton);
        EXPECT_EQ(dialog.isVisible(), row.tab >= 0) << row.reason;
        if (row.tab >= 0) {
            EXPECT_EQ(dialog.findChild<QTabWidget *>()->currentIndex(), row.tab) << row.reason;
        }
    }
}

TEST_F(PreferencesDialogs, SaysWhatAnEditorGets)
{
    struct Row
    {
        bool uses;
        const char *editor;
        const char *says;
    };
    for (const Row &row : {Row{false, "/bin/sh", "own window"}, Row{true, "/bin/sh", "plain text"},
                           Row{true, "/opt/WinWord", "rich text"}})
    {
        DeskPreferences preferences;
        preferences.usesEditor = row.uses;
        preferences.editor = QString::fromUtf8(row.editor);
        const PreferencesDialog dialog(preferences);
        EXPECT_TRUE(dialog.findChild<QLabel *>(QStringLiteral("kind"))->text().contains(QString::fromUtf8(row.says)))
            << row.editor;
    }
}

TEST_F(PreferencesDialogs, EveryControlHasANameToBeReadOut)
{
    const PreferencesDialog dialog((DeskPreferences()));
    for (const QWidget *widget : dialog.findChildren<QWidget *>()) {
        const bool isField = qobject_cast<const QComboBox *>(widget) != nullptr ||
                             qobject_cast<const QAbstractSpinBox *>(widget) != nullptr;
        if (isField) {
            EXPECT_FALSE(widget->accessibleName().isEmpty()) << widget->metaObject()->className();
        }
    }
}

} // namespace
