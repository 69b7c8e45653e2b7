#include "PageSetupDialog.h"
#include "PrintQuestions.h"

#include "PrintDialogs.h"
#include "PrintQt.h"

#include <QComboBox>
#include <QDialogButtonBox>
#include <QDoubleSpinBox>
#include <QLabel>
#include <QPushButton>
#include <QRadioButton>
#include <QTest>
#include <QTimer>

#include <gtest/gtest.h>

#include <memory>

namespace
{

using kareport::PageSetup;
using kareport::PageSetupDialog;

PageSetup usualSetup()
{
    PageSetup setup;
    setup.margins = QMargins(1000, 1001, 1200, 2000);
    setup.asksForPages = true;
    setup.sheetsOf = [](const QString &printer) {
        using kareport::PageSheet;
        const PageSheet a4{QStringLiteral("A4"), QSize(595, 842), QSizeF(210, 297)};
        const PageSheet a3{QStringLiteral("A3"), QSize(842, 1191), QSizeF(297, 420)};
        const PageSheet a6{QStringLiteral("A6"), QSize(298, 420), QSizeF(105, 148)};
        return printer == QStringLiteral("Large") ? std::vector{a3, a4} : std::vector{a4, a6};
    };
    return setup;
}

QDoubleSpinBox *field(const PageSetupDialog &dialog, const char *name)
{
    for (auto *box : dialog.findChildren<QDoubleSpinBox *>()) {
        if (box->accessibleName() == QString::fromUtf8(name)) {
            return box;
        }
    }
    return nullptr;
}

QRadioButton *choice(const PageSetupDialog &dialog, const char *text)
{
    for (auto *button : dialog.findChildren<QRadioButton *>()) {
        if (button->text() == QString::fromUtf8(text)) {
            return button;
        }
    }
    return nullptr;
}

void press(PageSetupDialog &dialog, QDialogButtonBox::StandardButton button)
{
    QTest::mouseClick(dialog.findChild<QDialogButtonBox *>()->button(button), Qt::LeftButton);
}

QComboBox *paperOf(const PageSetupDialog &dialog)
{
    for (auto *box : dialog.findChildren<QComboBox *>()) {
        if (box->accessibleName() == QStringLiteral("Paper")) {
            return box;
        }
    }
    return nullptr;
}

TEST(PageSetupDialog, ThePaperIsOneThatThePrinterTakes)
{
    PageSetup setup = usualSetup();
    setup.printer = QStringLiteral("Small");
    setup.printers = QStringList({QStringLiteral("Small"), QStringLiteral("Large")});
    PageSetupDialog dialog(setup);
    EXPECT_EQ(paperOf(dialog)->currentText(), QStringLiteral("A4"));
    EXPECT_TRUE(dialog.setup().sheet.isEmpty()) << "the printer's own stays whichever that is";
    paperOf(dialog)->setCurrentText(QStringLiteral("A6"));
    EXPECT_EQ(dialog.setup().sheet, QSize(298, 420));
    setup = dialog.setup();
    EXPECT_EQ(paperOf(PageSetupDialog(setup))->currentText(), QStringLiteral("A6")) << "there again";
    dialog.findChild<QComboBox *>()->setCurrentText(QStringLiteral("Large"));
    EXPECT_EQ(paperOf(dialog)->currentText(), QStringLiteral("A3")) << "it has no A6: its own takes the place";
    EXPECT_TRUE(dialog.setup().sheet.isEmpty());

    PageSetup unknown;
    EXPECT_TRUE(PageSetupDialog(unknown).setup().sheet.isEmpty()) << "nothing is known of the printer";
}

TEST(PageSetupDialog, ShowsMillimetresAndKeepsHundredths)
{
    PageSetupDialog dialog(usualSetup());
    EXPECT_EQ(field(dialog, "Left margin")->value(), 10.0);
    EXPECT_EQ(field(dialog, "Top margin")->value(), 10.01);
    EXPECT_EQ(field(dialog, "Right margin")->value(), 12.0);
    EXPECT_EQ(field(dialog, "Bottom margin")->value(), 20.0);
    EXPECT_EQ(field(dialog, "Top margin")->cleanText(), QLocale().toString(10.01, 'f', 2)) << "two decimals, no inch";
    EXPECT_EQ(dialog.setup().margins, usualSetup().margins) << "nothing is lost by looking";
    for (int hundredths = 0; hundredths < 3000; ++hundredths) {
        field(dialog, "Left margin")->setValue(hundredths / 100.0);
        ASSERT_EQ(dialog.setup().margins.left(), hundredths);
    }
}

TEST(PageSetupDialog, ShowsInchesWhereTheyAreWantedAndKeepsWhatWasNotChanged)
{
    PageSetup setup = usualSetup();
    setup.inInches = true;
    const PageSetupDialog dialog(setup);
    EXPECT_EQ(field(dialog, "Left margin")->suffix(), QStringLiteral(" in"));
    EXPECT_DOUBLE_EQ(field(dialog, "Left margin")->value(), 0.394);
    EXPECT_EQ(dialog.setup().margins, setup.margins) << "10 mm are not 0.394 in, and stay 10 mm";
    field(dialog, "Left margin")->setValue(0.5);
    EXPECT_EQ(dialog.setup().margins, QMargins(1270, 1001, 1200, 2000));
    bool isSaid = false;
    for (const auto *label : dialog.findChildren<QLabel *>()) {
        isSaid = isSaid || label->text() == QStringLiteral("Paper: 8.27 x 11.69 in");
    }
    EXPECT_TRUE(isSaid);
}

TEST(PageSetupDialog, TheUnitCanBeChangedMeanwhile)
{
    kareport::PageSetupForm form(usualSetup());
    const auto left = [&form] { return form.findChildren<QDoubleSpinBox *>().front(); };
    left()->setValue(25.4);
    form.showInInches(true);
    EXPECT_DOUBLE_EQ(left()->value(), 1);
    EXPECT_EQ(form.setup().margins, QMargins(2540, 1001, 1200, 2000));
    form.showInInches(false);
    EXPECT_DOUBLE_EQ(left()->value(), 25.4);
    EXPECT_EQ(form.setup().margins, QMargins(2540, 1001, 1200, 2000)) << "there and back changes nothing";
    EXPECT_FALSE(form.setup().inInches);
}

TEST(PageSetupDialog, IsWorkedWithTheKeyboardAlone)
{
    PageSetupDialog dialog(usualSetup());
    dialog.show();
    ASSERT_TRUE(QTest::qWaitForWindowExposed(&dialog));
    EXPECT_EQ(dialog.focusWidget(), field(dialog, "Left margin"));
    const QString point = QLocale().decimalPoint();
    QTest::keyClicks(dialog.focusWidget(), QStringLiteral("15") + point + QStringLiteral("25"));
    for (const char *next : {"Right margin", "Top margin", "Bottom margin"}) {
        QTest::keyClick(dialog.focusWidget(), Qt::Key_Tab);
        EXPECT_EQ(dialog.focusWidget(), field(dialog, next)) << next;
    }
    QTest::keyClicks(dialog.focusWidget(), QStringLiteral("30"));
    choice(dialog, "L&andscape")->setFocus();
    QTest::keyClick(dialog.focusWidget(), Qt::Key_Space);
    QTest::keyClick(&dialog, Qt::Key_Return);
    EXPECT_EQ(dialog.result(), QDialog::Accepted);
    EXPECT_EQ(dialog.setup().margins, QMargins(1525, 1001, 1200, 3000));
    EXPECT_FALSE(dialog.setup().portrait);
}

TEST(PageSetupDialog, EveryFieldIsReachedByALetterOfItsLabel)
{
    PageSetup setup = usualSetup();
    setup.printers = {QStringLiteral("Small"), QStringLiteral("Large")};
    const PageSetupDialog dialog(setup);
    QString letters;
    int buddies = 0;
    for (const auto *label : dialog.findChildren<QLabel *>()) {
        const qsizetype mark = label->text().indexOf(u'&');
        if (mark >= 0) {
            letters += label->text()[mark + 1].toUpper();
            buddies += label->buddy() != nullptr ? 1 : 0;
        }
    }
    for (const auto *button : dialog.findChildren<QRadioButton *>()) {
        letters += button->text()[button->text().indexOf(u'&') + 1].toUpper();
    }
    EXPECT_EQ(buddies, 6);
    EXPECT_EQ(letters.size(), 10);
    for (const QChar letter : letters) {
        EXPECT_EQ(letters.count(letter), 1) << QString(letter).toStdString();
    }
}

TEST(PageSetupDialog, ShowsWhichPagesApplyAndSwitchesThem)
{
    struct Row
    {
        std::optional<int> lines;
        bool keeps;
        const char *given; ///< what the choice says
        bool canKeep;
        bool isKept;
        const char *reason;
    };
    const Row rows[] = {
        {std::nullopt, false, "As the report was &made", false, false,
         "a measured page: there is nothing to go back to"},
        {std::nullopt, true, "As the report was &made", false, false, "nor when a host asks for it"},
        {60, true, "As the report was &made (60 lines)", true, true, "the page of a job"},
        {60, false, "As the report was &made (60 lines)", true, false, "a job's page that was switched off"},
        {1, true, "As the report was &made (1 line)", true, true, "a line is one line"},
    };
    for (const Row &row : rows) {
        PageSetup setup = usualSetup();
        setup.givenLines = row.lines;
        setup.keepsGivenPages = row.keeps;
        PageSetupDialog dialog(setup);
        dialog.show();
        QRadioButton *given = choice(dialog, row.given);
        QRadioButton *measured = choice(dialog, "As the &sheet takes them");
        ASSERT_NE(given, nullptr) << row.reason;
        ASSERT_NE(measured, nullptr) << row.reason;
        EXPECT_EQ(given->accessibleName(), QStringLiteral("Pages: ") + QString::fromUtf8(row.given).remove(u'&'));
        EXPECT_FALSE(given->accessibleDescription().isEmpty()) << row.reason;
        EXPECT_EQ(given->isChecked(), row.isKept) << row.reason;
        EXPECT_EQ(measured->isChecked(), !row.isKept) << row.reason;
        EXPECT_EQ(dialog.setup().keepsGivenPages, row.isKept) << row.reason;
        EXPECT_EQ(dialog.setup().givenLines, row.lines) << row.reason;

        QTest::mouseClick(row.isKept ? measured : given, Qt::LeftButton);
        EXPECT_EQ(dialog.setup().keepsGivenPages, row.canKeep && !row.isKept) << "clicked; " << row.reason;
        QTest::mouseClick(row.isKept ? given : measured, Qt::LeftButton);
        EXPECT_EQ(dialog.setup().keepsGivenPages, row.isKept) << "and back; " << row.reason;
        EXPECT_TRUE(choice(dialog, "P&ortrait")->isChecked()) << "the orientation is another choice; " << row.reason;
    }
}

TEST(PageSetupDialog, WithoutAReportItsPagesAreNotAskedFor)
{
    PageSetup setup = usualSetup();
    setup.asksForPages = false;
    PageSetupDialog dialog(setup);
    dialog.show();
    EXPECT_FALSE(choice(dialog, "As the &sheet takes them")->isVisible());
}

TEST(PageSetupDialog, PagesAreSwitchedWithTheKeyboard)
{
    PageSetup setup = usualSetup();
    setup.givenLines = 60;
    setup.keepsGivenPages = true;
    PageSetupDialog dialog(setup);
    dialog.show();
    dialog.activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(&dialog));
    // A button that is pressed by its letter shows it for a moment.
    QTest::keyClick(&dialog, Qt::Key_S, Qt::AltModifier);
    EXPECT_TRUE(QTest::qWaitFor([&] { return !dialog.setup().keepsGivenPages; }));
    QTest::keyClick(&dialog, Qt::Key_M, Qt::AltModifier);
    EXPECT_TRUE(QTest::qWaitFor([&] { return dialog.setup().keepsGivenPages; }));
    field(dialog, "Bottom margin")->setFocus();
    QTest::keyClick(dialog.focusWidget(), Qt::Key_Tab);
    EXPECT_EQ(dialog.focusWidget(), choice(dialog, "As the report was &made (60 lines)")) << "below the margins";
    QTest::keyClick(dialog.focusWidget(), Qt::Key_Down);
    EXPECT_FALSE(dialog.setup().keepsGivenPages);
}

