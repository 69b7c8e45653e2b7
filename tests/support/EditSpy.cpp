#include "EditSpy.h"

EditSpy::EditSpy(kareport::ReportEdit &edit) : edit_(edit), before_(edit.toPlainText())
{
    connection_ = QObject::connect(edit.document(), &QTextDocument::contentsChange,
                                   [this](int position, int removed, int added) { see(position, removed, added); });
}

void EditSpy::see(int position, int removed, int added)
{
    const QString after = edit_.toPlainText();
    // The end of the text is counted with an edit that touches it.
    const int over = std::max(0, position + added - static_cast<int>(after.size()));
    qsizetype at = position;
    qsizetype gone = removed - over;
    qsizetype put = added - over;
    if (gone < 0 || before_.size() - gone + put != after.size()) {
        at = 0;
        gone = before_.size();
        put = after.size();
    }
    const auto inDocument = [](QString text) { return text.replace(u'\n', QStringLiteral("\r\n")); };
    if (gone > 0 || put > 0) {
        edits.push_back({inDocument(before_.first(at)).size(), inDocument(before_.sliced(at, gone)).size(),
                         inDocument(after.sliced(at, put))});
    }
    before_ = after;
}
