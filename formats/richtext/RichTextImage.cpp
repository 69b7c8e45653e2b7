#include "RichTextImage.h"

#include "MemoryLasts.h"

#include <algorithm>
#include <cstddef>
#include <iterator>
#include <utility>

namespace kareport
{

namespace
{

/// What comes before and after a text of each style. The face is that of the document's font table.
constexpr struct
{
    QStringView before;
    QStringView after;
} styles[] = {{u"\\viewkind4\\uc1\\pard\\f1\\fs18 ", u" "},
              {u"\\viewkind4\\uc1\\pard\\b\\f1\\fs18 ", u"\\b0 "},
              {u"\\viewkind4\\uc1\\pard\\ul\\f1\\fs18 ", u"\\ulnone "},
              {u"\\viewkind4\\uc1\\pard\\ul\\b\\f1\\fs18 ", u"\\ulnone\\b0 "}};

} // namespace

bool RichTextImage::cutToParagraph(QString &document)
{
    const qsizetype begin = document.indexOf(u"\\viewkind");
    if (begin < 1) {
        return false;
    }
    const qsizetype end = document.indexOf(u'}', begin);
    if (end <= begin) {
        return false;
    }
    document = document.sliced(begin, end - begin);
    return true;
}

QString RichTextImage::fontTable(const QString &fontName, unsigned fontSize)
{
    return QStringLiteral("{\\fonttbl{\\f") + QString::number(fontSize) + QStringLiteral("\\fnil\\fcharset0 ") +
           fontName + QStringLiteral(";}}");
}

void RichTextImage::setOn(bool on)
{
    if (on) {
        decltype(templates_) made; // all of them or none
        static_assert(std::size(styles) == std::tuple_size_v<decltype(made)>, "each style has a template");
        std::transform(std::begin(styles), std::end(styles), made.begin(), [](const auto &style) {
            return ParagraphTemplate{style.before.toString(), style.after.toString()};
        });
        templates_ = std::move(made);
    }
    on_ = on;
}

bool RichTextImage::write(QStringView text, int style, Form form)
{
    const qsizetype before = pieces_.size();
    if (!on_ || doneWhileMemoryLasts([&] { add(text, style, form); })) {
        return true;
    }
    if (pieces_.size() != before) {
        pieces_.truncate(before); // half of a paragraph would spoil all others
    }
    return false;
}

void RichTextImage::add(QStringView text, int style, Form form)
{
    if (form == Form::BareText) {
        pieces_ += text;
        return;
    }
    if (text.isEmpty()) {
        pieces_ += u"\\par";
        return;
    }
    if (style < 0 || style >= int(templates_.size())) {
        return;
    }
    const ParagraphTemplate &paragraph = templates_[static_cast<std::size_t>(style)];
    pieces_ += paragraph.before;
    pieces_ += text;
    pieces_ += paragraph.after;
}

QString RichTextImage::document(const QString &fontName, unsigned fontSize, Form form) const
{
    if (form == Form::BareText) {
        return pieces_;
    }
    const QString head =
        QStringLiteral("{\\rtf1\\ansi\\ansicpg1252\\deff0\\deflang1033") + fontTable(fontName, fontSize);
    QString document;
    document.reserve(head.size() + pieces_.size() + 1);
    document += head;
    document += pieces_;
    document += u'}';
    return document;
}

} // namespace kareport