TEST(PageSetupDialog, RefusesMarginsThatLeaveNoRoomAndSaysSo)
{
    struct Row
    {
        QMargins margins;
        bool portrait;
        bool taken;
        const char *reason;
    };
    constexpr Row rows[] = {
        {{1000, 1000, 1200, 2000}, true, true, "the usual"},
        {{0, 0, 0, 0}, true, true, "none"},
        {{10000, 0, 10000, 0}, true, true, "10 mm are left"},
        {{10000, 0, 10010, 0}, true, false, "a tenth of a millimetre less"},
        {{15000, 0, 10000, 0}, true, false, "wider than the paper"},
        {{15000, 0, 10000, 0}, false, true, "but not than the paper that lies"},
        {{0, 15000, 0, 14000}, true, false, "7 mm high"},
        {{0, 10000, 0, 10100}, false, false, "the paper that lies is 210 mm high"},
    };
    for (const Row &row : rows) {
        PageSetup setup = usualSetup();
        setup.margins = row.margins;
        setup.portrait = row.portrait;
        PageSetupDialog dialog(setup);
        dialog.show();
        const auto *warning = dialog.findChild<QLabel *>(QStringLiteral("warning"));
        EXPECT_FALSE(warning->isVisible()) << row.reason;
        press(dialog, QDialogButtonBox::Ok);
        EXPECT_EQ(dialog.result() == QDialog::Accepted, row.taken) << row.reason;
        EXPECT_EQ(dialog.isVisible(), !row.taken) << row.reason;
        if (!row.taken) {
            EXPECT_TRUE(warning->isVisible()) << row.reason;
            EXPECT_TRUE(warning->text().contains(QStringLiteral("no room"))) << row.reason;
            for (const char *name : {"Left margin", "Top margin", "Right margin", "Bottom margin"}) {
                field(dialog, name)->setValue(10);
            }
            EXPECT_FALSE(warning->isVisible()) << "taken back when it is no longer true; " << row.reason;
            press(dialog, QDialogButtonBox::Ok);
            EXPECT_EQ(dialog.result(), QDialog::Accepted) << row.reason;
        }
    }
}

