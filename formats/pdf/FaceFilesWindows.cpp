#include "FaceFiles.h"

#include <QCoreApplication>
#include <QDateTime>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QSettings>

#include <windows.h>

#include <fontconfig/fcfreetype.h>
#include <hpdf_doc.h>
#include <hpdf_fontdef.h>
#include <knownfolders.h>
#include <shlobj.h>

#include <map>
#include <memory>
#include <mutex>
#include <vector>

// The libraries open files by names in the system's code page, which lacks most letters: faces are read by Qt, and given to
// them in memory. fontconfig would look into every font of the system, for seconds, and keeps a file of what it found; so it
// is only asked about files that can be meant.

namespace kareport
{

namespace
{

using PatternOwner = std::shared_ptr<FcPattern>;

QByteArray contentOf(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

/// What the faces of a file are; the number of them is known with the first one.
std::vector<PatternOwner> describeFaces(const QString &file)
{
    std::vector<PatternOwner> faces;
    FT_Library library = nullptr;
    if (FT_Init_FreeType(&library) != 0) {
        return faces;
    }
    QByteArray bytes;
    FT_Long count = 1;
    for (FT_Long index = 0; index < count; ++index) {
        FT_Face face = openFaceFile(library, file, static_cast<unsigned>(index), bytes);
        if (face == nullptr) {
            break;
        }
        count = face->num_faces;
        const QByteArray name = file.toUtf8();
        FcPattern *pattern = FcFreeTypeQueryFace(face, reinterpret_cast<const FcChar8 *>(name.constData()),
                                                 static_cast<unsigned>(index), nullptr);
        if (pattern != nullptr) {
            faces.emplace_back(pattern, &FcPatternDestroy);
        }
        FT_Done_Face(face);
    }
    FT_Done_FreeType(library);
    return faces;
}

/// The faces of the files that were asked for, each until it is changed.
class DescribedFiles
{
public:
    std::vector<PatternOwner> facesOf(const QString &path)
    {
        const std::lock_guard held(lock_);
        const QFileInfo info(path);
        Described &described = files_[path];
        if (described.size != info.size() || described.changed != info.lastModified()) {
            described = {info.size(), info.lastModified(), describeFaces(path)};
        }
        return described.faces;
    }

private:
    struct Described
    {
        qint64 size = -1;
        QDateTime changed;
        std::vector<PatternOwner> faces;
    };
    std::mutex lock_;
    std::map<QString, Described> files_;
};

DescribedFiles &describedFiles()
{
    static DescribedFiles files;
    return files;
}

QString shippedFolder()
{
    return QCoreApplication::applicationDirPath() + QStringLiteral("/fonts");
}

QString knownFolder(REFKNOWNFOLDERID id)
{
    PWSTR path = nullptr;
    const HRESULT result = SHGetKnownFolderPath(id, KF_FLAG_DEFAULT, nullptr, &path);
    QString folder = SUCCEEDED(result) ? QDir::fromNativeSeparators(QString::fromWCharArray(path)) : QString();
    CoTaskMemFree(path);
    return folder;
}

/// The files that may hold a family: those that come with the program, and those that are registered under its name.
QStringList filesOfFamily(const QString &family)
{
    QStringList files;
    const QDir shipped(shippedFolder());
    for (const QString &file : shipped.entryList({QStringLiteral("*.ttf"), QStringLiteral("*.ttc")}, QDir::Files)) {
        files.append(shipped.filePath(file));
    }
    const QDir folder(knownFolder(FOLDERID_Fonts));
    for (const auto *root : {"HKEY_LOCAL_MACHINE", "HKEY_CURRENT_USER"}) {
        const QSettings registry(QString::fromLatin1(root) +
                                     QStringLiteral("\\SOFTWARE\\Microsoft\\Windows NT\\CurrentVersion\\Fonts"),
                                 QSettings::NativeFormat);
        for (const QString &name : registry.allKeys()) {
            const QString file = QDir::fromNativeSeparators(registry.value(name).toString());
            if (name.contains(family, Qt::CaseInsensitive) && !file.isEmpty()) {
                files.append(folder.filePath(file)); // one with a folder stays as it is
            }
        }
    }
    return files;
}

bool hasText(const FcPattern *pattern, const char *object, const char *text)
{
    FcChar8 *value = nullptr;
    for (int i = 0; FcPatternGetString(pattern, object, i, &value) == FcResultMatch; ++i) {
        if (FcStrCmpIgnoreCase(value, reinterpret_cast<const FcChar8 *>(text)) == 0) {
            return true;
        }
    }
    return false;
}

bool isUpright(const FcPattern *pattern)
{
    int slant = FC_SLANT_ITALIC;
    return FcPatternGetInteger(pattern, FC_SLANT, 0, &slant) == FcResultMatch && slant == FC_SLANT_ROMAN;
}

HPDF_Stream streamOf(HPDF_Doc document, const QByteArray &bytes)
{
    const auto size = static_cast<HPDF_UINT>(bytes.size());
    HPDF_Stream stream = bytes.isEmpty() ? nullptr : HPDF_MemStream_New(document->mmgr, size);
    if (stream != nullptr &&
        HPDF_Stream_Write(stream, reinterpret_cast<const HPDF_BYTE *>(bytes.constData()), size) != HPDF_OK)
    {
        HPDF_Stream_Free(stream);
        return nullptr;
    }
    return stream;
}

} // namespace

QStringList systemFontFolders()
{
    QStringList folders;
    folders.append(knownFolder(FOLDERID_Fonts));
    folders.append(knownFolder(FOLDERID_LocalAppData) + QStringLiteral("/Microsoft/Windows/Fonts"));
    folders.append(shippedFolder());
    return folders;
}

FcFontSet *facesOfFamily(const char *family)
{
    FcFontSet *found = FcFontSetCreate();
    for (const QString &file : filesOfFamily(QString::fromUtf8(family))) {
        for (const PatternOwner &face : describedFiles().facesOf(file)) {
            if (isUpright(face.get()) && hasText(face.get(), FC_FAMILY, family) &&
                hasText(face.get(), FC_FONTFORMAT, "TrueType")) {
                FcPatternReference(face.get());
                FcFontSetAdd(found, face.get());
            }
        }
    }
    return found;
}

FcPattern *describeFace(const QString &file, unsigned index)
{
    for (const PatternOwner &face : describedFiles().facesOf(file)) {
        int own = 0;
        if (FcPatternGetInteger(face.get(), FC_INDEX, 0, &own) == FcResultMatch && static_cast<unsigned>(own) == index)
        {
            FcPatternReference(face.get());
            return face.get();
        }
    }
    return nullptr;
}

FT_Face openFaceFile(FT_Library library, const QString &file, unsigned index, QByteArray &bytes)
{
    FT_Face face = nullptr;
    bytes = bytes.isEmpty() ? contentOf(file) : bytes;
    const FT_Error error = FT_New_Memory_Face(library, reinterpret_cast<const FT_Byte *>(bytes.constData()),
                                              static_cast<FT_Long>(bytes.size()), static_cast<FT_Long>(index), &face);
    return error == 0 ? face : nullptr;
}

// As the library's own HPDF_LoadTTFontFromFile, but for where the bytes come from.
const char *embedFaceFile(HPDF_Doc document, const PdfFace &face)
{
    HPDF_Stream stream = streamOf(document, contentOf(face.file()));
    if (stream == nullptr) {
        return nullptr;
    }
    HPDF_FontDef definition = face.isCollection()
                                  ? HPDF_TTFontDef_Load2(document->mmgr, stream, face.index(), HPDF_TRUE)
                                  : HPDF_TTFontDef_Load(document->mmgr, stream, HPDF_TRUE);
    if (definition == nullptr) {
        return nullptr;
    }
    if (HPDF_FontDef known = HPDF_Doc_FindFontDef(document, definition->base_font)) {
        HPDF_FontDef_Free(definition);
        return known->base_font;
    }
    if (HPDF_List_Add(document->fontdef_list, definition) != HPDF_OK) {
        HPDF_FontDef_Free(definition);
        return nullptr;
    }
    countFaceTag(document->ttfont_tag);
    HPDF_TTFontDef_SetTagName(definition, reinterpret_cast<char *>(document->ttfont_tag));
    return definition->base_font;
}

} // namespace kareport
