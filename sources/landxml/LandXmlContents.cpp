#include "LandXmlContents.h"

#include <unordered_map>

namespace kareport
{

namespace
{

/// The places of names in a list that has each once.
class NamesOnce
{
public:
    explicit NamesOnce(std::vector<LandXmlNamed> &names) : names_(names) {}

    void add(const std::string &name, std::size_t count)
    {
        const auto [known, isNew] = indexes_.try_emplace(name, names_.size());
        if (isNew) {
            names_.push_back({QString::fromStdString(name), 0});
        }
        names_[known->second].count += count;
    }

private:
    std::vector<LandXmlNamed> &names_;
    std::unordered_map<std::string, std::size_t> indexes_;
};

/// Looks at the outermost element alone.
class RootReader : public XmlHandler
{
public:
    explicit RootReader(const std::shared_ptr<const FileBytes> &file) : stream_(file, *this) {}

    bool isLandXml()
    {
        while (stream_.readSome()) {
        }
        return isLandXml_;
    }

    Interest startElement(std::string_view name, const XmlAttributes &) override
    {
        isLandXml_ = name == "LandXML";
        stream_.stop();
        return Interest::None;
    }
    void endElement() override {}
    void text(std::string_view) override {}
    void foreignElement(std::string_view) override {}
    void leftOutElements(std::string_view, std::size_t) override {}

private:
    XmlStream stream_;
    bool isLandXml_ = false;
};

void addAlignments(LandXmlContents &contents, const std::vector<LandXmlAlignment> &alignments)
{
    for (const LandXmlAlignment &alignment : alignments) {
        LandXmlContents::Alignment &found = contents.alignments.emplace_back();
        found.name = QString::fromStdString(alignment.name);
        found.elements = alignment.elements.size();
        found.sections = alignment.sections.size();
        NamesOnce gradeLines(found.gradeLines);
        for (const LandXmlGradeLine &line : alignment.gradeLines) {
            gradeLines.add(line.name, line.points.size());
        }
        NamesOnce along(found.surfacesAlong);
        for (const LandXmlHeightLine &line : alignment.surfaceLines) {
            along.add(line.name, line.points.size());
        }
        NamesOnce across(found.surfacesAcross);
        for (const LandXmlSection &section : alignment.sections) {
            for (const LandXmlSectionSurface &surface : section.surfaces) {
                across.add(surface.name, surface.points.size());
            }
        }
    }
}

} // namespace

bool isLandXml(const std::shared_ptr<const FileBytes> &file)
{
    return RootReader(file).isLandXml();
}

Expected<LandXmlContents> readLandXmlContents(const std::shared_ptr<const FileBytes> &file,
                                              const ReadProgress &progress)
{
    const auto header = readLandXmlHeader(file);
    if (const InputError *error = errorOf(header)) {
        return *error;
    }
    LandXmlContents contents;
    contents.version = std::get<LandXmlHeader>(header).version;
    LandXmlWants wants;
    wants.points = wants.surfacePoints = wants.alignments = wants.surfaceLines = wants.sections = wants.parcels = true;
    wants.isTolerant = true; // what is sound in the file can be listed
    LandXmlNotes notes(file);
    LandXmlReader reader(file, std::get<LandXmlHeader>(header).units, wants, notes);
    std::vector<std::size_t> points;
    for (bool isMore = true; isMore;) {
        isMore = reader.readSome();
        points.resize(reader.owners().size());
        for (std::size_t i = 0; i < reader.pointCount(); ++i) {
            ++points[reader.point(i).owner];
        }
        reader.dropPoints();
        isMore = isMore && (!progress || progress(reader.position()));
    }
    if (reader.error()) {
        return *reader.error();
    }
    for (std::size_t owner = 0; owner < points.size(); ++owner) {
        auto &names = reader.isSurface(owner) ? contents.surfaces : contents.groups;
        names.push_back({QString::fromStdString(reader.owners()[owner]), points[owner]});
    }
    addAlignments(contents, reader.alignments);
    for (const LandXmlParcel &parcel : reader.parcels) {
        contents.parcels.push_back({QString::fromStdString(parcel.name), parcel.elements.size()});
    }
    return contents;
}

} // namespace kareport
