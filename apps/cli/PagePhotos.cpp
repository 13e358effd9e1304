// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/PagePhotos.h>

#include <set>
#include <span>
#include <string_view>

#include <olvane/gedcom/GedcomDetails.h>
#include <olvane/gedcom/GedcomError.h>

#include <cli/ScaledPhoto.h>
#include <cli/UsageError.h>

namespace olvane::cli {

namespace {

using Lines = std::span<const gedcom::DetailLine>;

constexpr std::size_t kMostBytesOfFile = std::size_t{64} << 20;
constexpr std::size_t kMostBytesOfAll = std::size_t{256} << 20;

// Names of the files of a record, and of the media records that it points to.
template <class Visitor>
void visitFiles(const gedcom::GedcomData& data, Lines lines, const Visitor& visit) {
    for (const gedcom::DetailLine& line : lines) {
        if (line.tag == "FILE" && !line.value.empty()) visit(line.value);
        const gedcom::SharedRecord* const record = line.isPointer ? data.sharedByXref(line.value) : nullptr;
        if (record == nullptr || line.tag != "OBJE") continue;
        for (const gedcom::DetailLine& below : data.detailsOfShared(*record)) {
            if (below.tag == "FILE" && !below.value.empty()) visit(below.value);
        }
    }
}

std::set<std::string_view> filesOfHidden(const gedcom::GedcomData& data, const std::vector<bool>& hidden) {
    std::set<std::string_view> files;
    const auto add = [&files](std::string_view file) { files.insert(file); };
    const auto isHidden = [&hidden](gedcom::PersonId id) {
        return id != 0 && !hidden.empty() && hidden[id - 1];
    };
    for (gedcom::PersonId id = 1; id <= data.personCount(); ++id) {
        if (isHidden(id)) visitFiles(data, data.detailsOfPerson(id), add);
    }
    for (gedcom::FamilyId id = 1; id <= data.familyCount(); ++id) {
        const gedcom::Family& family = data.family(id);
        if (isHidden(family.husband) || isHidden(family.wife))
            visitFiles(data, data.detailsOfFamily(id), add);
    }
    return files;
}

class PhotoCollector {
public:
    PhotoCollector(const MediaFiles& files, int longestSide, std::set<std::string_view> leftOut)
        : files_(files), longestSide_(longestSide), seen_(std::move(leftOut)) {}

    void add(std::string_view file) {
        if (!seen_.insert(file).second || gedcom::isWebAddress(file)) return;
        const auto bytes = bytesOf(file);
        auto jpeg = bytes ? scaledPhoto(*bytes, longestSide_) : std::nullopt;
        if (!jpeg) {
            found_.missing.emplace_back(file);
            return;
        }
        size_ += jpeg->size();
        if (size_ > kMostBytesOfAll) {
            throw UsageError(
                "the photographs have more than 256 MiB, which is more than a page can hold; "
                "choose a smaller --photos");
        }
        found_.photos.push_back({std::string(file), std::move(*jpeg)});
    }

    PagePhotos take() && { return std::move(found_); }

private:
    // One damaged member of an archive is no reason to write no page.
    std::optional<std::string> bytesOf(std::string_view file) const {
        try {
            return files_.bytesOf(file, kMostBytesOfFile);
        } catch (const gedcom::GedcomError&) {
            return {};
        }
    }

    const MediaFiles& files_;
    int longestSide_;
    std::set<std::string_view> seen_;
    std::size_t size_ = 0;
    PagePhotos found_;
};

}  // namespace

PagePhotos photosOfPage(const gedcom::GedcomData& written, const gedcom::GedcomData& whole,
                        const std::vector<bool>& hidden, const MediaFiles& files, int longestSide) {
    PhotoCollector collector(files, longestSide, filesOfHidden(whole, hidden));
    const auto add = [&collector](std::string_view file) { collector.add(file); };
    for (gedcom::PersonId id = 1; id <= written.personCount(); ++id) {
        visitFiles(written, written.detailsOfPerson(id), add);
    }
    for (gedcom::FamilyId id = 1; id <= written.familyCount(); ++id) {
        visitFiles(written, written.detailsOfFamily(id), add);
    }
    return std::move(collector).take();
}

}  // namespace olvane::cli
