#include "FilePlace.h"

#include "FileKind.h"
#include "LandXmlContents.h"
#include "OpenTemplate.h"
#include "PlainWidgets.h"
#include "Xlate.h"

#include <QDialog>
#include <QDialogButtonBox>
#include <QFile>
#include <QFileInfo>
#include <QFontDatabase>
#include <QLabel>
#include <QPlainTextEdit>
#include <QTextBlock>
#include <QVBoxLayout>

#include <algorithm>

namespace kareport
{

namespace
{

constexpr qsizetype linesBefore = 500;
constexpr qsizetype linesAfter = 500;
constexpr qsizetype longestShown = 10'000; ///< bytes of a line

const QString filePlaceName = QStringLiteral("filePlace");

/// Whether a file is a template, and no data of that ending.
bool isTemplate(const QString &path)
{
    const auto file = fileKindOf(path) == FileKind::Template ? FileBytes::open(path) : InputError();
    const auto *opened = std::get_if<std::shared_ptr<const FileBytes>>(&file);
    return opened != nullptr && !isLandXml(*opened);
}

/// A window of lines with their numbers, of which one is marked.
class FilePlaceDialog : public QDialog
{
public:
    FilePlaceDialog(QWidget *parent, const QString &path, const FileLines &read, const TextPlace &place)
        : QDialog(parent)
    {
        setAttribute(Qt::WA_DeleteOnClose);
        setObjectName(filePlaceName);
        setWindowTitle(Xlate("%1, line %2").arg(QFileInfo(path).fileName()).arg(place.line));
        auto *name = plainLabel(path);
        name->setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
        auto *text = new QPlainTextEdit;
        text->setReadOnly(true);
        text->setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
        text->setLineWrapMode(QPlainTextEdit::NoWrap);
        text->setFont(QFontDatabase::systemFont(QFontDatabase::FixedFont));
        text->setAccessibleName(Xlate("Lines of the file"));
        const auto width = QString::number(read.first + read.lines.size()).size();
        QStringList numbered;
        for (qsizetype i = 0; i < read.lines.size(); ++i) {
            numbered.append(QString::number(read.first + i).rightJustified(width) + QStringLiteral("  ") +
                            read.lines[i]);
        }
        text->setPlainText(numbered.join(u'\n'));
        auto *buttons = new QDialogButtonBox(QDialogButtonBox::Close);
        connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::close);
        auto *layout = new QVBoxLayout(this);
        layout->addWidget(name);
        layout->addWidget(text, 1);
        layout->addWidget(buttons);
        constexpr QSize usualSize(760, 420);
        resize(usualSize);
        mark(*text, static_cast<int>(place.line - read.first), static_cast<int>(width + 2 + place.column - 1));
    }

private:
    static void mark(QPlainTextEdit &text, int line, int column)
    {
        const QTextBlock block = text.document()->findBlockByNumber(line);
        QTextCursor cursor(block);
        QTextEdit::ExtraSelection marked;
        marked.cursor = cursor;
        marked.format.setBackground(text.palette().alternateBase());
        marked.format.setProperty(QTextFormat::FullWidthSelection, true);
        QList<QTextEdit::ExtraSelection> all;
        all.append(marked);
        text.setExtraSelections(all);
        cursor.setPosition(block.position() + std::min(column, block.length() - 1));
        cursor.movePosition(QTextCursor::EndOfWord, QTextCursor::KeepAnchor);
        text.setTextCursor(cursor);
        text.centerCursor();
        text.setFocus(Qt::OtherFocusReason);
    }
};

} // namespace

bool readLinesAround(const QString &path, qsizetype line, FileLines &read)
{
    QFile file(path);
    if (line < 1 || !QFileInfo(path).isFile() || !file.open(QIODevice::ReadOnly)) {
        return false;
    }
    read = FileLines();
    read.first = std::max<qsizetype>(1, line - linesBefore);
    qsizetype number = 1; // of the line that comes next
    bool isBegun = false; // it is the rest of one that is longer than what is shown of it
    while (!file.atEnd() && number <= line + linesAfter) {
        QByteArray bytes = file.readLine(longestShown);
        const bool isEnded = bytes.endsWith('\n');
        if (number >= read.first && !isBegun) {
            while (bytes.endsWith('\n') || bytes.endsWith('\r')) {
                bytes.chop(1);
            }
            read.lines.append(QString::fromUtf8(bytes));
        }
        isBegun = !isEnded;
        number += isEnded ? 1 : 0;
    }
    read.isWhole = file.atEnd();
    return read.first + read.lines.size() > line;
}

bool showFilePlace(QWidget *parent, const QString &path, const TextPlace &place)
{
    FileLines read;
    if (!readLinesAround(path, place.line, read)) {
        return false;
    }
    if (isTemplate(path)) {
        return openTemplateAt(path, place.line, place.column);
    }
    // It replaces the one before: a double click asks twice.
    for (QDialog *before : parent->findChildren<QDialog *>(filePlaceName)) {
        before->close();
    }
    auto *dialog = new FilePlaceDialog(parent, path, read, place);
    dialog->show();
    return true;
}

} // namespace kareport
