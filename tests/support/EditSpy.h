#pragma once

#include "ReportEdit.h"

#include <QTextDocument>

#include <algorithm>
#include <vector>

/// An edit as the control tells of it, in the characters of the document.
struct SeenEdit
{
    qint64 at;
    qint64 removed;
    QString inserted;
};

/// Sees every edit in a control.
class EditSpy
{
public:
    explicit EditSpy(kareport::ReportEdit &edit);
    ~EditSpy() { QObject::disconnect(connection_); }
    EditSpy(const EditSpy &) = delete;
    EditSpy &operator=(const EditSpy &) = delete;

    std::vector<SeenEdit> edits;

private:
    void see(int position, int removed, int added);

    kareport::ReportEdit &edit_;
    QString before_;
    QMetaObject::Connection connection_;
};
