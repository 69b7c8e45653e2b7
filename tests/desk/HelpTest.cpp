#include "HelpWindow.h"

#include "AboutDialog.h"
#include "CommandList.h"
#include "DeskCommandIds.h"
#include "DeskFixture.h"
#include "DeskPreferences.h"
#include "FindBar.h"
#include "GuidePages.h"
#include "PreferencesDialog.h"
#include "ReportViewWidget.h"
#include "StartPage.h"
#include "TemplateDialog.h"
#include "UReportView.h"

#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QRegularExpression>
#include <QScrollBar>
#include <QTextBlock>

#include <gtest/gtest.h>

#include <set>

namespace
{

using namespace kareport;

/// The first block that is seen in a browser.
QString headingAtTop(const GuideBrowser &browser)
{
    QTextBlock block = browser.cursorForPosition(QPoint(20, 6)).block();
    return block.text();
}

QString guideText(const QString &page)
{
    QFile file(guideFile(page, QStringLiteral("en")));
    return file.open(QIODevice::ReadOnly) ? QString::fromUtf8(file.readAll()) : QString();
}

/// The headings of a page, as links name them.
std::set<QString> anchorsOf(const QString &page)
{
    QTextDocument document;
    document.setMarkdown(guideText(page));
    nameHeadings(document);
    std::set<QString> anchors;
    for (QTextBlock block = document.begin(); block.isValid(); block = block.next()) {
        for (auto piece = block.begin(); !piece.atEnd(); ++piece) {
            for (const QString &name : piece.fragment().charFormat().anchorNames()) {
                anchors.insert(name);
            }
        }
    }
    return anchors;
}

TEST(Guide, EveryLinkAndPictureOfItsPagesIsThere)
{
    static const QRegularExpression link(QStringLiteral("\\]\\(([^)#\\s]*)(#[^)\\s]*)?\\)"));
    for (const GuidePage &page : guidePages()) {
        const QString text = guideText(page.name);
        EXPECT_FALSE(text.isEmpty()) << page.name.toStdString();
        for (const QRegularExpressionMatch &match : link.globalMatch(text)) {
            const QString target = match.captured(1);
            if (target.startsWith(u"http")) {
                continue;
            }
            // Pages are found by their names alone: among the sources they are in several folders.
            const QString file = target.endsWith(u".md") ? QFileInfo(target).fileName() : target;
            const QString named = target.isEmpty() ? page.name : file;
            EXPECT_FALSE(guideFile(named, QStringLiteral("en")).isEmpty())
                << page.name.toStdString() << ": " << match.captured().toStdString();
            if (!match.captured(2).isEmpty()) {
                EXPECT_EQ(anchorsOf(named).count(match.captured(2).sliced(1)), 1U)
                    << page.name.toStdString() << ": " << match.captured().toStdString();
            }
        }
    }
}

TEST(Guide, APageIsEnglishWhereItIsNotTranslated)
{
    EXPECT_EQ(guideFile(QStringLiteral("guide-desk.md"), QStringLiteral("ja_JP")),
              QStringLiteral(":/kareport/guide/en/guide-desk.md"));
    EXPECT_EQ(guideFile(QStringLiteral("no-such.md"), QStringLiteral("en")), QString());
    EXPECT_EQ(anchorOf(QStringLiteral("Reports from a `.xml` template, §2")),
              QStringLiteral("reports-from-a-xml-template-2"));
}

TEST(Guide, OpensAtThePlaceThatFits)
{
    Desk desk;
    desk.answer = MessageAnswer::No;
    const auto *start = dynamic_cast<const StartPage *>(desk.frame->centralWidget());
    const PreferencesDialog preferences(loadPreferences());
    const TemplateDialog fromTemplate;
    const CommandList commands({});
    ASSERT_TRUE(desk.frame->OnCommand(fileNewCommand));
    auto *view = dynamic_cast<UReportView *>(desk.frame->GetActiveView());
    ASSERT_NE(view, nullptr);
    auto &shown = *static_cast<ReportViewWidget *>(view->GetWidget());
    const QWidget *widgets[] = {&start->recentList(),
                                preferences.findChild<QLineEdit *>(),
                                &fromTemplate,
                                &commands,
                                &view->GetEdit(),
                                &shown.findBar().field(),
                                nullptr};
    for (const QWidget *widget : widgets) {
        const QString place = guidePlaceFor(widget);
        const QString page = place.section(u'#', 0, 0);
        EXPECT_FALSE(guideFile(page, QStringLiteral("en")).isEmpty()) << place.toStdString();
        if (widget != nullptr) {
            EXPECT_EQ(anchorsOf(page).count(place.section(u'#', 1)), 1U) << place.toStdString();
        }
    }
}

TEST(HelpWindow, ShowsTheHeadingFollowsLinksAndGoesBack)
{
    Desk desk;
    HelpWindow help(&*desk.frame);
    help.resize(800, 500);
    help.show();
    help.showPlace(QStringLiteral("guide-desk.md#printing"));
    QCoreApplication::processEvents();
    EXPECT_EQ(headingAtTop(help.browser()), QStringLiteral("Printing"));
    EXPECT_EQ(help.pages().currentRow(), 0);
    const int before = help.browser().verticalScrollBar()->value();
    EXPECT_GT(before, 0);
    help.browser().setSource(QUrl(QStringLiteral("job-file.md#output"))); // as a click on a link does
    QCoreApplication::processEvents();
    EXPECT_EQ(help.browser().source().fileName(), QStringLiteral("job-file.md"));
    EXPECT_EQ(help.pages().currentItem()->text(), QStringLiteral("The job file"));
    QTest::keyClick(&help.browser(), Qt::Key_Left, Qt::AltModifier);
    ASSERT_TRUE(
        QTest::qWaitFor([&help] { return help.browser().source().fileName() == QStringLiteral("guide-desk.md"); }));
    QCoreApplication::processEvents();
    EXPECT_EQ(help.browser().verticalScrollBar()->value(), before) << "where the reader was";
    QTest::keyClick(&help.browser(), Qt::Key_Right, Qt::AltModifier);
    ASSERT_TRUE(
        QTest::qWaitFor([&help] { return help.browser().source().fileName() == QStringLiteral("job-file.md"); }));
    help.browser().setSource(QUrl(QStringLiteral("no-such-page.md")));
    EXPECT_EQ(help.browser().source().fileName(), QStringLiteral("job-file.md")) << "what is not there changes nothing";
}

TEST(HelpWindow, FindsATextOnItsPage)
{
    Desk desk;
    HelpWindow help(&*desk.frame);
    help.show();
    help.showPlace(QStringLiteral("guide-desk.md"));
    QTest::keyClicks(&help.field(), QStringLiteral("rich text"));
    EXPECT_EQ(help.browser().textCursor().selectedText().toLower(), QStringLiteral("rich text"));
    const int first = help.browser().textCursor().position();
    QTest::keyClick(&help.field(), Qt::Key_Return);
    EXPECT_GT(help.browser().textCursor().position(), first);
    QTest::keyClick(&help.field(), Qt::Key_Return, Qt::ShiftModifier);
    EXPECT_EQ(help.browser().textCursor().position(), first);
    help.field().setText(QStringLiteral("no such words anywhere"));
    QStringList texts;
    for (const QLabel *label : help.findChildren<QLabel *>()) {
        texts.append(label->text());
    }
    EXPECT_TRUE(texts.contains(QStringLiteral("Not on this page")));
}

TEST(HelpWindow, OpensByF1InTheMainWindowAndInDialogs)
{
    Desk desk;
    desk.frame->activateWindow();
    ASSERT_TRUE(QTest::qWaitFor([] { return QApplication::focusWidget() != nullptr; }));
    EXPECT_NE(dynamic_cast<EntryList *>(QApplication::focusWidget()), nullptr) << "the start page has the keyboard";
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_F1);
    const auto helpOf = [](const QWidget &window) {
        const auto children = window.children();
        const auto found = std::find_if(children.begin(), children.end(), [](const QObject *child) {
            return dynamic_cast<const HelpWindow *>(child) != nullptr;
        });
        return found != children.end() ? dynamic_cast<HelpWindow *>(*found) : nullptr;
    };
    const HelpWindow *help = helpOf(*desk.frame);
    ASSERT_NE(help, nullptr);
    EXPECT_TRUE(help->isVisible());
    EXPECT_EQ(help->browser().source().fragment(), QStringLiteral("the-start-page"));
    PreferencesDialog dialog(loadPreferences(), &*desk.frame);
    dialog.setModal(true);
    dialog.show();
    QTest::keyClick(dialog.findChild<QLineEdit *>(), Qt::Key_F1);
    const HelpWindow *ofDialog = helpOf(dialog);
    ASSERT_NE(ofDialog, nullptr) << "which the dialog does not keep the mouse from";
    EXPECT_EQ(ofDialog->browser().source().fragment(), QStringLiteral("preferences"));
}

TEST(About, SaysVersionBuildAndLicences)
{
    Desk desk;
    AboutDialog about(&*desk.frame);
    QStringList texts;
    for (const QLabel *label : about.findChildren<QLabel *>()) {
        texts.append(label->text());
    }
    const QString all = texts.join(u'\n');
    EXPECT_TRUE(all.contains(QStringLiteral("Version 0."))) << all.toStdString();
    EXPECT_TRUE(all.contains(QString::fromLatin1(qVersion())));
    EXPECT_TRUE(all.contains(QStringLiteral("LGPL")));
    EXPECT_FALSE(all.contains(QStringLiteral("%1")));
    EXPECT_TRUE(guideText(QStringLiteral("LICENSES.md")).contains(QStringLiteral("libharu")));
}

} // namespace