TEST(PageSetupDialog, OffersPrintersWhereThereAreSeveral)
{
    struct Row
    {
        QStringList printers;
        bool shown;
        const char *reason;
    };
    const QString small = QStringLiteral("Small");
    const QString large = QStringLiteral("Large");
    for (const Row &row : {Row{{}, false, "none is installed"}, Row{{small}, false, "there is nothing to choose"},
                           Row{{small, large}, true, "two"}})
    {
        PageSetup setup = usualSetup();
        setup.printer = row.printers.value(0);
        setup.printers = row.printers;
        PageSetupDialog dialog(setup);
        dialog.show();
        EXPECT_EQ(dialog.findChild<QComboBox *>()->isVisible(), row.shown) << row.reason;
        EXPECT_EQ(dialog.setup().printer, row.printers.value(0)) << row.reason;
    }

    PageSetup setup = usualSetup();
    setup.printers = {small, large};
    setup.printer = small;
    setup.margins = QMargins(15000, 0, 10000, 0);
    PageSetupDialog dialog(setup);
    dialog.show();
    press(dialog, QDialogButtonBox::Ok);
    EXPECT_TRUE(dialog.isVisible()) << "no room on the sheet of the small one";
    dialog.findChild<QComboBox *>()->setCurrentText(large);
    press(dialog, QDialogButtonBox::Ok);
    EXPECT_EQ(dialog.result(), QDialog::Accepted);
    EXPECT_EQ(dialog.setup().printer, large);
}

