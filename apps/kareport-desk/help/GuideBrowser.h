#pragma once

#include <QString>
#include <QTextBrowser>

namespace kareport
{

/// The language that the guides are to be in.
QString guideLanguage();

/// Shows a page of the guides. Links lead to other pages and to headings; pictures are those of the guides.
class GuideBrowser : public QTextBrowser
{
public:
    explicit GuideBrowser(QWidget *parent = nullptr);

    QVariant loadResource(int type, const QUrl &name) override;

protected:
    void doSetSource(const QUrl &name, QTextDocument::ResourceType type) override;

private:
    /// Gives a page that was just loaded, also by going back, what its text does not have: names of headings, lines of tables.
    void dress(const QUrl &name);
};

} // namespace kareport
