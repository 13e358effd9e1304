// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Writes a page that opens in any browser, with the engine inside and a family if one is named. The family goes in
// as a GEDCOM text of its own making, so that nothing is in the page that the page does not show.

#include <cli/Commands.h>

#include <cstddef>
#include <string>
#include <utility>
#include <vector>

#include <olvane/charts/MapIndex.h>
#include <olvane/gedcom/GedcomReader.h>
#include <olvane/gedcom/GedcomWriter.h>
#include <olvane/source/GedcomKin.h>
#include <olvane/source/GedcomLabels.h>

#include <cli/FileReading.h>
#include <cli/FocusChoice.h>
#include <cli/MediaFiles.h>
#include <cli/Messages.h>
#include <cli/OutputFile.h>
#include <cli/PageFamily.h>
#include <cli/PageTemplate.h>
#include <cli/TerminalProgress.h>
#include <cli/UsageError.h>

namespace olvane::cli {

namespace {

// A browser holds a page and what is unpacked from it several times over.
constexpr std::size_t kMostBytes = std::size_t{64} << 20;
// People do not open a page with more than this in it; a program reads the file itself.
constexpr std::size_t kMostPersons = 200000;
// Larger pages are slow to send and to open, so the message says it to the person who writes one.
constexpr std::size_t kLargePage = std::size_t{20} << 20;
constexpr std::size_t kNamedFiles = 5;

// A map is opened with as many, whose records a page need not hold.
constexpr std::size_t kMostPersonsOfMap = 2000000;

bool fitsAsText(const gedcom::GedcomData& data, std::size_t bytes) {
    return data.personCount() <= kMostPersons && bytes <= kMostBytes;
}

void refuseTooLarge(const gedcom::GedcomData& data, std::size_t bytes) {
    if (fitsAsText(data, bytes)) return;
    throw UsageError(
        data.file() + ": " + std::to_string(data.personCount()) + " persons and " +
        std::to_string(bytes >> 20) +
        " MiB are more than a page can hold, which is 200,000 persons and 64 MiB; take a part of the "
        "family, draw pictures, or write a map with --map");
}

void refuseTooManyForMap(const gedcom::GedcomData& data) {
    if (data.personCount() <= kMostPersonsOfMap) return;
    throw UsageError(data.file() + ": " + std::to_string(data.personCount()) +
                     " persons are more than a map can hold, which is 2,000,000");
}

std::string mapOf(const gedcom::GedcomData& data) {
    TerminalProgress progress;
    return charts::writeMapIndex(
        charts::mapIndexOf(gedcom::kinGraphOf(data), gedcom::captionsOf(data), progress.ofChart()));
}

// The map of what the text says. Where somebody is hidden it is made of that text itself, so that it cannot know more.
std::string mapOf(const gedcom::GedcomData& data, const PageFamily& family) {
    refuseTooManyForMap(data);
    return family.livingHidden ? mapOf(gedcom::readGedcomBytes(family.gedcom, family.name, {})) : mapOf(data);
}

// The name that the page knows the file by. A file is often named after somebody, so with anybody hidden, as without
// a name, it has a common one.
std::string fileNameOf(const PageOptions& options) {
    if (options.hiding.hideLiving || options.input.file == kStandardInput) return "family.ged";
    return options.input.file.substr(options.input.file.find_last_of('/') + 1);
}

std::string withoutEnding(const std::string& name) {
    const std::size_t dot = name.find_last_of('.');
    return dot == std::string::npos || dot == 0 ? name : name.substr(0, dot);
}

// No word of any language: the page speaks its reader's own.
std::string titleOf(const gedcom::GedcomData& data, gedcom::PersonId focus, const PageFamily& family,
                    const std::vector<bool>& hidden) {
    std::string fileTitle = withoutEnding(family.name);
    if (focus == 0 || (!hidden.empty() && hidden[focus - 1])) return fileTitle;
    const std::string name = readableName(data, focus);
    return name.empty() ? fileTitle : name;
}

// By what the page finds the person again: the text is read there, and its persons are those of the data.
std::string focusOf(gedcom::PersonId focus) {
    return focus == 0 ? "" : std::to_string(focus);
}

void reportPhotos(const PageOptions& options, const PagePhotos& photos) {
    const std::size_t count = photos.missing.size();
    if (count == 0) return;
    std::string text = options.input.file + ": " + std::to_string(photos.photos.size()) +
                       " photographs are in the page; " + std::to_string(count) +
                       " media files are not, since they are not beside the file, or are no photographs: ";
    for (std::size_t i = 0; i < count && i < kNamedFiles; ++i) {
        text += (i == 0 ? "" : ", ") + photos.missing[i];
    }
    printMessage(count > kNamedFiles ? text + " and others" : text);
}

// Of the text that the page gets, so that no photograph of anybody else is in it.
std::vector<PagePhoto> photosOf(const std::string& text, const gedcom::GedcomData& whole,
                                const std::vector<bool>& hidden, const PageOptions& options) {
    if (options.photoSize == 0) return {};
    gedcom::ReadOptions reading;
    reading.details = true;
    const gedcom::GedcomData written = gedcom::readGedcomBytes(text, options.input.file, reading);
    PagePhotos photos =
        photosOfPage(written, whole, hidden, MediaFiles(options.input.file), options.photoSize);
    reportPhotos(options, photos);
    return std::move(photos.photos);
}

// status becomes that of the reading.
PageFamily familyOf(const PageOptions& options, int& status) {
    const gedcom::GedcomData data = readFileWithDetails(options.input);
    status = statusOfReading(data);
    gedcom::WriteOptions hiding;
    hiding.hidden = hiddenPersons(data, options.hiding);
    hiding.notes = hiding.sources = options.notes;
    hiding.media = options.media;
    const gedcom::PersonId focus = options.focus.empty() ? 0 : chooseFocus(data, options.focus);
    PageFamily family;
    family.gedcom = gedcom::writeGedcom(data, hiding);
    if (!options.map) refuseTooLarge(data, family.gedcom.size());
    family.photos = photosOf(family.gedcom, data, hiding.hidden, options);
    family.name = fileNameOf(options);
    family.title = options.title.empty() ? titleOf(data, focus, family, hiding.hidden) : options.title;
    family.focus = focusOf(focus);
    family.address = options.address;
    if (focus != 0) family.address += "&number=" + std::to_string(focus);
    if (!options.request.to.empty()) {
        family.address += "&to=" + std::to_string(chooseFocus(data, options.request.to));
    }
    family.livingHidden = options.hiding.hideLiving;
    if (options.map) {
        family.map = mapOf(data, family);
        if (!fitsAsText(data, family.gedcom.size())) family.gedcom.clear();
    }
    // They quote the file, and so may name whom the page does not.
    if (!options.hiding.hideLiving) family.remarks = data.diagnostics();
    return family;
}

}  // namespace

int runPage(const PageOptions& options) {
    if (pageTemplate().empty()) {
        throw UsageError(
            "this olvane was built without the page; install emscripten, nodejs and npm, and build it again");
    }
    const OutputRules rules{InputFiles({options.input.file}), {".html", ".htm"}};
    checkOutput(options.output, rules);
    int status = 0;
    if (options.input.file.empty()) {
        writeOutput(options.output, pageTemplate(), rules);
    } else {
        const std::string page = pageWith(pageTemplate(), familyOf(options, status));
        if (page.size() > kLargePage)
            printMessage(options.output + ": the page has " + std::to_string(page.size() >> 20) + " MiB");
        writeOutput(options.output, page, rules);
    }
    return status;
}

}  // namespace olvane::cli