TEST(PageSetupDialog, CancelLeavesTheSetupThatWasGiven)
{
    kareport::setPrintDialogs({});
    PageSetup setup = usualSetup();
    QTimer::singleShot(0, qApp, [] {
        auto *dialog = dynamic_cast<PageSetupDialog *>(QApplication::activeModalWidget());
        ASSERT_NE(dialog, nullptr);
        field(*dialog, "Left margin")->setValue(33);
        QTest::keyClick(dialog, Qt::Key_Escape);
    });
    EXPECT_FALSE(kareport::askPageSetup(setup, nullptr));
    EXPECT_EQ(setup.margins, usualSetup().margins);
}

TEST(PageSetupDialog, AMarginThatTheFieldCannotShowStaysUntilItIsChanged)
{
    PageSetup setup = usualSetup();
    setup.margins = QMargins(-500, 300000, 1200, 200001); // hundredths: the fields show 0 to 2000 mm
    PageSetupDialog dialog(setup);
    EXPECT_EQ(field(dialog, "Left margin")->value(), 0.0);
    EXPECT_EQ(field(dialog, "Top margin")->value(), 2000.0);
    EXPECT_EQ(dialog.setup().margins, setup.margins) << "they were not touched";
    field(dialog, "Top margin")->setValue(12.34);
    EXPECT_EQ(dialog.setup().margins, QMargins(-500, 1234, 1200, 200001)) << "but for one";
}

} // namespace
