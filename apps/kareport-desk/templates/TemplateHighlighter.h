#pragma once

#include <QSyntaxHighlighter>
#include <QTextCharFormat>

class QPalette;

namespace kareport
{

/// Colours the elements of a template: those that templates have, those that they do not have, comments, and values with a
/// fixed set of words.
class TemplateHighlighter : public QSyntaxHighlighter
{
public:
    explicit TemplateHighlighter(QTextDocument *document, const QPalette &palette);

    /// Takes the colours that are readable on a background.
    void setColours(const QPalette &palette);

protected:
    void highlightBlock(const QString &text) override;

private:
    void colourTag(const QString &text, int begin, int end);

    QTextCharFormat tag_;
    QTextCharFormat unknown_;
    QTextCharFormat comment_;
    QTextCharFormat word_;
};

/// Whether a window is light on dark.
bool isDark(const QPalette &palette);

} // namespace kareport
