#include "ViewComparison.h"

QString joined(const std::vector<qint64> &numbers)
{
    QStringList texts;
    for (const qint64 number : numbers) {
        texts += QString::number(number);
    }
    return texts.join(u' ');
}

QString shown(const std::vector<kareport::ReportPage> &pages)
{
    QStringList texts;
    for (const kareport::ReportPage &page : pages) {
        texts += QStringLiteral("%1-%2/%3").arg(page.begin).arg(page.end).arg(page.lines);
    }
    return texts.join(u' ');
}

QString brief(const QString &text)
{
    constexpr qsizetype longest = 2000;
    return text.size() <= longest ? text : text.first(longest) + QStringLiteral("... (%1 characters)").arg(text.size());
}

QString asShown(QString text)
{
    return text.replace(QStringLiteral("\r\n"), QStringLiteral("\n")).replace(u'\n', QStringLiteral("\r\n"));
}

QString wrongWithText(const UReportView &view, const QString &text)
{
    const QString expected = asShown(text);
    const QString shownText = view.GetEdit().windowText();
    const bool isRight = view.GetEdit().isLoading() ? expected.startsWith(shownText) : shownText == expected;
    return isRight ? QString() : QStringLiteral("shows \"%1\" and not \"%2\"").arg(brief(shownText), brief(expected));
}

QString wrongWithPages(UReportView &view, const QString &text, const std::vector<kareport::ReportPage> &pages)
{
    kareport::ReportViewWidget &widget = widgetOf(view);
    const int count = std::max(1, static_cast<int>(pages.size()));
    if (widget.pageCount() != count) {
        return QStringLiteral("has %1 pages and not %2").arg(widget.pageCount()).arg(count);
    }
    constexpr std::size_t mostLookedAt = 40;
    const std::size_t step = std::max<std::size_t>(1, pages.size() / mostLookedAt);
    for (std::size_t page = 0; page < pages.size(); page += step) {
        const auto line = QStringView(text).first(pages[page].begin).count(u'\n');
        const int number = static_cast<int>(page) + 1;
        widget.goToPage(number);
        const int block = view.GetEdit().textCursor().blockNumber();
        if (block != line || widget.currentPage() != number) {
            return QStringLiteral("page %1 begins in line %2 and not %3; that is page %4")
                .arg(number)
                .arg(block)
                .arg(line)
                .arg(widget.currentPage());
        }
    }
    return QString();
}
