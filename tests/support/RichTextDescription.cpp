#include "RichTextDescription.h"

namespace richtext
{

QString number(double value)
{
    return QString::number(value, 'g', 6);
}

QString charactersOf(const QTextCharFormat &format)
{
    QStringList words;
    words += format.fontFamilies().toStringList();
    const auto add = [&words](bool isSet, const QString &word) {
        if (isSet) {
            words += word;
        }
    };
    add(format.fontPointSize() != 12, number(format.fontPointSize()) + QStringLiteral("pt"));
    add(format.fontWeight() == QFont::Bold, QStringLiteral("b"));
    add(format.fontItalic(), QStringLiteral("i"));
    add(format.fontStrikeOut(), QStringLiteral("s"));
    add(format.underlineStyle() == QTextCharFormat::SingleUnderline, QStringLiteral("u"));
    add(format.underlineStyle() > QTextCharFormat::SingleUnderline,
        QStringLiteral("u%1").arg(int(format.underlineStyle())));
    add(format.fontCapitalization() == QFont::AllUppercase, QStringLiteral("caps"));
    add(format.fontCapitalization() == QFont::SmallCaps, QStringLiteral("scaps"));
    add(format.verticalAlignment() == QTextCharFormat::AlignSuperScript, QStringLiteral("super"));
    add(format.verticalAlignment() == QTextCharFormat::AlignSubScript, QStringLiteral("sub"));
    add(format.foreground().style() != Qt::NoBrush, format.foreground().color().name());
    add(format.background().style() != Qt::NoBrush, QStringLiteral("on ") + format.background().color().name());
    add(format.hasProperty(QTextFormat::FontStyleHint), QStringLiteral("kind%1").arg(int(format.fontStyleHint())));
    return words.join(u' ');
}

QString paragraphOf(const QTextBlockFormat &format)
{
    QStringList words;
    const auto add = [&words](bool isSet, const QString &word) {
        if (isSet) {
            words += word;
        }
    };
    const auto measure = [&](const char *name, double value) {
        add(value != 0, QLatin1StringView(name) + number(value));
    };
    add(format.alignment() == Qt::AlignRight, QStringLiteral("right"));
    add(format.alignment() == Qt::AlignHCenter, QStringLiteral("centre"));
    add(format.alignment() == Qt::AlignJustify, QStringLiteral("justify"));
    add(format.layoutDirection() == Qt::RightToLeft, QStringLiteral("rtl"));
    measure("l", format.leftMargin());
    measure("r", format.rightMargin());
    measure("f", format.textIndent());
    measure("t", format.topMargin());
    measure("b", format.bottomMargin());
    add(format.lineHeightType() != QTextBlockFormat::SingleHeight,
        QStringLiteral("h%1:%2").arg(format.lineHeightType()).arg(number(format.lineHeight())));
    for (const QTextOption::Tab &tab : format.tabPositions()) {
        words += QStringLiteral("tab%1:%2").arg(int(tab.type)).arg(number(tab.position));
    }
    add(format.background().style() != Qt::NoBrush, QStringLiteral("on ") + format.background().color().name());
    add(format.pageBreakPolicy() == QTextFormat::PageBreak_AlwaysBefore, QStringLiteral("page"));
    return words.join(u' ');
}

QString described(const QTextDocument &document)
{
    QStringList paragraphs;
    for (QTextBlock block = document.begin(); block.isValid(); block = block.next()) {
        const QString format = paragraphOf(block.blockFormat());
        QString text = format.isEmpty() ? QString() : u'[' + format + u']';
        QString last;
        for (auto at = block.begin(); !at.atEnd(); ++at) {
            const QString characters = charactersOf(at.fragment().charFormat());
            if (characters != last) {
                text += u'<' + characters + u'>';
                last = characters;
            }
            text += at.fragment().text();
        }
        paragraphs += text;
    }
    return paragraphs.join(u'|');
}

QString shown(QByteArrayView bytes, kareport::RichTextNotes *notes)
{
    QTextDocument document;
    const auto error = kareport::readRichText(bytes, document, notes);
    EXPECT_FALSE(error) << bytes.data() << "\n" << (error ? error->text.toStdString() : std::string());
    return described(document);
}

QString body(const QByteArray &bytes, kareport::RichTextNotes *notes)
{
    return shown("{\\rtf1 " + bytes + "}", notes);
}

} // namespace richtext
