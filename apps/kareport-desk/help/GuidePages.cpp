#include "GuidePages.h"

#include "CommandList.h"
#include "DeskResources.h"
#include "FindBar.h"
#include "PageBar.h"
#include "PageSetupDialog.h"
#include "PreferencesDialog.h"
#include "ReportViewWidget.h"
#include "ReportWindowBody.h"
#include "StartPage.h"
#include "TemplateDialog.h"
#include "TemplateWindow.h"
#include "Xlate.h"

#include <QFile>
#include <QFileDialog>
#include <QTextBlock>
#include <QTextCursor>
#include <QTextDocument>

#include <utility>

namespace kareport
{

QList<GuidePage> guidePages()
{
    QList<GuidePage> pages;
    const auto add = [&pages](const char *name, const QString &title) {
        pages.append(GuidePage{QString::fromLatin1(name), title});
    };
    add("guide-desk.md", Xlate("Working with KaReport"));
    add("guide-templates.md", Xlate("Templates"));
    add("guide-data.md", Xlate("Data"));
    add("guide-landxml.md", Xlate("LandXML"));
    add("landxml-lists.md", Xlate("Lists of LandXML files"));
    add("guide-totals.md", Xlate("Groups and totals"));
    add("job-file.md", Xlate("The job file"));
    add("guide-command-line.md", Xlate("The command line"));
    add("guide-batch.md", Xlate("Many jobs"));
    add("README.md", Xlate("Examples"));
    add("LICENSES.md", Xlate("Licences"));
    return pages;
}

QString guideFile(const QString &page, const QString &language)
{
    initDeskResources();
    QStringList languages;
    languages.append(language);
    languages.append(language.section(u'_', 0, 0));
    languages.append(QStringLiteral("en"));
    for (const QString &tried : std::as_const(languages)) {
        QString file = QStringLiteral(":/kareport/guide/%1/%2").arg(tried, page);
        if (QFile::exists(file)) {
            return file;
        }
    }
    return {};
}

QString anchorOf(const QString &heading)
{
    QString anchor;
    for (const QChar character : heading.toLower()) {
        if (character.isLetterOrNumber() || character == u'-' || character == u'_') {
            anchor += character;
        } else if (character == u' ') {
            anchor += u'-';
        }
    }
    return anchor;
}

void nameHeadings(QTextDocument &document)
{
    for (QTextBlock block = document.begin(); block.isValid(); block = block.next()) {
        if (block.blockFormat().headingLevel() == 0 || block.length() < 2) {
            continue;
        }
        QTextCursor cursor(block);
        cursor.movePosition(QTextCursor::NextCharacter, QTextCursor::KeepAnchor);
        QTextCharFormat named;
        QStringList names;
        names.append(anchorOf(block.text()));
        named.setAnchor(true);
        named.setAnchorNames(names);
        cursor.mergeCharFormat(named);
    }
}

QString guidePlaceFor(const QWidget *widget)
{
    const auto desk = [](const char *heading) {
        return QStringLiteral("guide-desk.md#") + QString::fromLatin1(heading);
    };
    for (; widget != nullptr; widget = widget->parentWidget()) {
        if (const QString own = widget->property("guidePlace").toString(); !own.isEmpty()) {
            return own;
        }
        if (dynamic_cast<const StartPage *>(widget) != nullptr) {
            return desk("the-start-page");
        }
        if (dynamic_cast<const PreferencesDialog *>(widget) != nullptr) {
            return desk("preferences");
        }
        if (dynamic_cast<const TemplateDialog *>(widget) != nullptr) {
            return desk("reports-from-a-template");
        }
        if (dynamic_cast<const TemplateWindow *>(widget) != nullptr) {
            return QStringLiteral("guide-templates.md");
        }
        if (dynamic_cast<const PageSetupDialog *>(widget) != nullptr) {
            return desk("pages-on-paper");
        }
        if (dynamic_cast<const CommandList *>(widget) != nullptr) {
            return desk("all-commands");
        }
        if (dynamic_cast<const ReportWindowBody *>(widget) != nullptr) {
            return desk("the-report-window");
        }
        if (dynamic_cast<const FindBar *>(widget) != nullptr || dynamic_cast<const PageBar *>(widget) != nullptr ||
            dynamic_cast<const ReportViewWidget *>(widget) != nullptr)
        {
            return desk("reading-and-editing");
        }
        if (const auto *dialog = qobject_cast<const QFileDialog *>(widget)) {
            return dialog->acceptMode() == QFileDialog::AcceptSave ? desk("saving") : desk("what-can-be-opened");
        }
    }
    return QStringLiteral("guide-desk.md");
}

} // namespace kareport
