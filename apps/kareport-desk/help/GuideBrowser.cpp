#include "GuideBrowser.h"

#include "DeskPreferences.h"
#include "GuidePages.h"
#include "Readable.h"
#include "Xlate.h"

#include <QImage>
#include <QLocale>
#include <QPixmap>
#include <QTextFrame>
#include <QTextTable>

namespace kareport
{

namespace
{

/// Tables get lines and room in their cells, which text with marks does not give them.
void dressTables(QTextFrame &frame, const QColor &line)
{
    for (QTextFrame *child : frame.childFrames()) {
        if (auto *table = qobject_cast<QTextTable *>(child)) {
            QTextTableFormat format = table->format();
            format.setBorder(1);
            format.setBorderStyle(QTextFrameFormat::BorderStyle_Solid);
            format.setBorderCollapse(true);
            format.setBorderBrush(line);
            format.setCellPadding(4);
            table->setFormat(format);
        }
        dressTables(*child, line);
    }
}

} // namespace

QString guideLanguage()
{
    const QString chosen = loadPreferences().language;
    return chosen.isEmpty() ? QLocale::system().name() : chosen;
}

GuideBrowser::GuideBrowser(QWidget *parent) : QTextBrowser(parent)
{
    setOpenExternalLinks(true);
    setAccessibleName(Xlate("Guide"));
    constexpr qreal room = 16;
    document()->setDocumentMargin(room);
    connect(this, &QTextBrowser::sourceChanged, this, &GuideBrowser::dress);
}

QVariant GuideBrowser::loadResource(int type, const QUrl &name)
{
    const QVariant loaded = QTextBrowser::loadResource(type, name);
    if (type != QTextDocument::ImageResource || name.scheme() != u"qrc") {
        return loaded;
    }
    // A picture is not wider than the page. One of a kind that cannot be drawn here leaves no mark.
    const QImage picture(u':' + name.path());
    if (picture.isNull()) {
        return QPixmap(1, 1);
    }
    const int room = viewport()->width() - qRound(2 * document()->documentMargin()) - 8;
    return picture.width() > room && room > 0 ? QVariant(picture.scaledToWidth(room, Qt::SmoothTransformation))
                                              : QVariant(picture);
}

void GuideBrowser::doSetSource(const QUrl &name, QTextDocument::ResourceType type)
{
    if (!name.fileName().endsWith(u".md") || (!name.scheme().isEmpty() && name.scheme() != u"qrc")) {
        QTextBrowser::doSetSource(name, type);
        return;
    }
    // Links name pages by where they are among the sources.
    const QString file = guideFile(name.fileName(), guideLanguage());
    if (!file.isEmpty()) {
        QUrl page(QStringLiteral("qrc") + file);
        page.setFragment(name.fragment());
        QTextBrowser::doSetSource(page, QTextDocument::MarkdownResource);
    }
}

void GuideBrowser::dress(const QUrl &name)
{
    nameHeadings(*document());
    dressTables(*document()->rootFrame(), quietColor(palette(), QPalette::Base));
    if (name.hasFragment()) {
        scrollToAnchor(name.fragment());
    }
}

} // namespace kareport
