#pragma once

#include "CommandLine.h"
#include "DeskFixture.h"
#include "OpenTemplate.h"
#include "TemplatePage.h"
#include "TemplateTextEdit.h"
#include "TemplateWindow.h"

#include <QAction>
#include <QApplication>
#include <QMenu>
#include <QMenuBar>
#include <QTest>
#include <QTreeWidget>

#include <gtest/gtest.h>

/// The window of a template that is open; null where there is none.
inline kareport::TemplateWindow *windowOf(const QString &path)
{
    for (QWidget *widget : QApplication::topLevelWidgets()) {
        auto *window = dynamic_cast<kareport::TemplateWindow *>(widget);
        if (window != nullptr && window->path() == path) {
            return window;
        }
    }
    return nullptr;
}

/// A template with its job and data in a folder, open in its window.
class OpenedTemplate
{
public:
    explicit OpenedTemplate(const QByteArray &content = controlTemplates())
    {
        folder.put("t.xml", content);
        folder.put("other.json", R"({"template": {"file": "x.xml", "name": "CONTROL"}})");
        EXPECT_TRUE(kareport::openTemplateAt(folder.path("t.xml")));
        window = windowOf(folder.path("t.xml"));
        settle();
    }

    void settle() const
    {
        ASSERT_NE(window, nullptr);
        EXPECT_TRUE(QTest::qWaitFor([this] { return window->isUpToDate(); }, 20'000));
    }
    QString pages() const { return window->page().toPlainText(); }
    QString text() const { return window->edit().wholeText(); }
    /// Puts the cursor after a piece of the text.
    void putAfter(const char *piece) const
    {
        const qsizetype at = text().indexOf(QString::fromUtf8(piece));
        ASSERT_GE(at, 0) << piece;
        const qsizetype end = at + QString::fromUtf8(piece).size();
        window->edit().select({end, end});
    }
    void type(const char *keys) const { QTest::keyClicks(&window->edit(), QString::fromUtf8(keys)); }
    /// Chooses a command by its text without the mark of its key.
    void choose(const char *name) const
    {
        QAction *action = command(name);
        ASSERT_NE(action, nullptr) << name;
        ASSERT_TRUE(action->isEnabled()) << name << ": " << action->statusTip().toStdString();
        action->trigger();
    }
    /// The command as it is now; null where there is none.
    QAction *command(const char *name) const
    {
        window->updateCommands();
        for (QAction *menu : window->menuBar()->actions()) {
            for (QAction *action : menu->menu()->actions()) {
                if (QString(action->text()).remove(u'&') == QString::fromUtf8(name)) {
                    return action;
                }
            }
        }
        return nullptr;
    }
    QStringList remarks() const
    {
        QStringList found;
        for (int i = 0; i < window->remarks().topLevelItemCount(); ++i) {
            found.append(window->remarks().topLevelItem(i)->text(2));
        }
        return found;
    }

    Desk desk;
    CommandLineFolder folder;
    kareport::TemplateWindow *window = nullptr;
};
