#include "FileData.h"

#include <QFileInfo>

namespace kareport
{

Expected<std::unique_ptr<RowList>> FileData::open(const DataRequest &request) const
{
    const auto bytes = request.files.open(file_);
    if (const InputError *error = errorOf(bytes)) {
        return request.errorAt(key_, unreadableData(file_, error->text));
    }
    const auto &opened = std::get<std::shared_ptr<const FileBytes>>(bytes);
    return rowsOf(opened, request, request.beginReading(QFileInfo(file_).fileName(), opened->view().size()));
}

} // namespace kareport
